// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuNames.h"

#include <cstddef>
#include <iterator>

namespace {

const char *const Languages[] = {"de", "es", "fr", "it", "ja", "pl", "pt_BR", "ru", "tr", "uk", "zh_CN"};

struct Translations
{
    const char *english;
    const char *texts[std::size(Languages)]; // in the order of Languages
};

// clang-format off
const Translations Table[] = {
    {"Start Menu",
     {"Startmenü", "Menú de inicio", "Menu de démarrage", "Menu di avvio", "スタートメニュー", "Menu startowe", "Menu Iniciar", "Меню запуска", "Başlat Menüsü", "Меню запуску", "开始菜单"}},
    {"Multimedia",
     {"Multimedia", "Multimedia", "Multimédia", "Multimedia", "マルチメディア", "Multimedia", "Multimídia", "Мультимедиа", "Çoklu Ortam", "Мультимедіа", "多媒体"}},
    {"Audio",
     {"Audio", "Audio", "Audio", "Audio", "オーディオ", "Dźwięk", "Áudio", "Аудио", "Ses", "Аудіо", "音频"}},
    {"Video",
     {"Video", "Vídeo", "Vidéo", "Video", "ビデオ", "Wideo", "Vídeo", "Видео", "Video", "Відео", "视频"}},
    {"Development",
     {"Entwicklung", "Desarrollo", "Développement", "Sviluppo", "開発", "Programowanie", "Desenvolvimento", "Разработка", "Geliştirme", "Розробка", "开发"}},
    {"Education",
     {"Bildung", "Educación", "Éducation", "Istruzione", "教育", "Edukacja", "Educação", "Образование", "Eğitim", "Освіта", "教育"}},
    {"Games",
     {"Spiele", "Juegos", "Jeux", "Giochi", "ゲーム", "Gry", "Jogos", "Игры", "Oyunlar", "Ігри", "游戏"}},
    {"Graphics",
     {"Grafik", "Gráficos", "Graphisme", "Grafica", "グラフィックス", "Grafika", "Gráficos", "Графика", "Grafik", "Графіка", "图形"}},
    {"Internet",
     {"Internet", "Internet", "Internet", "Internet", "インターネット", "Internet", "Internet", "Интернет", "İnternet", "Інтернет", "互联网"}},
    {"Office",
     {"Büro", "Oficina", "Bureautique", "Ufficio", "オフィス", "Biuro", "Escritório", "Офис", "Ofis", "Офіс", "办公"}},
    {"Science",
     {"Wissenschaft", "Ciencia", "Science", "Scienza", "科学", "Nauka", "Ciência", "Наука", "Bilim", "Наука", "科学"}},
    {"Settings",
     {"Einstellungen", "Preferencias", "Paramètres", "Impostazioni", "設定", "Ustawienia", "Configurações", "Настройки", "Ayarlar", "Налаштування", "设置"}},
    {"System",
     {"System", "Sistema", "Système", "Sistema", "システム", "System", "Sistema", "Система", "Sistem", "Система", "系统"}},
    {"Utilities",
     {"Dienstprogramme", "Utilidades", "Utilitaires", "Utilità", "ユーティリティ", "Narzędzia", "Utilitários", "Утилиты", "Araçlar", "Утиліти", "实用工具"}},
    {"Other",
     {"Sonstiges", "Otros", "Autres", "Altro", "その他", "Inne", "Outros", "Прочее", "Diğer", "Інше", "其他"}},
};
// clang-format on

} // namespace

QVector<MenuName> menuNames(const QByteArray &englishName)
{
    QVector<MenuName> names;
    for (const Translations &row : Table) {
        if (englishName != row.english)
            continue;
        for (std::size_t i = 0; i < std::size(Languages); ++i)
            names.append(MenuName{Languages[i], row.texts[i]});
    }
    return names;
}

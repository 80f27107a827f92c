// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SavedKeys.h"

#include "ShortcutsModel.h"

#include <frame/QtMajor.h>

#include <QAction>
#include <QSettings>

#include <memory>
#include <vector>

namespace {

// An application with an action for each key.
class Application
{
public:
    Application(const QString &path, int count)
        : m_settings(path, QSettings::IniFormat)
        , m_model(&m_settings, QStringLiteral("Shortcuts"))
    {
        for (int i = 0; i < count; ++i) {
            m_actions.push_back(std::make_unique<QAction>());
            m_model.registerAction(QStringLiteral("%1").arg(i, 7, 10, QLatin1Char('0')),
                                   m_actions.back().get(), QStringLiteral("Group"));
        }
    }

    void setKey(int row, const QKeySequence &key)
    {
        m_model.setKeySequence(m_model.index(row, 0, m_model.index(0, 0)), key);
    }

    void save()
    {
        m_model.commitChanges();
        m_model.saveKeys(&m_settings, QStringLiteral("Shortcuts"));
        m_settings.sync();
    }

    QKeySequence keyInForce(int row) const { return m_actions[std::size_t(row)]->shortcut(); }

private:
    std::vector<std::unique_ptr<QAction>> m_actions;
    QSettings m_settings;
    ShortcutsModel m_model;
};

QString described(const QKeySequence &key)
{
    QStringList codes;
    for (int i = 0; i < key.count(); ++i)
        codes.append(QStringLiteral("0x%1").arg(uint(QtMajor::chord(key, i)), 8, 16, QLatin1Char('0')));
    return QStringLiteral("\"%1\" (%2)").arg(key.toString(), codes.join(QLatin1Char(' ')));
}

} // namespace

QStringList SavedKeys::lostOf(const QVector<QKeySequence> &keys, const QString &path)
{
    {
        Application before(path, keys.size());
        for (int i = 0; i < keys.size(); ++i)
            before.setKey(i, keys.at(i));
        before.save();
    }
    const Application after(path, keys.size());
    QStringList lost;
    for (int i = 0; i < keys.size(); ++i) {
        if (after.keyInForce(i) != keys.at(i))
            lost.append(
                QStringLiteral("%1 became %2").arg(described(keys.at(i)), described(after.keyInForce(i))));
    }
    return lost;
}

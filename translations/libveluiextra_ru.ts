<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ru" sourcelanguage="en">
<context>
    <name>ActionListEdit</name>
    <message>
        <source>Form</source>
        <translation>Форма</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
</context>
<context>
    <name>EditActionsDialog</name>
    <message>
        <source>Actions</source>
        <translation>Действия</translation>
    </message>
</context>
<context>
    <name>EditActionsWidget</name>
    <message>
        <source>Form</source>
        <translation>Форма</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Добавить...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Изменить...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Удалить</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Вверх</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Вниз</translation>
    </message>
</context>
<context>
    <name>EditShortcutsDialog</name>
    <message>
        <source>None</source>
        <translation>Нет</translation>
    </message>
    <message>
        <source>Configure shortcuts</source>
        <translation>Настройка комбинаций клавиш</translation>
    </message>
    <message>
        <source>Choose a key for selected action</source>
        <translation>Выбор клавиши для выделенного действия</translation>
    </message>
    <message>
        <source>Default key:</source>
        <translation>Клавиша по умолчанию:</translation>
    </message>
    <message>
        <source>Assign key:</source>
        <translation>Назначить клавишу:</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>Комбинация клавиш «%1» уже используется для глобального действия «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;. Please try another.</source>
        <translation>Комбинация клавиш «%1» уже используется для действия «%2». Выберите другую.</translation>
    </message>
    <message>
        <source>Shortcuts conflict</source>
        <translation>Конфликт комбинаций клавиш</translation>
    </message>
    <message>
        <source>Apply changes</source>
        <translation>Применение изменений</translation>
    </message>
    <message>
        <source>Some shortcuts have been changed. Do you want to apply changes?</source>
        <translation>Некоторые комбинации клавиш были изменены. Применить изменения?</translation>
    </message>
</context>
<context>
    <name>EditStringsDialog</name>
    <message>
        <source>Strings</source>
        <translation>Строки</translation>
    </message>
</context>
<context>
    <name>EditableListWidget</name>
    <message>
        <source>Form</source>
        <translation>Форма</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Добавить...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Изменить...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Удалить</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Вверх</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Вниз</translation>
    </message>
</context>
<context>
    <name>QFileSystemModel</name>
    <message>
        <source>%1 does not exist.</source>
        <translation>%1 не существует.</translation>
    </message>
    <message>
        <source>%1 exists and was left as it is.</source>
        <translation>%1 уже существует и не изменён.</translation>
    </message>
    <message>
        <source>%1 cannot be put into itself.</source>
        <translation>Нельзя поместить %1 в себя.</translation>
    </message>
    <message>
        <source>%1 cannot be written.</source>
        <translation>Не удалось записать %1.</translation>
    </message>
    <message>
        <source>Can&apos;t move %1: %2</source>
        <translation>Не удалось переместить %1: %2</translation>
    </message>
    <message>
        <source>Can&apos;t copy %1: %2</source>
        <translation>Не удалось скопировать %1: %2</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Внимание</translation>
    </message>
    <message>
        <source>%1 already exists. Overwrite?</source>
        <translation>%1 уже существует. Перезаписать?</translation>
    </message>
</context>
<context>
    <name>ShortcutClash</name>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;.</source>
        <translation>Комбинация клавиш «%1» уже используется для действия «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; of action &apos;%3&apos; begins with &apos;%1&apos;.</source>
        <translation>Комбинация клавиш «%2» действия «%3» начинается с «%1».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; begins with &apos;%1&apos;, the shortcut of action &apos;%3&apos;.</source>
        <translation>Комбинация клавиш «%2» начинается с «%1» — комбинации клавиш действия «%3».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; opens the menu &apos;%2&apos;.</source>
        <translation>Комбинация клавиш «%1» открывает меню «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; leads to &apos;%2&apos; in the window.</source>
        <translation>Комбинация клавиш «%1» ведёт к «%2» в окне.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is the standard shortcut for &apos;%2&apos;.</source>
        <translation>Комбинация клавиш «%1» — стандартная комбинация для «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>Комбинация клавиш «%1» уже используется для глобального действия «%2».</translation>
    </message>
    <message>
        <source>With &apos;%1&apos; as a shortcut this key cannot be typed into texts.</source>
        <translation>Если «%1» — комбинация клавиш, эту клавишу нельзя использовать для ввода текста.</translation>
    </message>
    <message>
        <source>The current keyboard layout cannot produce &apos;%1&apos;.</source>
        <translation>Текущая раскладка клавиатуры не позволяет набрать «%1».</translation>
    </message>
</context>
<context>
    <name>ShortcutScheme</name>
    <message>
        <source>The shortcuts could not be saved to %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Не удалось сохранить комбинации клавиш в %1: %2</translation>
    </message>
    <message>
        <source>The shortcuts could not be read from %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Не удалось прочитать комбинации клавиш из %1: %2</translation>
    </message>
    <message>
        <source>%1 is not a regular file.</source>
        <translation>%1 не является обычным файлом.</translation>
    </message>
    <message>
        <source>%1 is too large for a file of shortcuts.</source>
        <translation>%1 слишком велик для файла комбинаций клавиш.</translation>
    </message>
    <message>
        <source>%1 holds no shortcuts.</source>
        <translation>%1 не содержит комбинаций клавиш.</translation>
    </message>
    <message>
        <source>Unreadable shortcuts in %1 were skipped: %2</source>
        <comment>%2: their number</comment>
        <translation>Нечитаемые комбинации клавиш в %1 пропущены: %2</translation>
    </message>
</context>
<context>
    <name>ShortcutSheet</name>
    <message>
        <source>Keyboard shortcuts</source>
        <comment>title of a printed sheet</comment>
        <translation>Комбинации клавиш</translation>
    </message>
</context>
<context>
    <name>ShortcutsModel</name>
    <message>
        <source>Action</source>
        <translation>Действие</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Комбинация клавиш</translation>
    </message>
</context>
<context>
    <name>StandardKeyNames</name>
    <message>
        <source>Help</source>
        <translation>Справка</translation>
    </message>
    <message>
        <source>What&apos;s this?</source>
        <translation>Что это?</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Открыть</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Закрыть</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Сохранить</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>Сохранить как</translation>
    </message>
    <message>
        <source>New</source>
        <translation>Создать</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Удалить</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Вырезать</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Копировать</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Вставить</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Отменить действие</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Повторить действие</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Назад</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Вперёд</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Обновить</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Увеличить</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Уменьшить</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Печать</translation>
    </message>
    <message>
        <source>New tab</source>
        <translation>Новая вкладка</translation>
    </message>
    <message>
        <source>Next tab</source>
        <translation>Следующая вкладка</translation>
    </message>
    <message>
        <source>Previous tab</source>
        <translation>Предыдущая вкладка</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Найти</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Найти далее</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Найти предыдущее</translation>
    </message>
    <message>
        <source>Replace</source>
        <translation>Заменить</translation>
    </message>
    <message>
        <source>Select all</source>
        <translation>Выделить всё</translation>
    </message>
    <message>
        <source>Deselect</source>
        <translation>Снять выделение</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Полноэкранный режим</translation>
    </message>
    <message>
        <source>Preferences</source>
        <translation>Настройки</translation>
    </message>
    <message>
        <source>Quit</source>
        <translation>Выход</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Отмена</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Полужирный</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Курсив</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Подчёркнутый</translation>
    </message>
    <message>
        <source>Move the cursor</source>
        <translation>Переместить курсор</translation>
    </message>
    <message>
        <source>Select text</source>
        <translation>Выделить текст</translation>
    </message>
    <message>
        <source>Edit text</source>
        <translation>Изменить текст</translation>
    </message>
</context>
<context>
    <name>StringListEdit</name>
    <message>
        <source>Form</source>
        <translation>Форма</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryEditDialog</name>
    <message>
        <source>Warning</source>
        <translation>Предупреждение</translation>
    </message>
    <message>
        <source>no executable</source>
        <translation>не указан исполняемый файл</translation>
    </message>
    <message>
        <source>can&apos;t find executable</source>
        <translation>не удалось найти исполняемый файл</translation>
    </message>
    <message>
        <source>can&apos;t find try executable</source>
        <translation>не удалось найти исполняемый файл для проверки</translation>
    </message>
    <message>
        <source>can&apos;t find URL</source>
        <translation>не удалось найти URL</translation>
    </message>
    <message>
        <source>wrong/incomplete desktop entry</source>
        <translation>неверная или неполная запись рабочего стола</translation>
    </message>
    <message>
        <source>Can&apos;t save position on desktop for %1</source>
        <translation>Не удалось сохранить положение %1 на рабочем столе</translation>
    </message>
    <message>
        <source>Copy from...</source>
        <translation>Копировать из...</translation>
    </message>
    <message>
        <source>Can&apos;t load file %1</source>
        <translation>Не удалось загрузить файл %1</translation>
    </message>
    <message>
        <source>Desktop Entry Editor</source>
        <translation>Редактор записей рабочего стола</translation>
    </message>
    <message>
        <source>You create hidden desktop entry</source>
        <translation>Вы создаёте скрытую запись рабочего стола</translation>
    </message>
    <message>
        <source>Can&apos;t save file %1</source>
        <translation>Не удалось сохранить файл %1</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Справка</translation>
    </message>
    <message>
        <source>&lt;b&gt;Desktop entry&lt;/b&gt; is a multipurpose info file for installed apps, devices, etc. It can be used to build menu entries, shortcuts, etc. This dialog implements the &apos;Desktop Entry Standard&apos; of &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Desktop entry file is a text ini-like file with one main section [Desktop Entry] and possible additional sections for each action defined in the main section field &apos;Actions&apos;. All fields are text string pairs: key=value. Value can also be a semicolon separated string list.</source>
        <translation>&lt;b&gt;Запись рабочего стола&lt;/b&gt; — универсальный информационный файл для установленных приложений, устройств и т. д. С её помощью можно создавать пункты меню, ярлыки и т. д. Это диалоговое окно реализует стандарт «Desktop Entry Standard», опубликованный на &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Файл записи рабочего стола — текстовый файл, похожий на ini-файл, с одним основным разделом [Desktop Entry] и, возможно, дополнительными разделами для каждого действия, указанного в поле «Actions» основного раздела. Все поля — пары текстовых строк: ключ=значение. Значением может быть и список строк, разделённых точкой с запятой.</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryPropsWidgetPrivate</name>
    <message>
        <source>Information about the URL</source>
        <translation>Сведения об URL</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Показывать только в</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Не показывать в</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Добавить рабочую среду:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Изменить рабочую среду:</translation>
    </message>
    <message>
        <source>MIME type or file name extension:</source>
        <translation>Тип MIME или расширение имени файла:</translation>
    </message>
    <message>
        <source>MIME type</source>
        <translation>Тип MIME</translation>
    </message>
    <message>
        <source>Add MIME type</source>
        <translation>Добавление типа MIME</translation>
    </message>
    <message>
        <source>Edit MIME type</source>
        <translation>Изменение типа MIME</translation>
    </message>
    <message>
        <source>Categories</source>
        <translation>Категории</translation>
    </message>
    <message>
        <source>Add category</source>
        <translation>Добавление категории</translation>
    </message>
    <message>
        <source>Category:</source>
        <translation>Категория:</translation>
    </message>
    <message>
        <source>Edit category</source>
        <translation>Изменение категории</translation>
    </message>
    <message>
        <source>Keywords</source>
        <translation>Ключевые слова</translation>
    </message>
    <message>
        <source>Add keyword</source>
        <translation>Добавление ключевого слова</translation>
    </message>
    <message>
        <source>Keyword:</source>
        <translation>Ключевое слово:</translation>
    </message>
    <message>
        <source>Edit keyword</source>
        <translation>Изменение ключевого слова</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Действия</translation>
    </message>
    <message>
        <source>Add action</source>
        <translation>Добавление действия</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Изменение действия</translation>
    </message>
    <message>
        <source>Application</source>
        <translation>Приложение</translation>
    </message>
    <message>
        <source>Link</source>
        <translation>Ссылка</translation>
    </message>
    <message>
        <source>Directory</source>
        <translation>Папка</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Внимание</translation>
    </message>
    <message>
        <source>Desktop entry type was changed.
Some field values may be lost...
Continue?</source>
        <translation>Тип записи рабочего стола изменён.
Значения некоторых полей могут быть потеряны...
Продолжить?</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>Тип</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Имя</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Значок</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Команда</translation>
    </message>
    <message>
        <source>Terminal</source>
        <translation>Терминал</translation>
    </message>
    <message>
        <source>Path</source>
        <translation>Рабочая папка</translation>
    </message>
    <message>
        <source>Try exec</source>
        <translation>Проверочная команда</translation>
    </message>
    <message>
        <source>Url</source>
        <translation>URL</translation>
    </message>
    <message>
        <source>Generic name</source>
        <translation>Общее имя</translation>
    </message>
    <message>
        <source>Comment</source>
        <translation>Комментарий</translation>
    </message>
    <message>
        <source>No display</source>
        <translation>Не показывать</translation>
    </message>
    <message>
        <source>Hidden</source>
        <translation>Скрыт</translation>
    </message>
    <message>
        <source>Startup notify</source>
        <translation>Уведомление о запуске</translation>
    </message>
    <message>
        <source>Startup WM class</source>
        <translation>Класс окна при запуске</translation>
    </message>
    <message>
        <source>Version</source>
        <translation>Версия</translation>
    </message>
</context>
<context>
    <name>VelMenuDialog</name>
    <message>
        <source>Edit</source>
        <translation>Изменить</translation>
    </message>
    <message>
        <source>Send command to vel-wm to update
 edited menu, toolbar, etc.</source>
        <translation>Отправить vel-wm команду обновить
 изменённое меню, панель инструментов и т. д.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Предупреждение</translation>
    </message>
    <message>
        <source>Can&apos;t send command to vel-wm</source>
        <translation>Не удалось отправить команду vel-wm</translation>
    </message>
</context>
<context>
    <name>VelMenuView</name>
    <message>
        <source>Warning</source>
        <translation>Предупреждение</translation>
    </message>
    <message>
        <source>Can&apos;t start:
%1 %2</source>
        <translation>Не удалось запустить:
%1 %2</translation>
    </message>
    <message>
        <source>All previous shortcuts
will be lost. Are you sure?</source>
        <translation>Все прежние ярлыки
будут потеряны. Продолжить?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Изменить</translation>
    </message>
    <message>
        <source>New folder</source>
        <translation>Создать папку</translation>
    </message>
    <message>
        <source>New entry</source>
        <translation>Создать запись</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Удалить</translation>
    </message>
    <message>
        <source>Execute</source>
        <translation>Выполнить</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Найти</translation>
    </message>
    <message>
        <source>Find Next</source>
        <translation>Продолжить поиск</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Вырезать</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Копировать</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Вставить</translation>
    </message>
    <message>
        <source>Default menu...</source>
        <translation>Меню по умолчанию...</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Вверх</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Вниз</translation>
    </message>
    <message>
        <source>Move</source>
        <translation>Переместить</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Отмена</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Группа</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Ярлык</translation>
    </message>
    <message>
        <source>Can&apos;t edit non desktop file</source>
        <translation>Можно изменять только файлы desktop</translation>
    </message>
    <message>
        <source>Desktop Entry %1</source>
        <translation>Запись рабочего стола %1</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Внимание</translation>
    </message>
    <message>
        <source>Are you sure to delete it?</source>
        <translation>Действительно удалить?</translation>
    </message>
    <message>
        <source>Find string:</source>
        <translation>Найти строку:</translation>
    </message>
    <message>
        <source>&apos;%1&apos; not found .</source>
        <translation>«%1» не найдено.</translation>
    </message>
</context>
<context>
    <name>VelUI::ActionPropsDialog</name>
    <message>
        <source>Id</source>
        <translation>Идентификатор</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Имя</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Значок</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Команда</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Показывать только в</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Добавить рабочую среду:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Изменить рабочую среду:</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Не показывать в</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsWidget</name>
    <message>
        <source>Add action</source>
        <translation>Добавление действия</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Изменение действия</translation>
    </message>
    <message>
        <source>newAction</source>
        <comment>id of a new action</comment>
        <translation>newAction</translation>
    </message>
</context>
<context>
    <name>VelUI::EditableListWidget</name>
    <message>
        <source>Add string</source>
        <translation>Добавление строки</translation>
    </message>
    <message>
        <source>String:</source>
        <translation>Строка:</translation>
    </message>
    <message>
        <source>Edit string</source>
        <translation>Изменение строки</translation>
    </message>
</context>
<context>
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>Изменить: %1</translation>
    </message>
</context>
<context>
    <name>VelUI::PathEdit</name>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
    <message>
        <source>Choose application exec path</source>
        <translation>Выбор исполняемого файла приложения</translation>
    </message>
</context>
</TS>

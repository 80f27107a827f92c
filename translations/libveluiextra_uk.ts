<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="uk" sourcelanguage="en">
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
        <translation>Дії</translation>
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
        <translation>Додати...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Змінити...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Вилучити</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Вгору</translation>
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
        <translation>Немає</translation>
    </message>
    <message>
        <source>Configure shortcuts</source>
        <translation>Налаштування скорочень</translation>
    </message>
    <message>
        <source>Choose a key for selected action</source>
        <translation>Вибір клавіші для вибраної дії</translation>
    </message>
    <message>
        <source>Default key:</source>
        <translation>Типова клавіша:</translation>
    </message>
    <message>
        <source>Assign key:</source>
        <translation>Призначити клавішу:</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>Скорочення «%1» вже використовується для загальної дії «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;. Please try another.</source>
        <translation>Скорочення «%1» вже використовується для дії «%2». Спробуйте інше.</translation>
    </message>
    <message>
        <source>Shortcuts conflict</source>
        <translation>Конфлікт скорочень</translation>
    </message>
    <message>
        <source>Apply changes</source>
        <translation>Застосування змін</translation>
    </message>
    <message>
        <source>Some shortcuts have been changed. Do you want to apply changes?</source>
        <translation>Деякі скорочення було змінено. Застосувати зміни?</translation>
    </message>
</context>
<context>
    <name>EditStringsDialog</name>
    <message>
        <source>Strings</source>
        <translation>Рядки</translation>
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
        <translation>Додати...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Змінити...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Вилучити</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Вгору</translation>
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
        <translation>%1 не існує.</translation>
    </message>
    <message>
        <source>%1 exists and was left as it is.</source>
        <translation>%1 вже існує, його не змінено.</translation>
    </message>
    <message>
        <source>%1 cannot be put into itself.</source>
        <translation>%1 не можна помістити в себе.</translation>
    </message>
    <message>
        <source>%1 cannot be written.</source>
        <translation>Не вдалося записати %1.</translation>
    </message>
    <message>
        <source>Can&apos;t move %1: %2</source>
        <translation>Не вдалося пересунути %1: %2</translation>
    </message>
    <message>
        <source>Can&apos;t copy %1: %2</source>
        <translation>Не вдалося скопіювати %1: %2</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Увага</translation>
    </message>
    <message>
        <source>%1 already exists. Overwrite?</source>
        <translation>%1 вже існує. Перезаписати?</translation>
    </message>
</context>
<context>
    <name>ShortcutClash</name>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;.</source>
        <translation>Скорочення «%1» вже використовується для дії «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; of action &apos;%3&apos; begins with &apos;%1&apos;.</source>
        <translation>Скорочення «%2» дії «%3» починається з «%1».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; begins with &apos;%1&apos;, the shortcut of action &apos;%3&apos;.</source>
        <translation>Скорочення «%2» починається з «%1» — скорочення дії «%3».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; opens the menu &apos;%2&apos;.</source>
        <translation>Скорочення «%1» відкриває меню «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; leads to &apos;%2&apos; in the window.</source>
        <translation>Скорочення «%1» веде до «%2» у вікні.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is the standard shortcut for &apos;%2&apos;.</source>
        <translation>Скорочення «%1» є стандартним скороченням для «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>Скорочення «%1» вже використовується для загальної дії «%2».</translation>
    </message>
    <message>
        <source>With &apos;%1&apos; as a shortcut this key cannot be typed into texts.</source>
        <translation>Якщо «%1» є скороченням, цю клавішу не можна використовувати для введення тексту.</translation>
    </message>
    <message>
        <source>The current keyboard layout cannot produce &apos;%1&apos;.</source>
        <translation>Поточна розкладка клавіатури не дозволяє набрати «%1».</translation>
    </message>
</context>
<context>
    <name>ShortcutScheme</name>
    <message>
        <source>The shortcuts could not be saved to %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Не вдалося зберегти скорочення до %1: %2</translation>
    </message>
    <message>
        <source>The shortcuts could not be read from %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Не вдалося прочитати скорочення з %1: %2</translation>
    </message>
    <message>
        <source>%1 is not a regular file.</source>
        <translation>%1 не є звичайним файлом.</translation>
    </message>
    <message>
        <source>%1 is too large for a file of shortcuts.</source>
        <translation>%1 завеликий для файлу скорочень.</translation>
    </message>
    <message>
        <source>%1 holds no shortcuts.</source>
        <translation>%1 не містить скорочень.</translation>
    </message>
    <message>
        <source>Unreadable shortcuts in %1 were skipped: %2</source>
        <comment>%2: their number</comment>
        <translation>Нечитабельні скорочення в %1 пропущено: %2</translation>
    </message>
</context>
<context>
    <name>ShortcutSheet</name>
    <message>
        <source>Keyboard shortcuts</source>
        <comment>title of a printed sheet</comment>
        <translation>Клавіатурні скорочення</translation>
    </message>
</context>
<context>
    <name>ShortcutsModel</name>
    <message>
        <source>Action</source>
        <translation>Дія</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Скорочення</translation>
    </message>
</context>
<context>
    <name>StandardKeyNames</name>
    <message>
        <source>Help</source>
        <translation>Довідка</translation>
    </message>
    <message>
        <source>What&apos;s this?</source>
        <translation>Що це?</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Відкрити</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Закрити</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Зберегти</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>Зберегти як</translation>
    </message>
    <message>
        <source>New</source>
        <translation>Створити</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Вилучити</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Вирізати</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Копіювати</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Вставити</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Скасувати дію</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Повторити дію</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Назад</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Вперед</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Оновити</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Збільшити</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Зменшити</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Друк</translation>
    </message>
    <message>
        <source>New tab</source>
        <translation>Нова вкладка</translation>
    </message>
    <message>
        <source>Next tab</source>
        <translation>Наступна вкладка</translation>
    </message>
    <message>
        <source>Previous tab</source>
        <translation>Попередня вкладка</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Знайти</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Знайти далі</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Знайти попереднє</translation>
    </message>
    <message>
        <source>Replace</source>
        <translation>Замінити</translation>
    </message>
    <message>
        <source>Select all</source>
        <translation>Позначити все</translation>
    </message>
    <message>
        <source>Deselect</source>
        <translation>Зняти позначення</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Повноекранний режим</translation>
    </message>
    <message>
        <source>Preferences</source>
        <translation>Параметри</translation>
    </message>
    <message>
        <source>Quit</source>
        <translation>Вийти</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Скасувати</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Жирний</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Курсив</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Підкреслений</translation>
    </message>
    <message>
        <source>Move the cursor</source>
        <translation>Перемістити курсор</translation>
    </message>
    <message>
        <source>Select text</source>
        <translation>Позначити текст</translation>
    </message>
    <message>
        <source>Edit text</source>
        <translation>Редагувати текст</translation>
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
        <translation>Попередження</translation>
    </message>
    <message>
        <source>no executable</source>
        <translation>не вказано виконуваного файла</translation>
    </message>
    <message>
        <source>can&apos;t find executable</source>
        <translation>не вдалося знайти виконуваний файл</translation>
    </message>
    <message>
        <source>can&apos;t find try executable</source>
        <translation>не вдалося знайти виконуваний файл для перевірки</translation>
    </message>
    <message>
        <source>can&apos;t find URL</source>
        <translation>не вдалося знайти адресу URL</translation>
    </message>
    <message>
        <source>wrong/incomplete desktop entry</source>
        <translation>помилковий або неповний запис стільниці</translation>
    </message>
    <message>
        <source>Can&apos;t save position on desktop for %1</source>
        <translation>Не вдалося зберегти розташування %1 на стільниці</translation>
    </message>
    <message>
        <source>Copy from...</source>
        <translation>Копіювати з...</translation>
    </message>
    <message>
        <source>Can&apos;t load file %1</source>
        <translation>Не вдалося завантажити файл %1</translation>
    </message>
    <message>
        <source>Desktop Entry Editor</source>
        <translation>Редактор записів стільниці</translation>
    </message>
    <message>
        <source>You create hidden desktop entry</source>
        <translation>Ви створюєте прихований запис стільниці</translation>
    </message>
    <message>
        <source>Can&apos;t save file %1</source>
        <translation>Не вдалося зберегти файл %1</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Довідка</translation>
    </message>
    <message>
        <source>&lt;b&gt;Desktop entry&lt;/b&gt; is a multipurpose info file for installed apps, devices, etc. It can be used to build menu entries, shortcuts, etc. This dialog implements the &apos;Desktop Entry Standard&apos; of &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Desktop entry file is a text ini-like file with one main section [Desktop Entry] and possible additional sections for each action defined in the main section field &apos;Actions&apos;. All fields are text string pairs: key=value. Value can also be a semicolon separated string list.</source>
        <translation>&lt;b&gt;Запис стільниці&lt;/b&gt; — багатоцільовий файл відомостей про встановлені програми, пристрої тощо. Ним можна скористатися для створення пунктів меню, ярликів тощо. Це діалогове вікно реалізує стандарт «Desktop Entry Standard», оприлюднений на &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Файл запису стільниці — текстовий файл, схожий на ini-файл, з одним основним розділом [Desktop Entry] і можливими додатковими розділами для кожної дії, визначеної у полі «Actions» основного розділу. Всі поля є парами текстових рядків: ключ=значення. Значенням може бути і список рядків, відокремлених крапкою з комою.</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryPropsWidgetPrivate</name>
    <message>
        <source>Information about the URL</source>
        <translation>Відомості про адресу URL</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Показувати лише у</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Не показувати у</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Додати стільничне середовище:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Змінити стільничне середовище:</translation>
    </message>
    <message>
        <source>MIME type or file name extension:</source>
        <translation>Тип MIME або суфікс назви файла:</translation>
    </message>
    <message>
        <source>MIME type</source>
        <translation>Тип MIME</translation>
    </message>
    <message>
        <source>Add MIME type</source>
        <translation>Додавання типу MIME</translation>
    </message>
    <message>
        <source>Edit MIME type</source>
        <translation>Зміна типу MIME</translation>
    </message>
    <message>
        <source>Categories</source>
        <translation>Категорії</translation>
    </message>
    <message>
        <source>Add category</source>
        <translation>Додавання категорії</translation>
    </message>
    <message>
        <source>Category:</source>
        <translation>Категорія:</translation>
    </message>
    <message>
        <source>Edit category</source>
        <translation>Зміна категорії</translation>
    </message>
    <message>
        <source>Keywords</source>
        <translation>Ключові слова</translation>
    </message>
    <message>
        <source>Add keyword</source>
        <translation>Додавання ключового слова</translation>
    </message>
    <message>
        <source>Keyword:</source>
        <translation>Ключове слово:</translation>
    </message>
    <message>
        <source>Edit keyword</source>
        <translation>Зміна ключового слова</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Дії</translation>
    </message>
    <message>
        <source>Add action</source>
        <translation>Додавання дії</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Зміна дії</translation>
    </message>
    <message>
        <source>Application</source>
        <translation>Програма</translation>
    </message>
    <message>
        <source>Link</source>
        <translation>Посилання</translation>
    </message>
    <message>
        <source>Directory</source>
        <translation>Тека</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Увага</translation>
    </message>
    <message>
        <source>Desktop entry type was changed.
Some field values may be lost...
Continue?</source>
        <translation>Тип запису стільниці було змінено.
Значення деяких полів може бути втрачено...
Продовжити?</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>Тип</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Назва</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Піктограма</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Команда</translation>
    </message>
    <message>
        <source>Terminal</source>
        <translation>Термінал</translation>
    </message>
    <message>
        <source>Path</source>
        <translation>Робочий каталог</translation>
    </message>
    <message>
        <source>Try exec</source>
        <translation>Команда перевірки</translation>
    </message>
    <message>
        <source>Url</source>
        <translation>Адреса URL</translation>
    </message>
    <message>
        <source>Generic name</source>
        <translation>Загальна назва</translation>
    </message>
    <message>
        <source>Comment</source>
        <translation>Коментар</translation>
    </message>
    <message>
        <source>No display</source>
        <translation>Не показувати</translation>
    </message>
    <message>
        <source>Hidden</source>
        <translation>Прихований</translation>
    </message>
    <message>
        <source>Startup notify</source>
        <translation>Сповіщення про запуск</translation>
    </message>
    <message>
        <source>Startup WM class</source>
        <translation>Клас вікна під час запуску</translation>
    </message>
    <message>
        <source>Version</source>
        <translation>Версія</translation>
    </message>
</context>
<context>
    <name>VelMenuDialog</name>
    <message>
        <source>Edit</source>
        <translation>Змінити</translation>
    </message>
    <message>
        <source>Send command to vel-wm to update
 edited menu, toolbar, etc.</source>
        <translation>Надіслати vel-wm команду оновити
 змінене меню, панель інструментів тощо</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Попередження</translation>
    </message>
    <message>
        <source>Can&apos;t send command to vel-wm</source>
        <translation>Не вдалося надіслати команду vel-wm</translation>
    </message>
</context>
<context>
    <name>VelMenuView</name>
    <message>
        <source>Warning</source>
        <translation>Попередження</translation>
    </message>
    <message>
        <source>Can&apos;t start:
%1 %2</source>
        <translation>Не вдалося запустити:
%1 %2</translation>
    </message>
    <message>
        <source>All previous shortcuts
will be lost. Are you sure?</source>
        <translation>Всі попередні ярлики
буде втрачено. Ви впевнені?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Змінити</translation>
    </message>
    <message>
        <source>New folder</source>
        <translation>Нова тека</translation>
    </message>
    <message>
        <source>New entry</source>
        <translation>Новий запис</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Вилучити</translation>
    </message>
    <message>
        <source>Execute</source>
        <translation>Виконати</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Пошук</translation>
    </message>
    <message>
        <source>Find Next</source>
        <translation>Знайти далі</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Вирізати</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Копіювати</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Вставити</translation>
    </message>
    <message>
        <source>Default menu...</source>
        <translation>Типове меню...</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Вгору</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Вниз</translation>
    </message>
    <message>
        <source>Move</source>
        <translation>Пересунути</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Скасувати</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Група</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Ярлик</translation>
    </message>
    <message>
        <source>Can&apos;t edit non desktop file</source>
        <translation>Змінювати можна лише файли desktop</translation>
    </message>
    <message>
        <source>Desktop Entry %1</source>
        <translation>Запис стільниці %1</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Увага</translation>
    </message>
    <message>
        <source>Are you sure to delete it?</source>
        <translation>Справді вилучити?</translation>
    </message>
    <message>
        <source>Find string:</source>
        <translation>Шукати рядок:</translation>
    </message>
    <message>
        <source>&apos;%1&apos; not found .</source>
        <translation>«%1» не знайдено.</translation>
    </message>
</context>
<context>
    <name>VelUI::ActionPropsDialog</name>
    <message>
        <source>Id</source>
        <translation>Ідентифікатор</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Назва</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Піктограма</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Команда</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Показувати лише у</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Додати стільничне середовище:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Змінити стільничне середовище:</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Не показувати у</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsWidget</name>
    <message>
        <source>Add action</source>
        <translation>Додавання дії</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Зміна дії</translation>
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
        <translation>Додавання рядка</translation>
    </message>
    <message>
        <source>String:</source>
        <translation>Рядок:</translation>
    </message>
    <message>
        <source>Edit string</source>
        <translation>Зміна рядка</translation>
    </message>
</context>
<context>
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>Змінити: %1</translation>
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
        <translation>Вибір виконуваного файла програми</translation>
    </message>
</context>
</TS>

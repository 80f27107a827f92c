<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="uk" sourcelanguage="en">
<context>
    <name>DesktopEntryPages</name>
    <message>
        <source>&amp;Read-only</source>
        <translation>&amp;Лише читання</translation>
    </message>
    <message>
        <source>&amp;Button beside the address</source>
        <translation>&amp;Кнопка поруч з адресою</translation>
    </message>
    <message>
        <source>Information requested for %1</source>
        <translation>Запитано відомості про %1</translation>
    </message>
    <message>
        <source>Use the buttons beside the fields to edit commands, files, icons, lists and actions.</source>
        <translation>Команди і файли, піктограми, списки та дії змінюються за допомогою кнопок їхніх полів.</translation>
    </message>
    <message>
        <source>Properties form</source>
        <translation>Форма властивостей</translation>
    </message>
    <message>
        <source>Desktop entries</source>
        <translation>Записи стільниці</translation>
    </message>
    <message>
        <source>Paths, icons, lists and actions</source>
        <translation>Шляхи, піктограми, списки та дії</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Допомога в роботі</translation>
    </message>
</context>
<context>
    <name>EditorCommands</name>
    <message>
        <source>Open</source>
        <translation>Відкрити</translation>
    </message>
    <message>
        <source>Cannot read %1.</source>
        <translation>Не вдалося прочитати %1.</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Зберегти</translation>
    </message>
    <message>
        <source>Cannot write %1.</source>
        <translation>Не вдалося записати %1.</translation>
    </message>
    <message>
        <source>Go to line</source>
        <translation>Перехід до рядка</translation>
    </message>
    <message>
        <source>Line:</source>
        <translation>Рядок:</translation>
    </message>
    <message>
        <source>File</source>
        <translation>Файл</translation>
    </message>
    <message>
        <source>&amp;New</source>
        <translation>&amp;Створити</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>&amp;Відкрити...</translation>
    </message>
    <message>
        <source>&amp;Save...</source>
        <translation>З&amp;берегти...</translation>
    </message>
    <message>
        <source>Insert &amp;date</source>
        <translation>Вставити &amp;дату</translation>
    </message>
    <message>
        <source>Insert &amp;time</source>
        <translation>Вставити &amp;час</translation>
    </message>
    <message>
        <source>Insert &amp;rule</source>
        <translation>Вставити &amp;розділювач</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Зміни</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Вернути</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Повторити</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Ви&amp;різати</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Копіювати</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>Вст&amp;авити</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>Ви&amp;брати все</translation>
    </message>
    <message>
        <source>Select word</source>
        <translation>Вибрати слово</translation>
    </message>
    <message>
        <source>Select line</source>
        <translation>Вибрати рядок</translation>
    </message>
    <message>
        <source>Select paragraph</source>
        <translation>Вибрати абзац</translation>
    </message>
    <message>
        <source>Find selected a&amp;gain</source>
        <translation>Знайти вибране &amp;далі</translation>
    </message>
    <message>
        <source>Find selected backward</source>
        <translation>Знайти вибране раніше</translation>
    </message>
    <message>
        <source>Find selected word</source>
        <translation>Знайти вибране слово</translation>
    </message>
    <message>
        <source>Find selected, matching case</source>
        <translation>Знайти вибране з врахуванням регістру</translation>
    </message>
    <message>
        <source>Go to &amp;line...</source>
        <translation>Перейти до р&amp;ядка...</translation>
    </message>
    <message>
        <source>Go to start</source>
        <translation>Перейти на початок</translation>
    </message>
    <message>
        <source>Go to end</source>
        <translation>Перейти в кінець</translation>
    </message>
    <message>
        <source>Go to next paragraph</source>
        <translation>До наступного абзацу</translation>
    </message>
    <message>
        <source>Go to previous paragraph</source>
        <translation>До попереднього абзацу</translation>
    </message>
    <message>
        <source>Delete word to the left</source>
        <translation>Вилучити слово ліворуч</translation>
    </message>
    <message>
        <source>Delete word to the right</source>
        <translation>Вилучити слово праворуч</translation>
    </message>
    <message>
        <source>Delete to start of line</source>
        <translation>Вилучити до початку рядка</translation>
    </message>
    <message>
        <source>Delete to end of line</source>
        <translation>Вилучити до кінця рядка</translation>
    </message>
    <message>
        <source>To upper case</source>
        <translation>До верхнього регістру</translation>
    </message>
    <message>
        <source>To lower case</source>
        <translation>До нижнього регістру</translation>
    </message>
    <message>
        <source>Swap case</source>
        <translation>Змінити регістр на протилежний</translation>
    </message>
    <message>
        <source>Capitalize</source>
        <translation>З великої літери</translation>
    </message>
    <message>
        <source>Move line up</source>
        <translation>Пересунути рядок вгору</translation>
    </message>
    <message>
        <source>Move line down</source>
        <translation>Пересунути рядок вниз</translation>
    </message>
    <message>
        <source>New line above</source>
        <translation>Новий рядок вище</translation>
    </message>
    <message>
        <source>New line below</source>
        <translation>Новий рядок нижче</translation>
    </message>
    <message>
        <source>Duplicate lines</source>
        <translation>Дублювати рядки</translation>
    </message>
    <message>
        <source>Join lines</source>
        <translation>З&apos;єднати рядки</translation>
    </message>
    <message>
        <source>Sort lines</source>
        <translation>Впорядкувати рядки</translation>
    </message>
    <message>
        <source>Reverse lines</source>
        <translation>Обернути порядок рядків</translation>
    </message>
    <message>
        <source>Remove duplicate lines</source>
        <translation>Вилучити повторювані рядки</translation>
    </message>
    <message>
        <source>Remove empty lines</source>
        <translation>Вилучити порожні рядки</translation>
    </message>
    <message>
        <source>Trim lines</source>
        <translation>Обрізати пробіли рядків</translation>
    </message>
    <message>
        <source>Indent lines</source>
        <translation>Збільшити відступ рядків</translation>
    </message>
    <message>
        <source>Unindent lines</source>
        <translation>Зменшити відступ рядків</translation>
    </message>
    <message>
        <source>Comment lines</source>
        <translation>Закоментувати рядки</translation>
    </message>
    <message>
        <source>Uncomment lines</source>
        <translation>Розкоментувати рядки</translation>
    </message>
    <message>
        <source>Tabs to spaces</source>
        <translation>Табуляції на пробіли</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Перегляд</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>З&amp;більшити</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>З&amp;меншити</translation>
    </message>
    <message>
        <source>&amp;Wrap lines</source>
        <translation>Пе&amp;реносити рядки</translation>
    </message>
    <message>
        <source>&amp;Fixed-width font</source>
        <translation>&amp;Фіксована ширина</translation>
    </message>
    <message>
        <source>&amp;Proportional font</source>
        <translation>&amp;Пропорційна ширина</translation>
    </message>
    <message>
        <source>O&amp;verwrite</source>
        <translation>&amp;Заміна</translation>
    </message>
    <message>
        <source>&amp;Read only</source>
        <translation>&amp;Лише читання</translation>
    </message>
    <message>
        <source>Wide cur&amp;sor</source>
        <translation>&amp;Широкий курсор</translation>
    </message>
    <message>
        <source>&amp;Center on cursor</source>
        <translation>По &amp;центру</translation>
    </message>
    <message>
        <source>Scroll &amp;up</source>
        <translation>Прокрутити &amp;вгору</translation>
    </message>
    <message>
        <source>Scroll &amp;down</source>
        <translation>Прокрутити вн&amp;из</translation>
    </message>
    <message>
        <source>Scroll to &amp;top</source>
        <translation>Прокрутити на по&amp;чаток</translation>
    </message>
    <message>
        <source>Scroll to botto&amp;m</source>
        <translation>Прокрутити в &amp;кінець</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Текст</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Клавіші</translation>
    </message>
    <message>
        <source>The file has %1 for %2, but %3 has it, too.</source>
        <translation>У файлі %1 призначено для %2, але це використовує й %3.</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Замінити</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>&amp;Пропустити</translation>
    </message>
    <message>
        <source>&amp;Export keys...</source>
        <translation>&amp;Експорт клавіш...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>&amp;Імпорт клавіш...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>Зберегти пам&apos;ятку як &amp;HTML...</translation>
    </message>
    <message>
        <source>Save cheat sheet as te&amp;xt...</source>
        <translation>Зберегти пам&apos;ятку як те&amp;кст...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>Копіювати &amp;пам&apos;ятку</translation>
    </message>
</context>
<context>
    <name>EntryWindow</name>
    <message>
        <source>Unsaved changes</source>
        <translation>Незбережені зміни</translation>
    </message>
    <message>
        <source>The entry %1 was changed.
Save the changes?</source>
        <translation>Запис %1 змінено.
Зберегти зміни?</translation>
    </message>
</context>
<context>
    <name>FileIconsPage</name>
    <message>
        <source>File icons</source>
        <translation>Піктограми файлів</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>Моделі</translation>
    </message>
</context>
<context>
    <name>GalleryWindow</name>
    <message>
        <source>Widget gallery</source>
        <translation>Галерея віджетів</translation>
    </message>
    <message>
        <source>Pages</source>
        <translation>Сторінки</translation>
    </message>
    <message>
        <source>Code of this page</source>
        <translation>Код цієї сторінки</translation>
    </message>
</context>
<context>
    <name>KeyNamesPage</name>
    <message>
        <source>&amp;Press keys:</source>
        <translation>&amp;Натисніть клавіші:</translation>
    </message>
    <message>
        <source>In the window manager&apos;s notation:</source>
        <translation>Як їх записує засіб керування вікнами:</translation>
    </message>
    <message>
        <source>Read back:</source>
        <translation>Прочитано назад:</translation>
    </message>
    <message>
        <source>Global action with these keys:</source>
        <translation>Загальна дія з цими клавішами:</translation>
    </message>
    <message>
        <source>Key names</source>
        <translation>Назви клавіш</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Скорочення</translation>
    </message>
</context>
<context>
    <name>MenuPages</name>
    <message>
        <source>&amp;Pick an entry...</source>
        <translation>&amp;Вибрати запис...</translation>
    </message>
    <message>
        <source>Edit the &amp;menu...</source>
        <translation>Змінити &amp;меню...</translation>
    </message>
    <message>
        <source>Edit an e&amp;ntry...</source>
        <translation>Змінити &amp;запис...</translation>
    </message>
    <message>
        <source>Menu tree</source>
        <translation>Дерево меню</translation>
    </message>
    <message>
        <source>Menus</source>
        <translation>Меню</translation>
    </message>
    <message>
        <source>Menu and entry dialogs</source>
        <translation>Діалогові вікна меню і запису</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Допомога в роботі</translation>
    </message>
</context>
<context>
    <name>RadioGroupBoxPage</name>
    <message>
        <source>&amp;Automatic configuration</source>
        <translation>&amp;Автоматичне налаштування</translation>
    </message>
    <message>
        <source>Script address:</source>
        <translation>Адреса скрипту:</translation>
    </message>
    <message>
        <source>Ask again at every start</source>
        <translation>Запитувати під час кожного запуску</translation>
    </message>
    <message>
        <source>&amp;Manual configuration</source>
        <translation>&amp;Ручне налаштування</translation>
    </message>
    <message>
        <source>Host:</source>
        <translation>Вузол:</translation>
    </message>
    <message>
        <source>Port:</source>
        <translation>Порт:</translation>
    </message>
    <message>
        <source>Protocol:</source>
        <translation>Протокол:</translation>
    </message>
    <message>
        <source>&amp;Direct connection</source>
        <translation>&amp;Пряме з&apos;єднання</translation>
    </message>
    <message>
        <source>There is nothing to set.</source>
        <translation>Нічого налаштовувати не потрібно.</translation>
    </message>
    <message>
        <source>Radio group boxes</source>
        <translation>Групи з перемикачем</translation>
    </message>
    <message>
        <source>Widgets</source>
        <translation>Віджети</translation>
    </message>
</context>
<context>
    <name>SettingsPage</name>
    <message>
        <source>Settings file</source>
        <translation>Файл налаштувань</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Налаштування</translation>
    </message>
    <message>
        <source>F&amp;lat buttons</source>
        <translation>&amp;Плоскі кнопки</translation>
    </message>
    <message>
        <source>S&amp;ection:</source>
        <translation>Ро&amp;зділ:</translation>
    </message>
    <message>
        <source>&amp;Font:</source>
        <translation>&amp;Шрифт:</translation>
    </message>
    <message>
        <source>&amp;Size:</source>
        <translation>&amp;Розмір:</translation>
    </message>
    <message>
        <source>Contents of the file on disk</source>
        <translation>Вміст файлу на диску</translation>
    </message>
    <message>
        <source>Name a settings file on the command line to edit it here.</source>
        <translation>Вкажіть файл налаштувань у командному рядку, щоб змінити його тут.</translation>
    </message>
    <message>
        <source>%1 cannot be opened.</source>
        <translation>Не вдалося відкрити %1.</translation>
    </message>
</context>
<context>
    <name>ShortcutsPage</name>
    <message>
        <source>Delete the whole line</source>
        <translation>Вилучити весь рядок</translation>
    </message>
    <message>
        <source>Last command: %1</source>
        <translation>Остання команда: %1</translation>
    </message>
    <message>
        <source>one line
another line
and a third one
</source>
        <translation>один рядок
інший рядок
і третій
</translation>
    </message>
    <message>
        <source>Go to the editor</source>
        <translation>Перейти до редактора</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Перегляд</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Налаштування</translation>
    </message>
    <message>
        <source>Configure shortcuts...</source>
        <translation>Налаштувати скорочення...</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Скорочення</translation>
    </message>
    <message>
        <source>Configure shortcuts in the plain dialog...</source>
        <translation>Налаштувати скорочення у простому вікні...</translation>
    </message>
</context>
<context>
    <name>vel-entryedit</name>
    <message>
        <source>Edits a desktop entry.</source>
        <translation>Змінює запис стільниці.</translation>
    </message>
    <message>
        <source>Make a new entry when there is no such file.</source>
        <translation>Створити новий запис, якщо такого файла немає.</translation>
    </message>
    <message>
        <source>Begin with the values of the entry &lt;file&gt;.</source>
        <translation>Почати зі значень запису &lt;file&gt;.</translation>
    </message>
    <message>
        <source>Show the entry only.</source>
        <translation>Лише показати запис.</translation>
    </message>
    <message>
        <source>The entry to edit.</source>
        <translation>Запис, який слід змінити.</translation>
    </message>
    <message>
        <source>one file has to be named</source>
        <translation>слід вказати один файл</translation>
    </message>
    <message>
        <source>cannot open %1</source>
        <translation>не вдалося відкрити %1</translation>
    </message>
    <message>
        <source>cannot open %1: there is no such file, --create makes a new entry</source>
        <translation>не вдалося відкрити %1: такого файла немає, новий запис створює --create</translation>
    </message>
    <message>
        <source>cannot open %1: it is no regular file</source>
        <translation>не вдалося відкрити %1: це не звичайний файл</translation>
    </message>
    <message>
        <source>cannot open %1: %2</source>
        <translation>не вдалося відкрити %1: %2</translation>
    </message>
</context>
<context>
    <name>vel-gallery</name>
    <message>
        <source>the page %1 did not finish loading</source>
        <translation>сторінка %1 не готова</translation>
    </message>
    <message>
        <source>cannot write %1</source>
        <translation>не вдалося записати %1</translation>
    </message>
    <message>
        <source>cannot make the folder %1</source>
        <translation>не вдалося створити теку %1</translation>
    </message>
    <message>
        <source>Shows the library&apos;s widgets, dialogs and models in action.</source>
        <translation>Показує віджети, діалогові вікна та моделі бібліотеки в роботі.</translation>
    </message>
    <message>
        <source>Start with the page &lt;name&gt;.</source>
        <translation>Почати зі сторінки &lt;name&gt;.</translation>
    </message>
    <message>
        <source>Write screenshots of every page, or of the page given with --page, to &lt;dir&gt; and exit.</source>
        <translation>Записати до &lt;dir&gt; зображення всіх сторінок або вказаної у --page і завершити роботу.</translation>
    </message>
    <message>
        <source>The settings file that the settings page edits.</source>
        <translation>Файл налаштувань, який змінює сторінка налаштувань.</translation>
    </message>
    <message>
        <source>Widget gallery</source>
        <translation>Галерея віджетів</translation>
    </message>
    <message>
        <source>there is no page %1</source>
        <translation>немає сторінки %1</translation>
    </message>
</context>
<context>
    <name>vel-menuedit</name>
    <message>
        <source>cannot create the start menu %1</source>
        <translation>не вдалося створити меню запуску %1</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>немає такої теки: %1</translation>
    </message>
    <message>
        <source>not a directory: %1</source>
        <translation>не є текою: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>не вдалося прочитати теку %1</translation>
    </message>
    <message>
        <source>Edits the start menu, or picks an entry of it.</source>
        <translation>Змінює меню запуску або вибирає його запис.</translation>
    </message>
    <message>
        <source>Show the menu directory &lt;dir&gt; instead of the start menu.</source>
        <translation>Показати теку меню &lt;dir&gt; замість меню запуску.</translation>
    </message>
    <message>
        <source>Show the desktop folder.</source>
        <translation>Показати теку стільниці.</translation>
    </message>
    <message>
        <source>Show the tool bar.</source>
        <translation>Показати панель інструментів.</translation>
    </message>
    <message>
        <source>Look only, change nothing.</source>
        <translation>Лише перегляд, нічого не змінювати.</translation>
    </message>
    <message>
        <source>Show icons of &lt;pixels&gt; pixels.</source>
        <translation>Показувати піктограми розміром &lt;pixels&gt; пікселів.</translation>
    </message>
    <message>
        <source>Pick an entry and print its path and its command line.</source>
        <translation>Вибрати запис і вивести його шлях і командний рядок.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>неочікуваний аргумент: %1</translation>
    </message>
    <message>
        <source>only one of --dir, --desktop and --toolbar can be given</source>
        <translation>можна вказати лише один з параметрів --dir, --desktop і --toolbar</translation>
    </message>
    <message>
        <source>--icon-size needs a number of pixels from 1 to 512, not &quot;%1&quot;</source>
        <translation>для --icon-size потрібне число пікселів від 1 до 512, а не «%1»</translation>
    </message>
</context>
<context>
    <name>vel-menuprint</name>
    <message>
        <source>Prints a menu directory in its order.</source>
        <translation>Виводить теку меню в її порядку.</translation>
    </message>
    <message>
        <source>The menu directory; the start menu when none is given.</source>
        <translation>Тека меню; меню запуску, якщо її не вказано.</translation>
    </message>
    <message>
        <source>unknown format: %1</source>
        <translation>невідомий формат: %1</translation>
    </message>
    <message>
        <source>more than one directory</source>
        <translation>вказано більше однієї теки</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>немає такої теки: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>не вдалося прочитати теку %1</translation>
    </message>
    <message>
        <source>The menu has more than %1 items or %2 levels, and the rest of it is left out. Look for links that lead into the same folders again.</source>
        <translation>У меню понад %1 елементів або %2 рівнів; решту пропущено. Пошукайте посилання, які знову і знову ведуть до тих самих тек.</translation>
    </message>
    <message>
        <source>What to print: %1. The default is text.</source>
        <translation>Що виводити: %1. Типово text.</translation>
    </message>
    <message>
        <source>The icon theme to take the files of icons from; the user&apos;s own when none is given.</source>
        <translation>Тема, з якої беруться файли піктограм; якщо не вказано — тема користувача.</translation>
    </message>
    <message>
        <source>The edge of the icons in pixels, 24 by default.</source>
        <translation>Сторона піктограм у пікселях, типово 24.</translation>
    </message>
    <message>
        <source>Reads one of the lines that rofi or dmenu was given from standard input and starts its entry.</source>
        <translation>Читає зі стандартного вводу один з рядків, переданих rofi або dmenu, і запускає його запис.</translation>
    </message>
    <message>
        <source>the size of icons is not between 1 and %1</source>
        <translation>розмір піктограм не лежить між 1 і %1</translation>
    </message>
    <message>
        <source>The start menu is empty: no application is installed.</source>
        <translation>Меню запуску порожнє: не встановлено жодної програми.</translation>
    </message>
    <message>
        <source>The start menu %1 cannot be made: %2</source>
        <translation>Не вдалося створити меню запуску %1: %2</translation>
    </message>
    <message>
        <source>%1 is left out, as the line end in its name cannot be written in this format. Rename it.</source>
        <translation>Пропущено: %1. Кінець рядка в назві не можна записати в цьому форматі. Перейменуйте цей об&apos;єкт.</translation>
    </message>
    <message>
        <source>The start menu is empty: nothing in %1 is shown.</source>
        <translation>Меню запуску порожнє: у %1 немає чого показати.</translation>
    </message>
    <message>
        <source>cannot run vel-open: %1</source>
        <translation>не вдалося виконати vel-open: %1</translation>
    </message>
    <message>
        <source>There is no &quot;%1&quot; in the menu.</source>
        <translation>У меню немає «%1».</translation>
    </message>
</context>
<context>
    <name>vel-wmbridge</name>
    <message>
        <source>Owns the window manager&apos;s command channel on a desktop that has none, and runs a command of the shell for each kind of update. The variable VEL_COMMAND holds the line that came.</source>
        <translation>Утримує канал команд засобу керування вікнами у середовищі, де його немає, і виконує команду оболонки для кожного типу оновлення. Змінна VEL_COMMAND містить отриманий рядок.</translation>
    </message>
    <message>
        <source>Run when the start menu has changed.</source>
        <translation>Виконати, коли змінилося меню запуску.</translation>
    </message>
    <message>
        <source>Run when the tool bar has changed.</source>
        <translation>Виконати, коли змінилася панель інструментів.</translation>
    </message>
    <message>
        <source>Run when the desktop&apos;s entries have changed.</source>
        <translation>Виконати, коли змінилися записи стільниці.</translation>
    </message>
    <message>
        <source>Run for every other line.</source>
        <translation>Виконати для будь-якого іншого рядка.</translation>
    </message>
    <message>
        <source>Take the channel from the program that has it.</source>
        <translation>Забрати канал у програми, яка його утримує.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>неочікуваний аргумент: %1</translation>
    </message>
    <message>
        <source>cannot run the command for %1</source>
        <translation>не вдалося виконати команду для %1</translation>
    </message>
    <message>
        <source>another program has taken the channel</source>
        <translation>канал перейняла інша програма</translation>
    </message>
    <message>
        <source>cannot take the channel: there is no display, or another program has it</source>
        <translation>не вдалося зайняти канал: немає дисплея або його утримує інша програма</translation>
    </message>
    <message>
        <source>unknown window manager: %1 (known are %2)</source>
        <translation>невідомий засіб керування вікнами: %1 (відомі %2)</translation>
    </message>
    <message>
        <source>Do what this window manager needs to show the start menu as it is: %1.</source>
        <translation>Зробити те, що потрібно цьому засобу керування вікнами, щоб показати меню запуску таким, яким воно є: %1.</translation>
    </message>
</context>
</TS>

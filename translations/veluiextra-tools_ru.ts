<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ru" sourcelanguage="en">
<context>
    <name>DesktopEntryPages</name>
    <message>
        <source>&amp;Read-only</source>
        <translation>&amp;Только чтение</translation>
    </message>
    <message>
        <source>&amp;Button beside the address</source>
        <translation>&amp;Кнопка рядом с адресом</translation>
    </message>
    <message>
        <source>Information requested for %1</source>
        <translation>Запрошены сведения о %1</translation>
    </message>
    <message>
        <source>Use the buttons beside the fields to edit commands, files, icons, lists and actions.</source>
        <translation>Команды и файлы, значки, списки и действия изменяются с помощью кнопок в их полях.</translation>
    </message>
    <message>
        <source>Properties form</source>
        <translation>Форма свойств</translation>
    </message>
    <message>
        <source>Desktop entries</source>
        <translation>Записи рабочего стола</translation>
    </message>
    <message>
        <source>Paths, icons, lists and actions</source>
        <translation>Пути, значки, списки и действия</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Помощь в работе</translation>
    </message>
</context>
<context>
    <name>EditorCommands</name>
    <message>
        <source>Open</source>
        <translation>Открыть</translation>
    </message>
    <message>
        <source>Cannot read %1.</source>
        <translation>Не удалось прочитать %1.</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Сохранить</translation>
    </message>
    <message>
        <source>Cannot write %1.</source>
        <translation>Не удалось записать %1.</translation>
    </message>
    <message>
        <source>Go to line</source>
        <translation>Переход на строку</translation>
    </message>
    <message>
        <source>Line:</source>
        <translation>Строка:</translation>
    </message>
    <message>
        <source>File</source>
        <translation>Файл</translation>
    </message>
    <message>
        <source>&amp;New</source>
        <translation>Созд&amp;ать</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>&amp;Открыть...</translation>
    </message>
    <message>
        <source>&amp;Save...</source>
        <translation>&amp;Сохранить...</translation>
    </message>
    <message>
        <source>Insert &amp;date</source>
        <translation>Вставить &amp;дату</translation>
    </message>
    <message>
        <source>Insert &amp;time</source>
        <translation>Вставить &amp;время</translation>
    </message>
    <message>
        <source>Insert &amp;rule</source>
        <translation>Вставить &amp;разделитель</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Правка</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Отменить</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>Верну&amp;ть</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>&amp;Вырезать</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Копировать</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>В&amp;ставить</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>В&amp;ыделить всё</translation>
    </message>
    <message>
        <source>Select word</source>
        <translation>Выделить слово</translation>
    </message>
    <message>
        <source>Select line</source>
        <translation>Выделить строку</translation>
    </message>
    <message>
        <source>Select paragraph</source>
        <translation>Выделить абзац</translation>
    </message>
    <message>
        <source>Find selected a&amp;gain</source>
        <translation>&amp;Найти выделенное далее</translation>
    </message>
    <message>
        <source>Find selected backward</source>
        <translation>Найти выделенное ранее</translation>
    </message>
    <message>
        <source>Find selected word</source>
        <translation>Найти выделенное слово</translation>
    </message>
    <message>
        <source>Find selected, matching case</source>
        <translation>Найти выделенное с учётом регистра</translation>
    </message>
    <message>
        <source>Go to &amp;line...</source>
        <translation>&amp;Перейти на строку...</translation>
    </message>
    <message>
        <source>Go to start</source>
        <translation>В начало</translation>
    </message>
    <message>
        <source>Go to end</source>
        <translation>В конец</translation>
    </message>
    <message>
        <source>Go to next paragraph</source>
        <translation>К следующему абзацу</translation>
    </message>
    <message>
        <source>Go to previous paragraph</source>
        <translation>К предыдущему абзацу</translation>
    </message>
    <message>
        <source>Delete word to the left</source>
        <translation>Удалить слово слева</translation>
    </message>
    <message>
        <source>Delete word to the right</source>
        <translation>Удалить слово справа</translation>
    </message>
    <message>
        <source>Delete to start of line</source>
        <translation>Удалить до начала строки</translation>
    </message>
    <message>
        <source>Delete to end of line</source>
        <translation>Удалить до конца строки</translation>
    </message>
    <message>
        <source>To upper case</source>
        <translation>В верхний регистр</translation>
    </message>
    <message>
        <source>To lower case</source>
        <translation>В нижний регистр</translation>
    </message>
    <message>
        <source>Swap case</source>
        <translation>Поменять регистр</translation>
    </message>
    <message>
        <source>Capitalize</source>
        <translation>С прописной буквы</translation>
    </message>
    <message>
        <source>Move line up</source>
        <translation>Переместить строку вверх</translation>
    </message>
    <message>
        <source>Move line down</source>
        <translation>Переместить строку вниз</translation>
    </message>
    <message>
        <source>New line above</source>
        <translation>Новая строка выше</translation>
    </message>
    <message>
        <source>New line below</source>
        <translation>Новая строка ниже</translation>
    </message>
    <message>
        <source>Duplicate lines</source>
        <translation>Дублировать строки</translation>
    </message>
    <message>
        <source>Join lines</source>
        <translation>Объединить строки</translation>
    </message>
    <message>
        <source>Sort lines</source>
        <translation>Сортировать строки</translation>
    </message>
    <message>
        <source>Reverse lines</source>
        <translation>Обратить порядок строк</translation>
    </message>
    <message>
        <source>Remove duplicate lines</source>
        <translation>Удалить повторяющиеся строки</translation>
    </message>
    <message>
        <source>Remove empty lines</source>
        <translation>Удалить пустые строки</translation>
    </message>
    <message>
        <source>Trim lines</source>
        <translation>Удалить крайние пробелы строк</translation>
    </message>
    <message>
        <source>Indent lines</source>
        <translation>Увеличить отступ строк</translation>
    </message>
    <message>
        <source>Unindent lines</source>
        <translation>Уменьшить отступ строк</translation>
    </message>
    <message>
        <source>Comment lines</source>
        <translation>Закомментировать строки</translation>
    </message>
    <message>
        <source>Uncomment lines</source>
        <translation>Раскомментировать строки</translation>
    </message>
    <message>
        <source>Tabs to spaces</source>
        <translation>Табуляции в пробелы</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Вид</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>&amp;Увеличить</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>У&amp;меньшить</translation>
    </message>
    <message>
        <source>&amp;Wrap lines</source>
        <translation>Перенос &amp;строк</translation>
    </message>
    <message>
        <source>&amp;Fixed-width font</source>
        <translation>М&amp;оноширинный шрифт</translation>
    </message>
    <message>
        <source>&amp;Proportional font</source>
        <translation>&amp;Пропорциональный шрифт</translation>
    </message>
    <message>
        <source>O&amp;verwrite</source>
        <translation>&amp;Замена</translation>
    </message>
    <message>
        <source>&amp;Read only</source>
        <translation>&amp;Только чтение</translation>
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
        <translation>Прокрутить &amp;вверх</translation>
    </message>
    <message>
        <source>Scroll &amp;down</source>
        <translation>Прокрутить в&amp;низ</translation>
    </message>
    <message>
        <source>Scroll to &amp;top</source>
        <translation>Прокрутить в н&amp;ачало</translation>
    </message>
    <message>
        <source>Scroll to botto&amp;m</source>
        <translation>Прокрутить в &amp;конец</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Текст</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Клавиши</translation>
    </message>
    <message>
        <source>The file has %1 for %2, but %3 has it, too.</source>
        <translation>В файле %1 назначено для %2, но это использует и %3.</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Заменить</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>&amp;Пропустить</translation>
    </message>
    <message>
        <source>&amp;Export keys...</source>
        <translation>&amp;Экспорт клавиш...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>&amp;Импорт клавиш...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>Сохранить памятку как &amp;HTML...</translation>
    </message>
    <message>
        <source>Save cheat sheet as te&amp;xt...</source>
        <translation>Сохранить памятку как те&amp;кст...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>Копировать &amp;памятку</translation>
    </message>
</context>
<context>
    <name>EntryWindow</name>
    <message>
        <source>Unsaved changes</source>
        <translation>Несохранённые изменения</translation>
    </message>
    <message>
        <source>The entry %1 was changed.
Save the changes?</source>
        <translation>Запись %1 изменена.
Сохранить изменения?</translation>
    </message>
</context>
<context>
    <name>FileIconsPage</name>
    <message>
        <source>File icons</source>
        <translation>Значки файлов</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>Модели</translation>
    </message>
</context>
<context>
    <name>GalleryWindow</name>
    <message>
        <source>Widget gallery</source>
        <translation>Галерея виджетов</translation>
    </message>
    <message>
        <source>Pages</source>
        <translation>Страницы</translation>
    </message>
    <message>
        <source>Code of this page</source>
        <translation>Код этой страницы</translation>
    </message>
</context>
<context>
    <name>KeyNamesPage</name>
    <message>
        <source>&amp;Press keys:</source>
        <translation>&amp;Нажмите клавиши:</translation>
    </message>
    <message>
        <source>In the window manager&apos;s notation:</source>
        <translation>Как их записывает диспетчер окон:</translation>
    </message>
    <message>
        <source>Read back:</source>
        <translation>Прочитано обратно:</translation>
    </message>
    <message>
        <source>Global action with these keys:</source>
        <translation>Глобальное действие с этими клавишами:</translation>
    </message>
    <message>
        <source>Key names</source>
        <translation>Имена клавиш</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Комбинации клавиш</translation>
    </message>
</context>
<context>
    <name>MenuPages</name>
    <message>
        <source>&amp;Pick an entry...</source>
        <translation>&amp;Выбрать запись...</translation>
    </message>
    <message>
        <source>Edit the &amp;menu...</source>
        <translation>Изменить &amp;меню...</translation>
    </message>
    <message>
        <source>Edit an e&amp;ntry...</source>
        <translation>Изменить &amp;запись...</translation>
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
        <translation>Диалоговые окна меню и записи</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Помощь в работе</translation>
    </message>
</context>
<context>
    <name>RadioGroupBoxPage</name>
    <message>
        <source>&amp;Automatic configuration</source>
        <translation>&amp;Автоматическая настройка</translation>
    </message>
    <message>
        <source>Script address:</source>
        <translation>Адрес сценария:</translation>
    </message>
    <message>
        <source>Ask again at every start</source>
        <translation>Спрашивать при каждом запуске</translation>
    </message>
    <message>
        <source>&amp;Manual configuration</source>
        <translation>&amp;Ручная настройка</translation>
    </message>
    <message>
        <source>Host:</source>
        <translation>Узел:</translation>
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
        <translation>&amp;Прямое соединение</translation>
    </message>
    <message>
        <source>There is nothing to set.</source>
        <translation>Ничего настраивать не нужно.</translation>
    </message>
    <message>
        <source>Radio group boxes</source>
        <translation>Группы с переключателем</translation>
    </message>
    <message>
        <source>Widgets</source>
        <translation>Виджеты</translation>
    </message>
</context>
<context>
    <name>SettingsPage</name>
    <message>
        <source>Settings file</source>
        <translation>Файл настроек</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Настройки</translation>
    </message>
    <message>
        <source>F&amp;lat buttons</source>
        <translation>&amp;Плоские кнопки</translation>
    </message>
    <message>
        <source>S&amp;ection:</source>
        <translation>Ра&amp;здел:</translation>
    </message>
    <message>
        <source>&amp;Font:</source>
        <translation>&amp;Шрифт:</translation>
    </message>
    <message>
        <source>&amp;Size:</source>
        <translation>&amp;Размер:</translation>
    </message>
    <message>
        <source>Contents of the file on disk</source>
        <translation>Содержимое файла на диске</translation>
    </message>
    <message>
        <source>Name a settings file on the command line to edit it here.</source>
        <translation>Укажите файл настроек в командной строке, чтобы изменить его здесь.</translation>
    </message>
    <message>
        <source>%1 cannot be opened.</source>
        <translation>Не удалось открыть %1.</translation>
    </message>
</context>
<context>
    <name>ShortcutsPage</name>
    <message>
        <source>Delete the whole line</source>
        <translation>Удалить всю строку</translation>
    </message>
    <message>
        <source>Last command: %1</source>
        <translation>Последняя команда: %1</translation>
    </message>
    <message>
        <source>one line
another line
and a third one
</source>
        <translation>одна строка
другая строка
и третья
</translation>
    </message>
    <message>
        <source>Go to the editor</source>
        <translation>Перейти к редактору</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Вид</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Настройки</translation>
    </message>
    <message>
        <source>Configure shortcuts...</source>
        <translation>Настроить комбинации клавиш...</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Комбинации клавиш</translation>
    </message>
    <message>
        <source>Configure shortcuts in the plain dialog...</source>
        <translation>Настроить комбинации клавиш в простом окне...</translation>
    </message>
</context>
<context>
    <name>vel-entryedit</name>
    <message>
        <source>Edits a desktop entry.</source>
        <translation>Изменяет запись рабочего стола.</translation>
    </message>
    <message>
        <source>Make a new entry when there is no such file.</source>
        <translation>Создать новую запись, если такого файла нет.</translation>
    </message>
    <message>
        <source>Begin with the values of the entry &lt;file&gt;.</source>
        <translation>Начать со значений записи &lt;file&gt;.</translation>
    </message>
    <message>
        <source>Show the entry only.</source>
        <translation>Только показать запись.</translation>
    </message>
    <message>
        <source>The entry to edit.</source>
        <translation>Изменяемая запись.</translation>
    </message>
    <message>
        <source>one file has to be named</source>
        <translation>нужно указать один файл</translation>
    </message>
    <message>
        <source>cannot open %1</source>
        <translation>не удалось открыть %1</translation>
    </message>
    <message>
        <source>cannot open %1: there is no such file, --create makes a new entry</source>
        <translation>не удалось открыть %1: такого файла нет, новую запись создаёт --create</translation>
    </message>
    <message>
        <source>cannot open %1: it is no regular file</source>
        <translation>не удалось открыть %1: это не обычный файл</translation>
    </message>
    <message>
        <source>cannot open %1: %2</source>
        <translation>не удалось открыть %1: %2</translation>
    </message>
</context>
<context>
    <name>vel-gallery</name>
    <message>
        <source>the page %1 did not finish loading</source>
        <translation>страница %1 не готова</translation>
    </message>
    <message>
        <source>cannot write %1</source>
        <translation>не удалось записать %1</translation>
    </message>
    <message>
        <source>cannot make the folder %1</source>
        <translation>не удалось создать папку %1</translation>
    </message>
    <message>
        <source>Shows the library&apos;s widgets, dialogs and models in action.</source>
        <translation>Показывает виджеты, диалоговые окна и модели библиотеки в работе.</translation>
    </message>
    <message>
        <source>Start with the page &lt;name&gt;.</source>
        <translation>Начать со страницы &lt;name&gt;.</translation>
    </message>
    <message>
        <source>Write screenshots of every page, or of the page given with --page, to &lt;dir&gt; and exit.</source>
        <translation>Записать в &lt;dir&gt; изображения всех страниц или указанной в --page и завершить работу.</translation>
    </message>
    <message>
        <source>The settings file that the settings page edits.</source>
        <translation>Файл настроек, изменяемый на странице настроек.</translation>
    </message>
    <message>
        <source>Widget gallery</source>
        <translation>Галерея виджетов</translation>
    </message>
    <message>
        <source>there is no page %1</source>
        <translation>нет страницы %1</translation>
    </message>
</context>
<context>
    <name>vel-menuedit</name>
    <message>
        <source>cannot create the start menu %1</source>
        <translation>не удалось создать меню запуска %1</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>нет такой папки: %1</translation>
    </message>
    <message>
        <source>not a directory: %1</source>
        <translation>не является папкой: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>не удалось прочитать папку %1</translation>
    </message>
    <message>
        <source>Edits the start menu, or picks an entry of it.</source>
        <translation>Изменяет меню запуска или выбирает его запись.</translation>
    </message>
    <message>
        <source>Show the menu directory &lt;dir&gt; instead of the start menu.</source>
        <translation>Показать папку меню &lt;dir&gt; вместо меню запуска.</translation>
    </message>
    <message>
        <source>Show the desktop folder.</source>
        <translation>Показать папку рабочего стола.</translation>
    </message>
    <message>
        <source>Show the tool bar.</source>
        <translation>Показать панель инструментов.</translation>
    </message>
    <message>
        <source>Look only, change nothing.</source>
        <translation>Только просмотр, ничего не изменять.</translation>
    </message>
    <message>
        <source>Show icons of &lt;pixels&gt; pixels.</source>
        <translation>Показывать значки размером &lt;pixels&gt; пикселей.</translation>
    </message>
    <message>
        <source>Pick an entry and print its path and its command line.</source>
        <translation>Выбрать запись и вывести её путь и командную строку.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>неожиданный аргумент: %1</translation>
    </message>
    <message>
        <source>only one of --dir, --desktop and --toolbar can be given</source>
        <translation>можно указать только один из параметров --dir, --desktop и --toolbar</translation>
    </message>
    <message>
        <source>--icon-size needs a number of pixels from 1 to 512, not &quot;%1&quot;</source>
        <translation>для --icon-size нужно число пикселей от 1 до 512, а не «%1»</translation>
    </message>
</context>
<context>
    <name>vel-menuprint</name>
    <message>
        <source>Prints a menu directory in its order.</source>
        <translation>Выводит папку меню в её порядке.</translation>
    </message>
    <message>
        <source>The menu directory; the start menu when none is given.</source>
        <translation>Папка меню; если не указана — меню запуска.</translation>
    </message>
    <message>
        <source>unknown format: %1</source>
        <translation>неизвестный формат: %1</translation>
    </message>
    <message>
        <source>more than one directory</source>
        <translation>указано больше одной папки</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>нет такой папки: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>не удалось прочитать папку %1</translation>
    </message>
    <message>
        <source>The menu has more than %1 items or %2 levels, and the rest of it is left out. Look for links that lead into the same folders again.</source>
        <translation>В меню больше %1 элементов или %2 уровней; остальное пропущено. Поищите ссылки, которые снова и снова ведут в одни и те же папки.</translation>
    </message>
    <message>
        <source>What to print: %1. The default is text.</source>
        <translation>Что выводить: %1. По умолчанию text.</translation>
    </message>
    <message>
        <source>The icon theme to take the files of icons from; the user&apos;s own when none is given.</source>
        <translation>Тема, из которой берутся файлы значков; если не указана — тема пользователя.</translation>
    </message>
    <message>
        <source>The edge of the icons in pixels, 24 by default.</source>
        <translation>Сторона значков в пикселях, по умолчанию 24.</translation>
    </message>
    <message>
        <source>Reads one of the lines that rofi or dmenu was given from standard input and starts its entry.</source>
        <translation>Читает из стандартного ввода одну из строк, переданных rofi или dmenu, и запускает её запись.</translation>
    </message>
    <message>
        <source>the size of icons is not between 1 and %1</source>
        <translation>размер значков не лежит между 1 и %1</translation>
    </message>
    <message>
        <source>The start menu is empty: no application is installed.</source>
        <translation>Меню запуска пусто: не установлено ни одного приложения.</translation>
    </message>
    <message>
        <source>The start menu %1 cannot be made: %2</source>
        <translation>Не удалось создать меню запуска %1: %2</translation>
    </message>
    <message>
        <source>%1 is left out, as the line end in its name cannot be written in this format. Rename it.</source>
        <translation>Пропущено: %1. Перевод строки в имени нельзя записать в этом формате. Переименуйте этот объект.</translation>
    </message>
    <message>
        <source>The start menu is empty: nothing in %1 is shown.</source>
        <translation>Меню запуска пусто: в %1 нечего показать.</translation>
    </message>
    <message>
        <source>cannot run vel-open: %1</source>
        <translation>не удалось выполнить vel-open: %1</translation>
    </message>
    <message>
        <source>There is no &quot;%1&quot; in the menu.</source>
        <translation>В меню нет «%1».</translation>
    </message>
</context>
<context>
    <name>vel-wmbridge</name>
    <message>
        <source>Owns the window manager&apos;s command channel on a desktop that has none, and runs a command of the shell for each kind of update. The variable VEL_COMMAND holds the line that came.</source>
        <translation>Держит командный канал диспетчера окон в рабочей среде, где его нет, и выполняет команду оболочки для каждого вида обновления. Переменная VEL_COMMAND содержит полученную строку.</translation>
    </message>
    <message>
        <source>Run when the start menu has changed.</source>
        <translation>Выполнить при изменении меню запуска.</translation>
    </message>
    <message>
        <source>Run when the tool bar has changed.</source>
        <translation>Выполнить при изменении панели инструментов.</translation>
    </message>
    <message>
        <source>Run when the desktop&apos;s entries have changed.</source>
        <translation>Выполнить при изменении записей рабочего стола.</translation>
    </message>
    <message>
        <source>Run for every other line.</source>
        <translation>Выполнить для любой другой строки.</translation>
    </message>
    <message>
        <source>Take the channel from the program that has it.</source>
        <translation>Забрать канал у программы, которая его занимает.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>неожиданный аргумент: %1</translation>
    </message>
    <message>
        <source>cannot run the command for %1</source>
        <translation>не удалось выполнить команду для %1</translation>
    </message>
    <message>
        <source>another program has taken the channel</source>
        <translation>канал занят другой программой</translation>
    </message>
    <message>
        <source>cannot take the channel: there is no display, or another program has it</source>
        <translation>не удалось занять канал: нет дисплея или канал занят другой программой</translation>
    </message>
    <message>
        <source>unknown window manager: %1 (known are %2)</source>
        <translation>неизвестный диспетчер окон: %1 (известны %2)</translation>
    </message>
    <message>
        <source>Do what this window manager needs to show the start menu as it is: %1.</source>
        <translation>Сделать то, что нужно этому диспетчеру окон, чтобы показать меню запуска таким, какое оно есть: %1.</translation>
    </message>
</context>
</TS>

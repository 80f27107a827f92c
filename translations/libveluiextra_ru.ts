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
    <name>ClashLine</name>
    <message>
        <source>Go to</source>
        <translation>Перейти</translation>
    </message>
    <message>
        <source>Go to action &apos;%1&apos;</source>
        <translation>Перейти к действию «%1»</translation>
    </message>
    <message>
        <source>Take over</source>
        <translation>Забрать</translation>
    </message>
    <message>
        <source>Take over &apos;%1&apos; from action &apos;%2&apos;</source>
        <translation>Забрать «%1» у действия «%2»</translation>
    </message>
    <message>
        <source>Further clashes: %1</source>
        <translation>Другие конфликты: %1</translation>
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
    <name>EditShortcutsAssistance</name>
    <message>
        <source>Schemes</source>
        <translation>Схемы</translation>
    </message>
    <message>
        <source>No action matches the filter.</source>
        <translation>Ни одно действие не подходит под фильтр.</translation>
    </message>
    <message>
        <source>No action has the shortcut %1.</source>
        <translation>Ни у одного действия нет комбинации клавиш %1.</translation>
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
    <name>EntryCheck</name>
    <message>
        <source>The condition &apos;%1&apos; needs a file.</source>
        <translation>Условию «%1» нужен файл.</translation>
    </message>
    <message>
        <source>The file of the condition &apos;%1&apos; is one in the folder of settings, without &apos;/&apos; before it.</source>
        <translation>Файл условия «%1» указывается относительно папки настроек, без «/» в начале.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a key.</source>
        <translation>Условию «%1» нужен ключ.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs &apos;if-session&apos; or &apos;unless-session&apos; and a session.</source>
        <translation>Условию «%1» нужны «if-session» или «unless-session» и сеанс.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a schema and a key.</source>
        <translation>Условию «%1» нужны схема и ключ.</translation>
    </message>
    <message>
        <source>There is no condition &apos;%1&apos;.</source>
        <translation>Условия «%1» не существует.</translation>
    </message>
    <message>
        <source>A category is empty.</source>
        <translation>Одна из категорий пуста.</translation>
    </message>
    <message>
        <source>There is no registered category &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Среди зарегистрированных категорий нет «%1»; собственная должна начинаться с «X-».</translation>
    </message>
    <message>
        <source>Change it to &apos;%1&apos;</source>
        <translation>Изменить на «%1»</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; also needs: %2.</source>
        <translation>Для категории «%1» нужна также: %2.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; goes with one of these: %2.</source>
        <translation>Категория «%1» употребляется с одной из этих: %2.</translation>
    </message>
    <message>
        <source>Add &apos;%1&apos;</source>
        <translation>Добавить «%1»</translation>
    </message>
    <message>
        <source>Remove it</source>
        <translation>Убрать</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is out of use.</source>
        <translation>Категория «%1» вышла из употребления.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is only for entries that list desktops in &apos;Only show in&apos;.</source>
        <translation>Категория «%1» предназначена только для записей, у которых в поле «Показывать только в» перечислены среды.</translation>
    </message>
    <message>
        <source>No main category is among them, so menus may not know where to show the entry.</source>
        <translation>Среди них нет ни одной основной категории, и меню может не знать, где показывать запись.</translation>
    </message>
    <message>
        <source>Several main categories are among them, so the entry may be shown more than once.</source>
        <translation>Среди них несколько основных категорий, и запись может появиться не один раз.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; stands more than once.</source>
        <translation>«%1» встречается больше одного раза.</translation>
    </message>
    <message>
        <source>Keep the first</source>
        <translation>Оставить первое</translation>
    </message>
    <message>
        <source>The application has no command.</source>
        <translation>У приложения нет команды.</translation>
    </message>
    <message>
        <source>The link leads nowhere.</source>
        <translation>Ссылка никуда не ведёт.</translation>
    </message>
    <message>
        <source>A quote is not closed.</source>
        <translation>Кавычка не закрыта.</translation>
    </message>
    <message>
        <source>In quotes, a backslash has to stand before &apos;%1&apos;.</source>
        <translation>В кавычках перед «%1» должна стоять обратная косая черта.</translation>
    </message>
    <message>
        <source>The command ends in a single backslash, which stands for nothing.</source>
        <translation>Команда заканчивается одиночной обратной косой чертой, которая ничего не обозначает.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to stand in double quotes.</source>
        <translation>«%1» должно стоять в двойных кавычках.</translation>
    </message>
    <message>
        <source>Close the quote</source>
        <translation>Закрыть кавычку</translation>
    </message>
    <message>
        <source>Put it in quotes</source>
        <translation>Заключить в кавычки</translation>
    </message>
    <message>
        <source>Have a shell run it</source>
        <translation>Выполнять через оболочку</translation>
    </message>
    <message>
        <source>Write &apos;%&apos; as &apos;%%&apos;</source>
        <translation>Написать «%» как «%%»</translation>
    </message>
    <message>
        <source>A field code is not complete: &apos;%&apos; ends the command.</source>
        <translation>Неполный код поля: команда заканчивается на «%».</translation>
    </message>
    <message>
        <source>There is no field code &apos;%%1&apos;.</source>
        <translation>Кода поля «%%1» не существует.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; is out of use; nothing is put in its place.</source>
        <translation>Код поля «%%1» вышел из употребления; вместо него ничего не подставляется.</translation>
    </message>
    <message>
        <source>Only one of &apos;%f&apos;, &apos;%F&apos;, &apos;%u&apos; and &apos;%U&apos; may stand in a command, and once.</source>
        <translation>В команде может стоять только один из кодов «%f», «%F», «%u» и «%U», и только один раз.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; stands more than once.</source>
        <translation>Код поля «%%1» встречается больше одного раза.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; has to be an argument of its own, not in quotes.</source>
        <translation>Код поля «%%1» должен быть отдельным аргументом, не в кавычках.</translation>
    </message>
    <message>
        <source>The path of the program has a blank: it has to stand in quotes.</source>
        <translation>В пути к программе есть пробел: путь должен стоять в кавычках.</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;.</source>
        <translation>Программы «%1» нет.</translation>
    </message>
    <message>
        <source>The command has to begin with a program.</source>
        <translation>Команда должна начинаться с программы.</translation>
    </message>
    <message>
        <source>&apos;Try exec&apos; takes the program alone, without quotes and arguments.</source>
        <translation>В поле «Проверочная команда» указывается только программа, без кавычек и аргументов.</translation>
    </message>
    <message>
        <source>Keep the program</source>
        <translation>Оставить программу</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;, so the entry is not shown.</source>
        <translation>Программы «%1» нет, поэтому запись не показывается.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is missing.</source>
        <translation>Отсутствует «%1».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has translations only, and nothing for all other languages.</source>
        <translation>У «%1» есть только переводы и ничего для всех остальных языков.</translation>
    </message>
    <message>
        <source>Take &apos;%1&apos;</source>
        <translation>Взять «%1»</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is only for entries of the type &apos;%2&apos;.</source>
        <translation>«%1» — только для записей типа «%2».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here.</source>
        <translation>«%1» здесь больше не употребляется.</translation>
    </message>
    <message>
        <source>No key can be called &apos;%1&apos;.</source>
        <translation>Ключ не может называться «%1».</translation>
    </message>
    <message>
        <source>There is no key &apos;%1&apos; here; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Ключа «%1» здесь не бывает; собственный должен начинаться с «X-».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; cannot be translated.</source>
        <translation>«%1» нельзя перевести.</translation>
    </message>
    <message>
        <source>&apos;Only show in&apos; and &apos;Not show in&apos; exclude each other.</source>
        <translation>«Показывать только в» и «Не показывать в» исключают друг друга.</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>Файл пуст.</translation>
    </message>
    <message>
        <source>The first group of the file is not &apos;[Desktop Entry]&apos;.</source>
        <translation>Первая группа файла — не «[Desktop Entry]».</translation>
    </message>
    <message>
        <source>The name of the file has to end in &apos;.%1&apos;.</source>
        <translation>Имя файла должно заканчиваться на «.%1».</translation>
    </message>
    <message>
        <source>Lines of the file end in a carriage return.</source>
        <translation>Строки файла заканчиваются возвратом каретки.</translation>
    </message>
    <message>
        <source>A line of the file says nothing: %1</source>
        <translation>Строка файла ничего не означает: %1</translation>
    </message>
    <message>
        <source>A line of the file stands before all groups: %1</source>
        <translation>Строка файла стоит перед всеми группами: %1</translation>
    </message>
    <message>
        <source>A line of the file begins with a blank: %1</source>
        <translation>Строка файла начинается с пробела: %1</translation>
    </message>
    <message>
        <source>A blank stands behind a group: %1</source>
        <translation>После группы стоит пробел: %1</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; stands more than once.</source>
        <translation>Группа «%1» встречается больше одного раза.</translation>
    </message>
    <message>
        <source>No group can be called &apos;%1&apos;.</source>
        <translation>Группа не может называться «%1».</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; is out of use.</source>
        <translation>Группа «%1» вышла из употребления.</translation>
    </message>
    <message>
        <source>There is no group &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Группы «%1» не бывает; собственная должна начинаться с «X-».</translation>
    </message>
    <message>
        <source>The id &apos;%1&apos; of an action may only have letters A to Z, digits and &apos;-&apos;.</source>
        <translation>Идентификатор действия «%1» может содержать только буквы от A до Z, цифры и «-».</translation>
    </message>
    <message>
        <source>The action &apos;%1&apos; is described, but &apos;Actions&apos; does not name it.</source>
        <translation>Действие «%1» описано, но не названо в поле «Actions».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has no &apos;/&apos;.</source>
        <translation>«%1» — не тип MIME: нет «/».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: nothing stands behind the &apos;/&apos;.</source>
        <translation>«%1» — не тип MIME: после «/» ничего нет.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: there is no kind &apos;%2&apos;.</source>
        <translation>«%1» — не тип MIME: вида «%2» не существует.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has a character that none has.</source>
        <translation>«%1» — не тип MIME: есть недопустимый символ.</translation>
    </message>
    <message>
        <source>MIME types like &apos;%1&apos; are not used for files.</source>
        <translation>Типы MIME, подобные «%1», для файлов не используются.</translation>
    </message>
    <message>
        <source>This computer does not know the MIME type &apos;%1&apos;.</source>
        <translation>На этом компьютере тип MIME «%1» неизвестен.</translation>
    </message>
    <message>
        <source>An action has no id.</source>
        <translation>У одного из действий нет идентификатора.</translation>
    </message>
    <message>
        <source>Nothing says what the action &apos;%1&apos; is.</source>
        <translation>Нигде не сказано, что представляет собой действие «%1».</translation>
    </message>
    <message>
        <source>There is no registered desktop &apos;%1&apos;; others have to begin with &apos;X-&apos;.</source>
        <translation>Среди зарегистрированных сред нет «%1»; другие должны начинаться с «X-».</translation>
    </message>
    <message>
        <source>In your language the entry is shown as &apos;%1&apos;.</source>
        <translation>На вашем языке запись показывается как «%1».</translation>
    </message>
    <message>
        <source>The comment says no more than the name.</source>
        <translation>Комментарий говорит не больше, чем имя.</translation>
    </message>
    <message>
        <source>The comment says no more than the generic name.</source>
        <translation>Комментарий говорит не больше, чем общее имя.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here; it has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>«%1» здесь больше не употребляется; нужно «true» или «false».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>Значением «%1» должно быть «true» или «false».</translation>
    </message>
    <message>
        <source>Change it to &apos;true&apos;</source>
        <translation>Изменить на «true»</translation>
    </message>
    <message>
        <source>The name of an icon has no suffix like &apos;%1&apos;.</source>
        <translation>В имени значка не бывает суффикса вроде «%1».</translation>
    </message>
    <message>
        <source>Remove the suffix</source>
        <translation>Убрать суффикс</translation>
    </message>
    <message>
        <source>No icon theme has an icon &apos;%1&apos;.</source>
        <translation>Ни в одной теме значков нет значка «%1».</translation>
    </message>
    <message>
        <source>Write the folder in full</source>
        <translation>Написать папку полностью</translation>
    </message>
    <message>
        <source>The address does not say how to reach it, as &apos;https:&apos; and &apos;file:&apos; do.</source>
        <translation>В адресе не сказано, как к нему обратиться, — как это делают «https:» и «file:».</translation>
    </message>
    <message>
        <source>The text is not encoded in UTF-8.</source>
        <translation>Текст не в кодировке UTF-8.</translation>
    </message>
    <message>
        <source>A control character or tab may not stand here.</source>
        <translation>Управляющий символ или табуляция здесь недопустимы.</translation>
    </message>
    <message>
        <source>The type has to be &apos;Application&apos;, &apos;Link&apos; or &apos;Directory&apos;, not &apos;%1&apos;.</source>
        <translation>Тип должен быть «Application», «Link» или «Directory», а не «%1».</translation>
    </message>
    <message>
        <source>There is no version &apos;%1&apos; of the standard.</source>
        <translation>Версии «%1» стандарта не существует.</translation>
    </message>
    <message>
        <source>There is no encoding &apos;%1&apos;.</source>
        <translation>Кодировки «%1» не существует.</translation>
    </message>
    <message>
        <source>There is no picture &apos;%1&apos;.</source>
        <translation>Изображения «%1» нет.</translation>
    </message>
    <message>
        <source>An icon has a name or a path that begins with &apos;/&apos;.</source>
        <translation>У значка должно быть имя или путь, начинающийся с «/».</translation>
    </message>
    <message>
        <source>The path of a folder begins with &apos;/&apos;.</source>
        <translation>Путь к папке начинается с «/».</translation>
    </message>
    <message>
        <source>There is no folder &apos;%1&apos;.</source>
        <translation>Папки «%1» нет.</translation>
    </message>
    <message>
        <source>There is no file &apos;%1&apos;.</source>
        <translation>Файла «%1» нет.</translation>
    </message>
    <message>
        <source>D-Bus cannot start &apos;%1&apos;: a file of a name like &apos;org.example.Program.desktop&apos; is needed.</source>
        <translation>D-Bus не может запустить «%1»: нужен файл с именем вида «org.example.Program.desktop».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no name of an interface; such names are like &apos;org.example.Viewer&apos;.</source>
        <translation>«%1» — не имя интерфейса; такие имена выглядят как «org.example.Viewer».</translation>
    </message>
</context>
<context>
    <name>EntryTrial</name>
    <message>
        <source>The entry could not be written to a temporary file.</source>
        <translation>Не удалось сохранить запись во временный файл.</translation>
    </message>
</context>
<context>
    <name>KeyAssistance</name>
    <message>
        <source>Press the keys of the shortcut. Tab leaves the field.</source>
        <translation>Нажмите клавиши комбинации. Tab выходит из поля.</translation>
    </message>
    <message>
        <source>Key for action &apos;%1&apos;</source>
        <translation>Клавиша для действия «%1»</translation>
    </message>
    <message>
        <source>None: no key for action &apos;%1&apos;</source>
        <translation>Нет: у действия «%1» не будет клавиши</translation>
    </message>
    <message>
        <source>What speaks against the key for action &apos;%1&apos;</source>
        <translation>Что мешает комбинации клавиш действия «%1»</translation>
    </message>
</context>
<context>
    <name>KeyDescription</name>
    <message>
        <source>Whether the entry starts a program, opens an address or describes a folder of the menu.</source>
        <translation>Запускает ли запись программу, открывает адрес или описывает папку меню.</translation>
    </message>
    <message>
        <source>The name that menus show.</source>
        <translation>Имя, которое показывают меню.</translation>
    </message>
    <message>
        <source>The icon that menus show: a name from the icon theme, or the full path of a picture.</source>
        <translation>Значок, который показывают меню: имя из темы значков или полный путь к изображению.</translation>
    </message>
    <message>
        <source>The command that starts the program, with codes such as %f for the files that it opens.</source>
        <translation>Команда, запускающая программу, с кодами вроде %f для открываемых файлов.</translation>
    </message>
    <message>
        <source>Whether the program needs a terminal window.</source>
        <translation>Нужно ли программе окно терминала.</translation>
    </message>
    <message>
        <source>The folder in which the program starts.</source>
        <translation>Папка, в которой запускается программа.</translation>
    </message>
    <message>
        <source>A program that has to be installed; without it menus leave the entry out.</source>
        <translation>Программа, которая должна быть установлена; без неё меню опускают запись.</translation>
    </message>
    <message>
        <source>The address that the entry opens.</source>
        <translation>Адрес, который открывает запись.</translation>
    </message>
    <message>
        <source>What kind of program it is, such as: Web browser.</source>
        <translation>Что это за программа, например: веб-браузер.</translation>
    </message>
    <message>
        <source>A sentence about the program, which menus show as a tip.</source>
        <translation>Фраза о программе, которую меню показывают как подсказку.</translation>
    </message>
    <message>
        <source>Whether menus leave the entry out although the program can be used.</source>
        <translation>Опускают ли меню запись, хотя программой можно пользоваться.</translation>
    </message>
    <message>
        <source>Whether the entry counts as deleted.</source>
        <translation>Считается ли запись удалённой.</translation>
    </message>
    <message>
        <source>The desktop environments that alone show the entry; none means all.</source>
        <translation>Рабочие среды, только в которых показывается запись; если не указаны — во всех.</translation>
    </message>
    <message>
        <source>The desktop environments that do not show the entry.</source>
        <translation>Рабочие среды, в которых запись не показывается.</translation>
    </message>
    <message>
        <source>The types of files that the program opens.</source>
        <translation>Типы файлов, которые открывает программа.</translation>
    </message>
    <message>
        <source>The groups of the menu that the program belongs to.</source>
        <translation>Группы меню, к которым относится программа.</translation>
    </message>
    <message>
        <source>Words by which a search finds the program beside its name.</source>
        <translation>Слова, по которым поиск находит программу помимо её имени.</translation>
    </message>
    <message>
        <source>Whether the program tells when it has started, so that the pointer shows it until then.</source>
        <translation>Сообщает ли программа о завершении запуска; до тех пор указатель показывает, что она запускается.</translation>
    </message>
    <message>
        <source>The class of the window by which the desktop knows that the program has started.</source>
        <translation>Класс окна, по которому рабочая среда узнаёт, что программа запустилась.</translation>
    </message>
    <message>
        <source>Further things that the program can be started for, such as: New window.</source>
        <translation>Другие действия, для которых можно запустить программу, например: новое окно.</translation>
    </message>
    <message>
        <source>The version of the standard for entries that this one follows.</source>
        <translation>Версия стандарта записей, которой следует эта запись.</translation>
    </message>
    <message>
        <source>%1 Only for users of one language.</source>
        <comment>%1 is a sentence about a key</comment>
        <translation>%1 Только для пользователей одного языка.</translation>
    </message>
</context>
<context>
    <name>LanguageNote</name>
    <message>
        <source>Users of %1 see these texts.</source>
        <translation>Пользователи с языком «%1» видят эти тексты.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those of %2 where one is missing.</source>
        <translation>Пользователи с языком «%1» видят эти тексты, а где какого-то нет — тексты языка «%2».</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those without a language where one is missing.</source>
        <translation>Пользователи с языком «%1» видят эти тексты, а где какого-то нет — тексты без языка.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts of %2.</source>
        <translation>Пользователи с языком «%1» видят тексты языка «%2».</translation>
    </message>
    <message>
        <source>Users of %1 see the texts without a language.</source>
        <translation>Пользователи с языком «%1» видят тексты без языка.</translation>
    </message>
    <message>
        <source>%1 Texts of their own have: %2.</source>
        <comment>%1 is a sentence, %2 a list of languages</comment>
        <translation>%1 Свои тексты есть у языков: %2.</translation>
    </message>
</context>
<context>
    <name>MenuDeletion</name>
    <message>
        <source>There is no trash for %1. It would be deleted for good: this cannot be undone. Delete it?</source>
        <translation>Для %1 нет корзины. Удаление будет окончательным, его нельзя отменить. Удалить?</translation>
    </message>
    <message numerus="yes">
        <source>There is no trash for %n of these items. They would be deleted for good: this cannot be undone. Delete them?</source>
        <translation>
            <numerusform>Для %n из этих объектов нет корзины. Удаление будет окончательным, его нельзя отменить. Удалить?</numerusform>
            <numerusform>Для %n из этих объектов нет корзины. Удаление будет окончательным, его нельзя отменить. Удалить?</numerusform>
            <numerusform>Для %n из этих объектов нет корзины. Удаление будет окончательным, его нельзя отменить. Удалить?</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 cannot be deleted: %2</source>
        <translation>Не удалось удалить %1: %2</translation>
    </message>
    <message numerus="yes">
        <source>The deletion was canceled. %n items are still there, in whole or in part.</source>
        <translation>
            <numerusform>Удаление прервано. Целиком или частично остался %n объект.</numerusform>
            <numerusform>Удаление прервано. Целиком или частично остались %n объекта.</numerusform>
            <numerusform>Удаление прервано. Целиком или частично осталось %n объектов.</numerusform>
        </translation>
    </message>
    <message>
        <source>The deletion was canceled. Still there, in whole or in part: %1.</source>
        <translation>Удаление прервано. Целиком или частично осталось: %1.</translation>
    </message>
</context>
<context>
    <name>MenuDrop</name>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;. Keep both gives the new one another file name, Replace puts the old one into the trash, Skip leaves the new one where it is; Cancel leaves everything as it is.</source>
        <translation>В папке «%1» уже есть «%2». «Оставить оба» даст новому объекту другое имя файла, «Заменить» отправит старый в корзину, «Пропустить» оставит новый на прежнем месте; «Отмена» оставит всё как есть.</translation>
    </message>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;, which the new one comes from. Keep both gives the new one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>В папке «%1» уже есть «%2», от которого происходит новый объект. «Оставить оба» даст новому другое имя файла, «Пропустить» оставит его на прежнем месте; «Отмена» оставит всё как есть.</translation>
    </message>
    <message>
        <source>Another one that comes to the folder &apos;%1&apos; has the same file name as &apos;%2&apos;. Keep both gives this one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>У другого объекта, который попадает в папку «%1», то же имя файла, что и у «%2». «Оставить оба» даст этому объекту другое имя файла, «Пропустить» оставит его на прежнем месте; «Отмена» оставит всё как есть.</translation>
    </message>
    <message>
        <source>Name already taken</source>
        <translation>Имя уже занято</translation>
    </message>
    <message>
        <source>&amp;Keep both</source>
        <translation>&amp;Оставить оба</translation>
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
        <source>&amp;Do the same with all further ones</source>
        <translation>Так же поступать со &amp;всеми следующими</translation>
    </message>
</context>
<context>
    <name>MenuHistory</name>
    <message>
        <source>Undo</source>
        <translation>Отменить</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Повторить</translation>
    </message>
    <message>
        <source>Done: %1</source>
        <translation>Готово: %1</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Перемещение файлов...</translation>
    </message>
    <message>
        <source>Nothing was undone: %1</source>
        <translation>Ничего не отменено: %1</translation>
    </message>
    <message>
        <source>Nothing was done again: %1</source>
        <translation>Ничего не повторено: %1</translation>
    </message>
    <message>
        <source>%1 is not there any more.</source>
        <translation>%1 больше нет.</translation>
    </message>
    <message>
        <source>There is another %1 by now.</source>
        <translation>Теперь есть другой объект %1.</translation>
    </message>
    <message>
        <source>%1 was changed by another program.</source>
        <translation>%1: объект изменён другой программой.</translation>
    </message>
    <message>
        <source>%1 is not in the trash any more.</source>
        <translation>%1 больше нет в корзине.</translation>
    </message>
    <message>
        <source>%1 cannot be put into the trash.</source>
        <translation>Не удалось отправить %1 в корзину.</translation>
    </message>
    <message>
        <source>It was canceled.</source>
        <translation>Операция прервана.</translation>
    </message>
    <message>
        <source>%1 cannot be changed: %2</source>
        <translation>Не удалось изменить %1: %2</translation>
    </message>
    <message>
        <source>Undo creation of %1</source>
        <translation>Отменить создание: %1</translation>
    </message>
    <message>
        <source>Redo creation of %1</source>
        <translation>Повторить создание: %1</translation>
    </message>
    <message>
        <source>%1 was created.</source>
        <translation>Создано: %1.</translation>
    </message>
    <message>
        <source>Undo change of %1</source>
        <translation>Отменить изменение: %1</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Повторить изменение: %1</translation>
    </message>
    <message>
        <source>%1 was changed.</source>
        <translation>Изменено: %1.</translation>
    </message>
    <message>
        <source>Undo deletion of %1</source>
        <translation>Отменить удаление: %1</translation>
    </message>
    <message>
        <source>Redo deletion of %1</source>
        <translation>Повторить удаление: %1</translation>
    </message>
    <message>
        <source>%1 was deleted.</source>
        <translation>Удалено: %1.</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Отменить удаление папки %1 (%n запись)</numerusform>
            <numerusform>Отменить удаление папки %1 (%n записи)</numerusform>
            <numerusform>Отменить удаление папки %1 (%n записей)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Повторить удаление папки %1 (%n запись)</numerusform>
            <numerusform>Повторить удаление папки %1 (%n записи)</numerusform>
            <numerusform>Повторить удаление папки %1 (%n записей)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The folder %1 was deleted (%n entries).</source>
        <translation>
            <numerusform>Папка %1 удалена (%n запись).</numerusform>
            <numerusform>Папка %1 удалена (%n записи).</numerusform>
            <numerusform>Папка %1 удалена (%n записей).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %n items</source>
        <translation>
            <numerusform>Отменить удаление %n объекта</numerusform>
            <numerusform>Отменить удаление %n объектов</numerusform>
            <numerusform>Отменить удаление %n объектов</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %n items</source>
        <translation>
            <numerusform>Повторить удаление %n объекта</numerusform>
            <numerusform>Повторить удаление %n объектов</numerusform>
            <numerusform>Повторить удаление %n объектов</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were deleted.</source>
        <translation>
            <numerusform>Удалён %n объект.</numerusform>
            <numerusform>Удалено %n объекта.</numerusform>
            <numerusform>Удалено %n объектов.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo moving of %1 to %2</source>
        <translation>Отменить перемещение %1 в %2</translation>
    </message>
    <message>
        <source>Redo moving of %1 to %2</source>
        <translation>Повторить перемещение %1 в %2</translation>
    </message>
    <message>
        <source>%1 was moved to %2.</source>
        <translation>Перемещено: %1 в %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo moving of %n items to %2</source>
        <translation>
            <numerusform>Отменить перемещение %n объекта в %2</numerusform>
            <numerusform>Отменить перемещение %n объектов в %2</numerusform>
            <numerusform>Отменить перемещение %n объектов в %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo moving of %n items to %2</source>
        <translation>
            <numerusform>Повторить перемещение %n объекта в %2</numerusform>
            <numerusform>Повторить перемещение %n объектов в %2</numerusform>
            <numerusform>Повторить перемещение %n объектов в %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were moved to %2.</source>
        <translation>
            <numerusform>Перемещён %n объект в %2.</numerusform>
            <numerusform>Перемещено %n объекта в %2.</numerusform>
            <numerusform>Перемещено %n объектов в %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo copying of %1 to %2</source>
        <translation>Отменить копирование %1 в %2</translation>
    </message>
    <message>
        <source>Redo copying of %1 to %2</source>
        <translation>Повторить копирование %1 в %2</translation>
    </message>
    <message>
        <source>%1 was copied to %2.</source>
        <translation>Скопировано: %1 в %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo copying of %n items to %2</source>
        <translation>
            <numerusform>Отменить копирование %n объекта в %2</numerusform>
            <numerusform>Отменить копирование %n объектов в %2</numerusform>
            <numerusform>Отменить копирование %n объектов в %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo copying of %n items to %2</source>
        <translation>
            <numerusform>Повторить копирование %n объекта в %2</numerusform>
            <numerusform>Повторить копирование %n объектов в %2</numerusform>
            <numerusform>Повторить копирование %n объектов в %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were copied to %2.</source>
        <translation>
            <numerusform>Скопирован %n объект в %2.</numerusform>
            <numerusform>Скопировано %n объекта в %2.</numerusform>
            <numerusform>Скопировано %n объектов в %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo reordering of %1</source>
        <translation>Отменить перестановку: %1</translation>
    </message>
    <message>
        <source>Redo reordering of %1</source>
        <translation>Повторить перестановку: %1</translation>
    </message>
    <message>
        <source>%1 has another place.</source>
        <translation>%1 теперь на другом месте.</translation>
    </message>
    <message>
        <source>Undo default menu</source>
        <translation>Отменить создание меню по умолчанию</translation>
    </message>
    <message>
        <source>Redo default menu</source>
        <translation>Повторить создание меню по умолчанию</translation>
    </message>
    <message>
        <source>The default menu was built.</source>
        <translation>Меню по умолчанию создано.</translation>
    </message>
    <message>
        <source>Undo hiding of %1</source>
        <translation>Отменить скрытие: %1</translation>
    </message>
    <message>
        <source>Redo hiding of %1</source>
        <translation>Повторить скрытие: %1</translation>
    </message>
    <message>
        <source>%1 is hidden: the menu no longer shows it.</source>
        <translation>Скрыто: %1. Меню этого больше не показывает.</translation>
    </message>
    <message>
        <source>Undo showing %1 again</source>
        <translation>Отменить возвращение в меню: %1</translation>
    </message>
    <message>
        <source>Redo showing %1 again</source>
        <translation>Повторить возвращение в меню: %1</translation>
    </message>
    <message>
        <source>The menu shows %1 again.</source>
        <translation>Меню снова показывает %1.</translation>
    </message>
    <message>
        <source>Undo deletion of folder %1 (1 entry)</source>
        <translation>Отменить удаление папки %1 (1 запись)</translation>
    </message>
    <message>
        <source>Redo deletion of folder %1 (1 entry)</source>
        <translation>Повторить удаление папки %1 (1 запись)</translation>
    </message>
    <message>
        <source>The folder %1 was deleted (1 entry).</source>
        <translation>Папка %1 удалена (1 запись).</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Отменить удаление объектов: %1 (%n запись)</numerusform>
            <numerusform>Отменить удаление объектов: %1 (%n записи)</numerusform>
            <numerusform>Отменить удаление объектов: %1 (%n записей)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Повторить удаление объектов: %1 (%n запись)</numerusform>
            <numerusform>Повторить удаление объектов: %1 (%n записи)</numerusform>
            <numerusform>Повторить удаление объектов: %1 (%n записей)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 items were deleted (%n entries).</source>
        <translation>
            <numerusform>Удалено объектов: %1 (%n запись).</numerusform>
            <numerusform>Удалено объектов: %1 (%n записи).</numerusform>
            <numerusform>Удалено объектов: %1 (%n записей).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo reordering of %n items</source>
        <translation>
            <numerusform>Отменить перестановку %n объекта</numerusform>
            <numerusform>Отменить перестановку %n объектов</numerusform>
            <numerusform>Отменить перестановку %n объектов</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo reordering of %n items</source>
        <translation>
            <numerusform>Повторить перестановку %n объекта</numerusform>
            <numerusform>Повторить перестановку %n объектов</numerusform>
            <numerusform>Повторить перестановку %n объектов</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items have other places.</source>
        <translation>
            <numerusform>%n объект теперь на другом месте.</numerusform>
            <numerusform>%n объекта теперь на других местах.</numerusform>
            <numerusform>%n объектов теперь на других местах.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo hiding of %n items</source>
        <translation>
            <numerusform>Отменить скрытие %n объекта</numerusform>
            <numerusform>Отменить скрытие %n объектов</numerusform>
            <numerusform>Отменить скрытие %n объектов</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo hiding of %n items</source>
        <translation>
            <numerusform>Повторить скрытие %n объекта</numerusform>
            <numerusform>Повторить скрытие %n объектов</numerusform>
            <numerusform>Повторить скрытие %n объектов</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items are hidden: the menu no longer shows them.</source>
        <translation>
            <numerusform>Скрыт %n объект. Меню его больше не показывает.</numerusform>
            <numerusform>Скрыто %n объекта. Меню их больше не показывает.</numerusform>
            <numerusform>Скрыто %n объектов. Меню их больше не показывает.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo showing %n items again</source>
        <translation>
            <numerusform>Отменить возвращение в меню %n объекта</numerusform>
            <numerusform>Отменить возвращение в меню %n объектов</numerusform>
            <numerusform>Отменить возвращение в меню %n объектов</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo showing %n items again</source>
        <translation>
            <numerusform>Повторить возвращение в меню %n объекта</numerusform>
            <numerusform>Повторить возвращение в меню %n объектов</numerusform>
            <numerusform>Повторить возвращение в меню %n объектов</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The menu shows %n items again.</source>
        <translation>
            <numerusform>Меню снова показывает %n объект.</numerusform>
            <numerusform>Меню снова показывает %n объекта.</numerusform>
            <numerusform>Меню снова показывает %n объектов.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo sorting of folder %1</source>
        <translation>Отменить сортировку папки %1</translation>
    </message>
    <message>
        <source>Redo sorting of folder %1</source>
        <translation>Повторить сортировку папки %1</translation>
    </message>
    <message>
        <source>The folder %1 was sorted by name.</source>
        <translation>Папка %1 отсортирована по имени.</translation>
    </message>
    <message>
        <source>Undo duplication of %1</source>
        <translation>Отменить дублирование: %1</translation>
    </message>
    <message>
        <source>Redo duplication of %1</source>
        <translation>Повторить дублирование: %1</translation>
    </message>
    <message>
        <source>%1 was duplicated. The copy is selected.</source>
        <translation>Создана копия: %1. Она выделена.</translation>
    </message>
    <message numerus="yes">
        <source>Undo duplication of %n items</source>
        <translation>
            <numerusform>Отменить дублирование %n объекта</numerusform>
            <numerusform>Отменить дублирование %n объектов</numerusform>
            <numerusform>Отменить дублирование %n объектов</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo duplication of %n items</source>
        <translation>
            <numerusform>Повторить дублирование %n объекта</numerusform>
            <numerusform>Повторить дублирование %n объектов</numerusform>
            <numerusform>Повторить дублирование %n объектов</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were duplicated. The copies are selected.</source>
        <translation>
            <numerusform>Продублирован %n объект. Копия выделена.</numerusform>
            <numerusform>Продублировано %n объекта. Копии выделены.</numerusform>
            <numerusform>Продублировано %n объектов. Копии выделены.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo deletion of %1 items (1 entry)</source>
        <translation>Отменить удаление объектов: %1 (1 запись)</translation>
    </message>
    <message>
        <source>Redo deletion of %1 items (1 entry)</source>
        <translation>Повторить удаление объектов: %1 (1 запись)</translation>
    </message>
    <message>
        <source>%1 items were deleted (1 entry).</source>
        <translation>Удалено объектов: %1 (1 запись).</translation>
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
    <message>
        <source>Can&apos;t link %1: %2</source>
        <translation>Не удалось создать ссылку на %1: %2</translation>
    </message>
</context>
<context>
    <name>SchemeMenu</name>
    <message>
        <source>This is not a regular file.</source>
        <translation>Это не обычный файл.</translation>
    </message>
    <message>
        <source>Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <translation>Принято комбинаций клавиш: %1, пропущено: %2. ОК вводит их в действие, «Сбросить» возвращает прежние.</translation>
    </message>
    <message>
        <source>%3
Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <comment>%3: a sentence about lines that were skipped</comment>
        <translation>%3
Принято комбинаций клавиш: %1, пропущено: %2. ОК вводит их в действие, «Сбросить» возвращает прежние.</translation>
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
        <source>Save cheat sheet as &amp;text...</source>
        <translation>Сохранить памятку как &amp;текст...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>&amp;Копировать памятку</translation>
    </message>
    <message>
        <source>Export keys</source>
        <translation>Экспорт клавиш</translation>
    </message>
    <message>
        <source>Keys (*.ini);;All files (*)</source>
        <translation>Клавиши (*.ini);;Все файлы (*)</translation>
    </message>
    <message>
        <source>%1
Choose another folder or another name, and try again.</source>
        <translation>%1
Выберите другую папку или другое имя и попробуйте снова.</translation>
    </message>
    <message>
        <source>Import keys</source>
        <translation>Импорт клавиш</translation>
    </message>
    <message>
        <source>%1
Choose a file that was written with &apos;Export keys...&apos;.</source>
        <translation>%1
Выберите файл, записанный с помощью «Экспорт клавиш...».</translation>
    </message>
    <message>
        <source>HTML documents (*.html);;All files (*)</source>
        <translation>Документы HTML (*.html);;Все файлы (*)</translation>
    </message>
    <message>
        <source>Plain text (*.txt);;All files (*)</source>
        <translation>Простой текст (*.txt);;Все файлы (*)</translation>
    </message>
    <message>
        <source>Save cheat sheet</source>
        <translation>Сохранение памятки</translation>
    </message>
    <message>
        <source>The cheat sheet could not be saved to %1: %2
Choose another folder or another name, and try again.</source>
        <comment>%2: what the system says</comment>
        <translation>Не удалось сохранить памятку в %1: %2
Выберите другую папку или другое имя и попробуйте снова.</translation>
    </message>
</context>
<context>
    <name>SchemeQuestion</name>
    <message>
        <source>Import keys</source>
        <translation>Импорт клавиш</translation>
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
        <source>&amp;Do the same with all further ones</source>
        <translation>Так же поступать со &amp;всеми следующими</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but the global action &apos;%3&apos; has it. Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>В файле комбинация клавиш «%1» назначена действию «%2», но её использует глобальное действие «%3». «Пропустить» оставит действие «%2» как есть; «Отмена» не примет ничего.</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but action &apos;%3&apos; has it, too. Replace takes it away from action &apos;%3&apos;, Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>В файле комбинация клавиш «%1» назначена действию «%2», но её использует и действие «%3». «Заменить» заберёт её у действия «%3», «Пропустить» оставит действие «%2» как есть; «Отмена» не примет ничего.</translation>
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
    <message>
        <source>Shortcut &apos;%1&apos; is a further shortcut of action &apos;%2&apos;.</source>
        <translation>Комбинация клавиш «%1» — дополнительная комбинация действия «%2».</translation>
    </message>
</context>
<context>
    <name>ShortcutDelegate</name>
    <message>
        <source>Back to no shortcut</source>
        <translation>Вернуть: без комбинации клавиш</translation>
    </message>
    <message>
        <source>Back to %1</source>
        <translation>Вернуть %1</translation>
    </message>
</context>
<context>
    <name>ShortcutFilterBar</name>
    <message>
        <source>Press keys</source>
        <translation>Нажать клавиши</translation>
    </message>
    <message>
        <source>Changed only</source>
        <translation>Только изменённые</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Фильтр</translation>
    </message>
    <message>
        <source>Shows who has the keys that you press; Escape ends it.</source>
        <translation>Показывает, у кого есть нажатые клавиши; Escape завершает.</translation>
    </message>
    <message>
        <source>Shows the actions alone whose shortcut is not the default one, or was edited.</source>
        <translation>Показывает только действия, у которых комбинация клавиш не стандартная или изменена.</translation>
    </message>
    <message>
        <source>Press the keys to look for</source>
        <translation>Нажмите искомые клавиши</translation>
    </message>
    <message>
        <source>Filter by name, group or shortcut</source>
        <translation>Фильтр по имени, группе или комбинации клавиш</translation>
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
    <message>
        <source>%1, changed</source>
        <comment>%1: an action or a key</comment>
        <translation>%1, изменено</translation>
    </message>
    <message>
        <source>No shortcut</source>
        <translation>Нет комбинации клавиш</translation>
    </message>
    <message>
        <source>There is no default shortcut.</source>
        <translation>Стандартной комбинации клавиш нет.</translation>
    </message>
    <message>
        <source>The default shortcut is %1.</source>
        <translation>Стандартная комбинация клавиш: %1.</translation>
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
    <name>TreeAssistance</name>
    <message>
        <source>&amp;Reset this shortcut</source>
        <translation>&amp;Сбросить эту комбинацию клавиш</translation>
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
    <message>
        <source>The file %1 is not a desktop entry: it has no group [Desktop Entry].</source>
        <translation>Файл %1 не является записью рабочего стола: в нём нет группы [Desktop Entry].</translation>
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
    <message>
        <source>This menu cannot be changed: the folder %1 does not exist.</source>
        <translation>Это меню нельзя изменить: папки %1 нет.</translation>
    </message>
    <message>
        <source>This menu cannot be changed: you may not write to the folder %1.</source>
        <translation>Это меню нельзя изменить: нет права записи в папку %1.</translation>
    </message>
    <message>
        <source>Show hidden</source>
        <translation>Показать скрытые</translation>
    </message>
    <message>
        <source>Filter by name, command or keyword</source>
        <translation>Фильтр по имени, команде или ключевому слову</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Фильтр</translation>
    </message>
    <message>
        <source>Also show the entries that the menu leaves out</source>
        <translation>Показать и записи, которые меню опускает</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Отменить</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Ошибка</translation>
    </message>
    <message>
        <source>Start menu</source>
        <translation>Меню запуска</translation>
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
    <message>
        <source>Not in the menu: it is not meant for this desktop.</source>
        <translation>Нет в меню: запись не предназначена для этой среды.</translation>
    </message>
    <message>
        <source>Not in the menu: it is meant for other desktops only (%1).</source>
        <translation>Нет в меню: запись предназначена только для других сред (%1).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked as deleted (Hidden).</source>
        <translation>Нет в меню: запись помечена как удалённая (Hidden).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked not to be displayed (NoDisplay).</source>
        <translation>Нет в меню: запись помечена как непоказываемая (NoDisplay).</translation>
    </message>
    <message>
        <source>Not in the menu: the program %1 is not installed (TryExec).</source>
        <translation>Нет в меню: программа %1 не установлена (TryExec).</translation>
    </message>
    <message>
        <source>This file is not a desktop entry, whatever its name says.</source>
        <translation>Этот файл не является записью рабочего стола, что бы ни говорило его имя.</translation>
    </message>
    <message>
        <source>This file cannot be read.</source>
        <translation>Этот файл не удаётся прочитать.</translation>
    </message>
    <message>
        <source>This entry has no name. The name of its file is shown.</source>
        <translation>У этой записи нет имени. Показано имя её файла.</translation>
    </message>
    <message>
        <source>Taking back what was done...</source>
        <translation>Отмена сделанного...</translation>
    </message>
    <message>
        <source>The program that holds the clipboard does not answer. Nothing was pasted.</source>
        <translation>Программа, которой принадлежит буфер обмена, не отвечает. Ничего не вставлено.</translation>
    </message>
    <message>
        <source>Nothing can be created in %1, because there is no such folder.</source>
        <translation>В %1 ничего нельзя создать: такой папки нет.</translation>
    </message>
    <message>
        <source>%1 could not be saved. Make sure that the folder %2 may be written and that the disk is not full, then try again.</source>
        <translation>Не удалось сохранить %1. Убедитесь, что в папку %2 можно записывать и что диск не переполнен, и попробуйте снова.</translation>
    </message>
    <message>
        <source>%1 could not be deleted: %2. Make sure that the folder that holds it may be written, then try again.</source>
        <translation>Не удалось удалить %1: %2. Убедитесь, что в содержащую папку можно записывать, и попробуйте снова.</translation>
    </message>
    <message>
        <source>%1 was deleted in part only, because %2 could not be deleted: %3. Make sure that its folder may be written, then delete the rest.</source>
        <translation>%1: удалена только часть, так как не удалось удалить %2: %3. Убедитесь, что в его папку можно записывать, и удалите остальное.</translation>
    </message>
    <message>
        <source>Nothing in this menu matches &apos;%1&apos;.</source>
        <translation>В этом меню нет ничего подходящего под «%1».</translation>
    </message>
    <message>
        <source>Searching the menu for &apos;%1&apos;...</source>
        <translation>Поиск «%1» в меню...</translation>
    </message>
    <message>
        <source>The menu is too large to be searched as a whole. Only a part of it was searched.</source>
        <translation>Меню слишком велико, чтобы искать во всём. Поиск выполнен только в его части.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; was not changed: the file %2 cannot be written.</source>
        <translation>«%1» не изменено: запись в файл %2 невозможна.</translation>
    </message>
    <message>
        <source>The order of the folder %1 could not be saved. Make sure that the folder may be written and that the disk is not full, then try again.</source>
        <translation>Не удалось сохранить порядок в папке %1. Убедитесь, что в папку можно записывать и что диск не переполнен, и попробуйте снова.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1. The menu was left as it is.</source>
        <translation>Не удалось создать меню по умолчанию в %1. Меню осталось прежним.</translation>
    </message>
    <message>
        <source>Menu</source>
        <comment>the tree</comment>
        <translation>Меню</translation>
    </message>
    <message>
        <source>%1 cannot be edited, because the folder %2 may not be written.</source>
        <translation>%1 нельзя редактировать: в папку %2 нельзя записывать.</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Перемещение файлов...</translation>
    </message>
    <message>
        <source>Copying files...</source>
        <translation>Копирование файлов...</translation>
    </message>
    <message>
        <source>Deleting files...</source>
        <translation>Удаление файлов...</translation>
    </message>
    <message>
        <source>The deletion of %1 was canceled. What was not yet deleted is still there.</source>
        <translation>Удаление %1 прервано. То, что ещё не удалено, осталось на месте.</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Это меню пусто. Нажмите %1, чтобы создать запись, или щёлкните здесь правой кнопкой, чтобы увидеть, что ещё можно добавить.</translation>
    </message>
    <message>
        <source>the program %1 ended with an error</source>
        <translation>программа %1 завершилась с ошибкой</translation>
    </message>
    <message>
        <source>the program %1 cannot be run</source>
        <translation>не удалось выполнить программу %1</translation>
    </message>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>И ещё %n.</numerusform>
            <numerusform>И ещё %n.</numerusform>
            <numerusform>И ещё %n.</numerusform>
        </translation>
    </message>
    <message>
        <source>Open containin&amp;g folder</source>
        <translation>&amp;Открыть содержащую папку</translation>
    </message>
    <message>
        <source>The folder %1 was not opened: %2.</source>
        <translation>Папка %1 не открыта: %2.</translation>
    </message>
    <message>
        <source>New &amp;folder</source>
        <translation>Создать &amp;папку</translation>
    </message>
    <message>
        <source>New entr&amp;y</source>
        <translation>Создать &amp;запись</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Изменить</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Удалить</translation>
    </message>
    <message>
        <source>E&amp;xecute</source>
        <translation>В&amp;ыполнить</translation>
    </message>
    <message>
        <source>F&amp;ind</source>
        <translation>На&amp;йти</translation>
    </message>
    <message>
        <source>Find &amp;Next</source>
        <translation>Про&amp;должить поиск</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Вы&amp;резать</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Копировать</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>&amp;Вставить</translation>
    </message>
    <message>
        <source>Default &amp;menu...</source>
        <translation>&amp;Меню по умолчанию...</translation>
    </message>
    <message>
        <source>&amp;Up</source>
        <translation>Вв&amp;ерх</translation>
    </message>
    <message>
        <source>D&amp;own</source>
        <translation>В&amp;низ</translation>
    </message>
    <message>
        <source>Dup&amp;licate</source>
        <translation>Дуб&amp;лировать</translation>
    </message>
    <message>
        <source>&amp;Hide</source>
        <translation>&amp;Скрыть</translation>
    </message>
    <message>
        <source>Sho&amp;w again</source>
        <translation>Пок&amp;азать снова</translation>
    </message>
    <message>
        <source>&amp;Reload</source>
        <translation>О&amp;бновить</translation>
    </message>
    <message>
        <source>&amp;Sort by name</source>
        <translation>Сор&amp;тировать по имени</translation>
    </message>
    <message>
        <source>The folder %1 is sorted by name already.</source>
        <translation>Папка %1 уже отсортирована по имени.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1, because no application is installed. The menu was left as it is.</source>
        <translation>Не удалось создать меню по умолчанию в %1: не установлено ни одного приложения. Меню осталось прежним.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1: %2. The menu was left as it is.</source>
        <translation>Не удалось создать меню по умолчанию в %1: %2. Меню осталось прежним.</translation>
    </message>
    <message>
        <source>%1 is no file on this computer. Nothing was moved or copied.</source>
        <translation>%1 — не файл на этом компьютере. Ничего не перемещено и не скопировано.</translation>
    </message>
    <message>
        <source>%1 was not started: %2.</source>
        <translation>Не удалось запустить %1: %2.</translation>
    </message>
    <message>
        <source>This menu is empty. Right-click here and choose &apos;%2&apos; to fill it with the applications that are installed, or press %1 for a new entry.</source>
        <translation>Это меню пусто. Щёлкните здесь правой кнопкой и выберите «%2», чтобы заполнить его установленными приложениями, или нажмите %1, чтобы создать запись.</translation>
    </message>
    <message>
        <source>This menu is empty, because no application was found that is installed. Once there is one, right-click here and choose &apos;%2&apos;. Until then, press %1 for an entry of your own.</source>
        <translation>Это меню пусто: не найдено ни одного установленного приложения. Когда оно появится, щёлкните здесь правой кнопкой и выберите «%2». А пока нажмите %1, чтобы создать собственную запись.</translation>
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
    <name>VelUI::CategoryChooser</name>
    <message>
        <source>Main category</source>
        <translation>Основная категория</translation>
    </message>
    <message>
        <source>Goes with %1</source>
        <translation>Употребляется с: %1</translation>
    </message>
    <message>
        <source>Only beside &quot;Only show in&quot;</source>
        <translation>Только вместе с «Показывать только в»</translation>
    </message>
    <message>
        <source>Deprecated</source>
        <translation>Устарела</translation>
    </message>
    <message>
        <source>Extension</source>
        <comment>a category of somebody&apos;s own, X-...</comment>
        <translation>Расширение</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Не зарегистрирована</translation>
    </message>
    <message>
        <source>Choose categories</source>
        <translation>Выбор категорий</translation>
    </message>
    <message>
        <source>Name</source>
        <comment>title of a column</comment>
        <translation>Имя</translation>
    </message>
    <message>
        <source>Category</source>
        <comment>title of a column</comment>
        <translation>Категория</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Примечание</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryNames</name>
    <message>
        <source>Audio and video</source>
        <translation>Аудио и видео</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>Аудио</translation>
    </message>
    <message>
        <source>Video</source>
        <translation>Видео</translation>
    </message>
    <message>
        <source>Software development</source>
        <translation>Разработка программ</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>Образование</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>Игры</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>Графика</translation>
    </message>
    <message>
        <source>Internet and network</source>
        <translation>Интернет и сеть</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>Офис</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>Наука</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Настройки</translation>
    </message>
    <message>
        <source>System tools</source>
        <translation>Системные утилиты</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Стандартные</translation>
    </message>
    <message>
        <source>Build tools</source>
        <translation>Средства сборки</translation>
    </message>
    <message>
        <source>Debuggers</source>
        <translation>Отладчики</translation>
    </message>
    <message>
        <source>Development environments</source>
        <translation>Среды разработки</translation>
    </message>
    <message>
        <source>Designers of user interfaces</source>
        <translation>Конструкторы интерфейсов</translation>
    </message>
    <message>
        <source>Profilers</source>
        <translation>Профилировщики</translation>
    </message>
    <message>
        <source>Revision control</source>
        <translation>Управление версиями</translation>
    </message>
    <message>
        <source>Translation tools</source>
        <translation>Средства перевода</translation>
    </message>
    <message>
        <source>Calendars</source>
        <translation>Календари</translation>
    </message>
    <message>
        <source>Address books</source>
        <translation>Адресные книги</translation>
    </message>
    <message>
        <source>Databases</source>
        <translation>Базы данных</translation>
    </message>
    <message>
        <source>Dictionaries</source>
        <translation>Словари</translation>
    </message>
    <message>
        <source>Charts</source>
        <translation>Диаграммы</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>Электронная почта</translation>
    </message>
    <message>
        <source>Finances</source>
        <translation>Финансы</translation>
    </message>
    <message>
        <source>Flow charts</source>
        <translation>Блок-схемы</translation>
    </message>
    <message>
        <source>Handheld devices</source>
        <translation>Карманные устройства</translation>
    </message>
    <message>
        <source>Project management</source>
        <translation>Управление проектами</translation>
    </message>
    <message>
        <source>Presentations</source>
        <translation>Презентации</translation>
    </message>
    <message>
        <source>Spreadsheets</source>
        <translation>Электронные таблицы</translation>
    </message>
    <message>
        <source>Word processors</source>
        <translation>Текстовые процессоры</translation>
    </message>
    <message>
        <source>Two-dimensional graphics</source>
        <translation>Двумерная графика</translation>
    </message>
    <message>
        <source>Vector graphics</source>
        <translation>Векторная графика</translation>
    </message>
    <message>
        <source>Raster graphics</source>
        <translation>Растровая графика</translation>
    </message>
    <message>
        <source>Three-dimensional graphics</source>
        <translation>Трёхмерная графика</translation>
    </message>
    <message>
        <source>Scanning</source>
        <translation>Сканирование</translation>
    </message>
    <message>
        <source>Text recognition</source>
        <translation>Распознавание текста</translation>
    </message>
    <message>
        <source>Photography</source>
        <translation>Фотография</translation>
    </message>
    <message>
        <source>Desktop publishing</source>
        <translation>Настольные издательские системы</translation>
    </message>
    <message>
        <source>Viewers</source>
        <translation>Программы просмотра</translation>
    </message>
    <message>
        <source>Text tools</source>
        <translation>Работа с текстом</translation>
    </message>
    <message>
        <source>Desktop settings</source>
        <translation>Настройки рабочего стола</translation>
    </message>
    <message>
        <source>Hardware settings</source>
        <translation>Настройки оборудования</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>Печать</translation>
    </message>
    <message>
        <source>Package managers</source>
        <translation>Управление пакетами</translation>
    </message>
    <message>
        <source>Dial-up connections</source>
        <translation>Коммутируемые соединения</translation>
    </message>
    <message>
        <source>Instant messaging</source>
        <translation>Мгновенные сообщения</translation>
    </message>
    <message>
        <source>Chat</source>
        <translation>Чат</translation>
    </message>
    <message>
        <source>IRC</source>
        <translation>IRC</translation>
    </message>
    <message>
        <source>News feeds</source>
        <translation>Ленты новостей</translation>
    </message>
    <message>
        <source>File transfer</source>
        <translation>Передача файлов</translation>
    </message>
    <message>
        <source>Amateur radio</source>
        <translation>Любительское радио</translation>
    </message>
    <message>
        <source>Newsgroups</source>
        <translation>Группы новостей</translation>
    </message>
    <message>
        <source>File sharing</source>
        <translation>Обмен файлами</translation>
    </message>
    <message>
        <source>Remote access</source>
        <translation>Удалённый доступ</translation>
    </message>
    <message>
        <source>Telephony</source>
        <translation>Телефония</translation>
    </message>
    <message>
        <source>Telephony tools</source>
        <translation>Средства телефонии</translation>
    </message>
    <message>
        <source>Video conferences</source>
        <translation>Видеоконференции</translation>
    </message>
    <message>
        <source>Web browsers</source>
        <translation>Веб-браузеры</translation>
    </message>
    <message>
        <source>Web development</source>
        <translation>Веб-разработка</translation>
    </message>
    <message>
        <source>MIDI</source>
        <translation>MIDI</translation>
    </message>
    <message>
        <source>Mixers</source>
        <translation>Микшеры</translation>
    </message>
    <message>
        <source>Sequencers</source>
        <translation>Секвенсоры</translation>
    </message>
    <message>
        <source>Tuners</source>
        <translation>Тюнеры</translation>
    </message>
    <message>
        <source>Television</source>
        <translation>Телевидение</translation>
    </message>
    <message>
        <source>Audio and video editing</source>
        <translation>Редактирование аудио и видео</translation>
    </message>
    <message>
        <source>Players</source>
        <translation>Проигрыватели</translation>
    </message>
    <message>
        <source>Recorders</source>
        <translation>Программы записи звука и видео</translation>
    </message>
    <message>
        <source>Disc burning</source>
        <translation>Запись дисков</translation>
    </message>
    <message>
        <source>Action games</source>
        <translation>Экшен-игры</translation>
    </message>
    <message>
        <source>Adventure games</source>
        <translation>Приключенческие игры</translation>
    </message>
    <message>
        <source>Arcade games</source>
        <translation>Аркады</translation>
    </message>
    <message>
        <source>Board games</source>
        <translation>Настольные игры</translation>
    </message>
    <message>
        <source>Falling blocks games</source>
        <translation>Игры с падающими фигурами</translation>
    </message>
    <message>
        <source>Card games</source>
        <translation>Карточные игры</translation>
    </message>
    <message>
        <source>Games for children</source>
        <translation>Игры для детей</translation>
    </message>
    <message>
        <source>Logic games</source>
        <translation>Логические игры</translation>
    </message>
    <message>
        <source>Role-playing games</source>
        <translation>Ролевые игры</translation>
    </message>
    <message>
        <source>Shooters</source>
        <translation>Стрелялки</translation>
    </message>
    <message>
        <source>Simulations</source>
        <translation>Симуляторы</translation>
    </message>
    <message>
        <source>Sports games</source>
        <translation>Спортивные игры</translation>
    </message>
    <message>
        <source>Strategy games</source>
        <translation>Стратегии</translation>
    </message>
    <message>
        <source>Art</source>
        <translation>Искусство</translation>
    </message>
    <message>
        <source>Construction</source>
        <translation>Строительство</translation>
    </message>
    <message>
        <source>Music</source>
        <translation>Музыка</translation>
    </message>
    <message>
        <source>Languages</source>
        <translation>Языки</translation>
    </message>
    <message>
        <source>Artificial intelligence</source>
        <translation>Искусственный интеллект</translation>
    </message>
    <message>
        <source>Astronomy</source>
        <translation>Астрономия</translation>
    </message>
    <message>
        <source>Biology</source>
        <translation>Биология</translation>
    </message>
    <message>
        <source>Chemistry</source>
        <translation>Химия</translation>
    </message>
    <message>
        <source>Computer science</source>
        <translation>Информатика</translation>
    </message>
    <message>
        <source>Data visualization</source>
        <translation>Визуализация данных</translation>
    </message>
    <message>
        <source>Economics</source>
        <translation>Экономика</translation>
    </message>
    <message>
        <source>Electricity</source>
        <translation>Электричество</translation>
    </message>
    <message>
        <source>Geography</source>
        <translation>География</translation>
    </message>
    <message>
        <source>Geology</source>
        <translation>Геология</translation>
    </message>
    <message>
        <source>Earth sciences</source>
        <translation>Науки о Земле</translation>
    </message>
    <message>
        <source>History</source>
        <translation>История</translation>
    </message>
    <message>
        <source>Humanities</source>
        <translation>Гуманитарные науки</translation>
    </message>
    <message>
        <source>Image processing</source>
        <translation>Обработка изображений</translation>
    </message>
    <message>
        <source>Literature</source>
        <translation>Литература</translation>
    </message>
    <message>
        <source>Maps</source>
        <translation>Карты</translation>
    </message>
    <message>
        <source>Mathematics</source>
        <translation>Математика</translation>
    </message>
    <message>
        <source>Numerical analysis</source>
        <translation>Численный анализ</translation>
    </message>
    <message>
        <source>Medicine</source>
        <translation>Медицина</translation>
    </message>
    <message>
        <source>Physics</source>
        <translation>Физика</translation>
    </message>
    <message>
        <source>Robotics</source>
        <translation>Робототехника</translation>
    </message>
    <message>
        <source>Spirituality</source>
        <translation>Духовность</translation>
    </message>
    <message>
        <source>Sports</source>
        <translation>Спорт</translation>
    </message>
    <message>
        <source>Parallel computing</source>
        <translation>Параллельные вычисления</translation>
    </message>
    <message>
        <source>Amusement</source>
        <translation>Развлечения</translation>
    </message>
    <message>
        <source>Archiving</source>
        <translation>Архивация</translation>
    </message>
    <message>
        <source>Compression</source>
        <translation>Сжатие данных</translation>
    </message>
    <message>
        <source>Electronics</source>
        <translation>Электроника</translation>
    </message>
    <message>
        <source>Emulators</source>
        <translation>Эмуляторы</translation>
    </message>
    <message>
        <source>Engineering</source>
        <translation>Инженерное дело</translation>
    </message>
    <message>
        <source>File tools</source>
        <translation>Работа с файлами</translation>
    </message>
    <message>
        <source>File managers</source>
        <translation>Диспетчеры файлов</translation>
    </message>
    <message>
        <source>Terminals</source>
        <translation>Терминалы</translation>
    </message>
    <message>
        <source>File systems</source>
        <translation>Файловые системы</translation>
    </message>
    <message>
        <source>Monitors</source>
        <translation>Системные мониторы</translation>
    </message>
    <message>
        <source>Security</source>
        <translation>Безопасность</translation>
    </message>
    <message>
        <source>Accessibility</source>
        <translation>Специальные возможности</translation>
    </message>
    <message>
        <source>Calculators</source>
        <translation>Калькуляторы</translation>
    </message>
    <message>
        <source>Clocks</source>
        <translation>Часы</translation>
    </message>
    <message>
        <source>Text editors</source>
        <translation>Текстовые редакторы</translation>
    </message>
    <message>
        <source>Documentation</source>
        <translation>Документация</translation>
    </message>
    <message>
        <source>For adults</source>
        <translation>Для взрослых</translation>
    </message>
    <message>
        <source>Core of the desktop</source>
        <translation>Основа рабочей среды</translation>
    </message>
    <message>
        <source>Made with KDE</source>
        <translation>На основе KDE</translation>
    </message>
    <message>
        <source>Made with GNOME</source>
        <translation>На основе GNOME</translation>
    </message>
    <message>
        <source>Made with Xfce</source>
        <translation>На основе Xfce</translation>
    </message>
    <message>
        <source>Made with GTK</source>
        <translation>На основе GTK</translation>
    </message>
    <message>
        <source>Made with Qt</source>
        <translation>На основе Qt</translation>
    </message>
    <message>
        <source>Made with Motif</source>
        <translation>На основе Motif</translation>
    </message>
    <message>
        <source>Made with Java</source>
        <translation>На основе Java</translation>
    </message>
    <message>
        <source>For the console</source>
        <translation>Для консоли</translation>
    </message>
    <message>
        <source>Screen savers</source>
        <translation>Хранители экрана</translation>
    </message>
    <message>
        <source>Icons of the system tray</source>
        <translation>Значки системного лотка</translation>
    </message>
    <message>
        <source>Applets of a panel</source>
        <translation>Апплеты панели</translation>
    </message>
    <message>
        <source>Desktop shells</source>
        <translation>Оболочки рабочей среды</translation>
    </message>
    <message>
        <source>Applications</source>
        <translation>Приложения</translation>
    </message>
</context>
<context>
    <name>VelUI::ChoiceDialog</name>
    <message>
        <source>Filter</source>
        <translation>Фильтр</translation>
    </message>
    <message>
        <source>Type to filter</source>
        <translation>Введите текст для фильтра</translation>
    </message>
    <message>
        <source>Reading...</source>
        <translation>Чтение...</translation>
    </message>
    <message>
        <source>No match</source>
        <translation>Ничего не найдено</translation>
    </message>
    <message numerus="yes">
        <source>%n chosen</source>
        <translation>
            <numerusform>Выбран %n</numerusform>
            <numerusform>Выбрано %n</numerusform>
            <numerusform>Выбрано %n</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::DesktopChooser</name>
    <message>
        <source>Desktop environment</source>
        <translation>Рабочая среда</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Примечание</translation>
    </message>
    <message>
        <source>This session</source>
        <translation>Этот сеанс</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Не зарегистрирована</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsDialog</name>
    <message>
        <source>An action has no id. It can have &quot;%1&quot;.</source>
        <translation>У одного из действий нет идентификатора. Можно использовать «%1».</translation>
    </message>
    <message>
        <source>Two actions have the id &quot;%1&quot;. The second one can have &quot;%2&quot;.</source>
        <translation>У двух действий идентификатор «%1». Второму можно дать «%2».</translation>
    </message>
    <message>
        <source>No entry can hold the id &quot;%1&quot;. It can be &quot;%2&quot;.</source>
        <translation>Запись не может содержать идентификатор «%1». Можно использовать «%2».</translation>
    </message>
    <message>
        <source>The id &quot;%1&quot; should have only A to Z, a to z, 0 to 9 and &quot;-&quot; in it, as &quot;%2&quot; has.</source>
        <translation>Идентификатор «%1» должен содержать только A–Z, a–z, 0–9 и «-», как, например, «%2».</translation>
    </message>
    <message numerus="yes">
        <source>%n more id(s) should be changed.</source>
        <translation>
            <numerusform>Следует изменить ещё %n идентификатор.</numerusform>
            <numerusform>Следует изменить ещё %n идентификатора.</numerusform>
            <numerusform>Следует изменить ещё %n идентификаторов.</numerusform>
        </translation>
    </message>
    <message>
        <source>Use &quot;%1&quot;</source>
        <translation>Использовать «%1»</translation>
    </message>
    <message>
        <source>Use the proposed ids</source>
        <translation>Использовать предложенные идентификаторы</translation>
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
    <name>VelUI::EditStringsDialog</name>
    <message>
        <source>The &quot;;&quot; in &quot;%1&quot; does not separate items, it becomes part of one item.</source>
        <translation>Знак «;» в «%1» не разделяет элементы, а становится частью одного элемента.</translation>
    </message>
    <message numerus="yes">
        <source>Make %n item(s) of it</source>
        <translation>
            <numerusform>Сделать из этого %n элемент</numerusform>
            <numerusform>Сделать из этого %n элемента</numerusform>
            <numerusform>Сделать из этого %n элементов</numerusform>
        </translation>
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
    <name>VelUI::EntryFormAssistance</name>
    <message>
        <source>Te&amp;xt</source>
        <comment>button: shows the file of the entry</comment>
        <translation>Те&amp;кст</translation>
    </message>
    <message>
        <source>Shows the file as it would be saved</source>
        <translation>Показывает файл таким, каким он будет сохранён</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryTextDialog</name>
    <message>
        <source>Text of the entry</source>
        <translation>Текст записи</translation>
    </message>
    <message>
        <source>The file as it would be saved</source>
        <translation>Файл таким, каким он будет сохранён</translation>
    </message>
    <message>
        <source>Nothing is changed.</source>
        <translation>Ничего не изменено.</translation>
    </message>
    <message>
        <source>≠ changed lines: %1, + new lines: %2, removed lines: %3</source>
        <translation>≠ изменённые строки: %1, + новые строки: %2, удалённые строки: %3</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldChoosers</name>
    <message>
        <source>Choose %1</source>
        <comment>name of a &quot;Choose...&quot; button</comment>
        <translation>Выбрать: %1</translation>
    </message>
    <message>
        <source>Choose...</source>
        <translation>Выбрать...</translation>
    </message>
    <message>
        <source>Chooses from all that are known (Alt+Down)</source>
        <translation>Выбор из всего, что известно (Alt+Down)</translation>
    </message>
    <message>
        <source>Chooses an installed program (Alt+Down)</source>
        <translation>Выбор установленной программы (Alt+Down)</translation>
    </message>
    <message>
        <source>Insert</source>
        <comment>button: a field code</comment>
        <translation>Вставить</translation>
    </message>
    <message>
        <source>Insert a field code</source>
        <translation>Вставить код поля</translation>
    </message>
    <message>
        <source>Inserts a code that stands for the files to open, or for a part of this entry</source>
        <translation>Вставляет код, который обозначает открываемые файлы или часть этой записи</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldCodes</name>
    <message>
        <source>%f: one file; for several files the program is started several times</source>
        <translation>%f: один файл; для нескольких файлов программа запускается несколько раз</translation>
    </message>
    <message>
        <source>%F: all files, each as a word of its own</source>
        <translation>%F: все файлы, каждый отдельным словом</translation>
    </message>
    <message>
        <source>%u: one address (URL) or file; for several the program is started several times</source>
        <translation>%u: один адрес (URL) или файл; для нескольких программа запускается несколько раз</translation>
    </message>
    <message>
        <source>%U: all addresses (URLs) or files, each as a word of its own</source>
        <translation>%U: все адреса (URL) или файлы, каждый отдельным словом</translation>
    </message>
    <message>
        <source>%i: --icon and the icon of this entry, if it has one</source>
        <translation>%i: --icon и значок этой записи, если он есть</translation>
    </message>
    <message>
        <source>%c: the name of this entry, translated</source>
        <translation>%c: имя этой записи в переводе</translation>
    </message>
    <message>
        <source>%k: where the file of this entry lies</source>
        <translation>%k: где лежит файл этой записи</translation>
    </message>
    <message>
        <source>%%: a percent sign</source>
        <translation>%%: знак процента</translation>
    </message>
</context>
<context>
    <name>VelUI::FindingLine</name>
    <message>
        <source>Fix</source>
        <translation>Исправить</translation>
    </message>
    <message>
        <source>Fix: %1</source>
        <comment>on a button; %1 is what it does</comment>
        <translation>Исправить: %1</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>how bad something is, and what it is</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Ошибка</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Предупреждение</translation>
    </message>
    <message>
        <source>Hint</source>
        <translation>Замечание</translation>
    </message>
</context>
<context>
    <name>VelUI::FormFindings</name>
    <message>
        <source>%1: %2</source>
        <comment>a key or an action of an entry, and what is wrong with it</comment>
        <translation>%1: %2</translation>
    </message>
</context>
<context>
    <name>VelUI::FormHistory</name>
    <message>
        <source>Undo change of %1</source>
        <translation>Отменить изменение: %1</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Отменить</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Повторить изменение: %1</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Повторить</translation>
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
    <name>VelUI::LanguageBar</name>
    <message>
        <source>&amp;Language:</source>
        <translation>&amp;Язык:</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Язык</translation>
    </message>
    <message>
        <source>Another language...</source>
        <translation>Другой язык...</translation>
    </message>
    <message>
        <source>Another language</source>
        <translation>Другой язык</translation>
    </message>
    <message>
        <source>Unknown language</source>
        <translation>Неизвестный язык</translation>
    </message>
    <message>
        <source>%1 (%2), yours: %3 of %4 texts</source>
        <translation>%1 (%2), ваш: текстов %3 из %4</translation>
    </message>
    <message>
        <source>%1 (%2), yours: no text yet</source>
        <translation>%1 (%2), ваш: текстов пока нет</translation>
    </message>
    <message>
        <source>%1 (%2): %3 of %4 texts</source>
        <translation>%1 (%2): текстов %3 из %4</translation>
    </message>
    <message>
        <source>%1 (%2): no text yet</source>
        <translation>%1 (%2): текстов пока нет</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageDialog</name>
    <message>
        <source>Another language</source>
        <translation>Другой язык</translation>
    </message>
    <message>
        <source>&amp;Language or its code, such as pt_BR:</source>
        <translation>&amp;Язык или его код, например pt_BR:</translation>
    </message>
    <message>
        <source>Language or its code</source>
        <translation>Язык или его код</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>a language and its code</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>No language has such a code: it is like de, pt_BR or sr@latin.</source>
        <translation>Такого кода нет ни у одного языка: код выглядит как de, pt_BR или sr@latin.</translation>
    </message>
    <message>
        <source>The code %1 is well-formed, but no language of this name is known.</source>
        <translation>Код %1 составлен правильно, но язык с таким именем неизвестен.</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeChooser</name>
    <message>
        <source>Choose MIME types</source>
        <translation>Выбор типов MIME</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeSource</name>
    <message>
        <source>MIME type</source>
        <translation>Тип MIME</translation>
    </message>
    <message>
        <source>Description</source>
        <translation>Описание</translation>
    </message>
    <message>
        <source>File names</source>
        <translation>Имена файлов</translation>
    </message>
    <message>
        <source>Not in the database</source>
        <translation>Нет в базе данных</translation>
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
<context>
    <name>VelUI::ProgramChooser</name>
    <message>
        <source>Choose a program</source>
        <translation>Выбор программы</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramSource</name>
    <message>
        <source>Program</source>
        <comment>title of a column</comment>
        <translation>Программа</translation>
    </message>
    <message>
        <source>Folder</source>
        <comment>title of a column</comment>
        <translation>Папка</translation>
    </message>
</context>
<context>
    <name>VelUI::RowFindings</name>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>И ещё %n.</numerusform>
            <numerusform>И ещё %n.</numerusform>
            <numerusform>И ещё %n.</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::TrialLine</name>
    <message>
        <source>Stop</source>
        <comment>button: ends the trial of an entry</comment>
        <translation>Остановить</translation>
    </message>
    <message>
        <source>T&amp;ry</source>
        <comment>button: runs the entry</comment>
        <translation>Опро&amp;бовать</translation>
    </message>
    <message>
        <source>Stops the trial</source>
        <translation>Останавливает пробный запуск</translation>
    </message>
    <message>
        <source>Runs the entry as it is now, without saving it</source>
        <translation>Запускает запись такой, какая она сейчас, не сохраняя её</translation>
    </message>
    <message>
        <source>The program vel-open, which runs entries, could not be started: %1</source>
        <translation>Не удалось запустить программу vel-open, которая выполняет записи: %1</translation>
    </message>
    <message>
        <source>The trial was stopped.</source>
        <translation>Пробный запуск остановлен.</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0).</source>
        <translation>Запись запущена (код завершения 0).</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0): %1</source>
        <translation>Запись запущена (код завершения 0): %1</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1).</source>
        <translation>Не удалось запустить запись (код завершения %1).</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1): %2</source>
        <translation>Не удалось запустить запись (код завершения %1): %2</translation>
    </message>
</context>
</TS>

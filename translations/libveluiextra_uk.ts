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
    <name>ClashLine</name>
    <message>
        <source>Go to</source>
        <translation>Перейти</translation>
    </message>
    <message>
        <source>Go to action &apos;%1&apos;</source>
        <translation>Перейти до дії «%1»</translation>
    </message>
    <message>
        <source>Take over</source>
        <translation>Забрати</translation>
    </message>
    <message>
        <source>Take over &apos;%1&apos; from action &apos;%2&apos;</source>
        <translation>Забрати «%1» у дії «%2»</translation>
    </message>
    <message>
        <source>Further clashes: %1</source>
        <translation>Інші конфлікти: %1</translation>
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
    <name>EditShortcutsAssistance</name>
    <message>
        <source>Schemes</source>
        <translation>Схеми</translation>
    </message>
    <message>
        <source>No action matches the filter.</source>
        <translation>Жодна дія не відповідає фільтру.</translation>
    </message>
    <message>
        <source>No action has the shortcut %1.</source>
        <translation>Жодна дія не має скорочення %1.</translation>
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
    <name>EntryCheck</name>
    <message>
        <source>The condition &apos;%1&apos; needs a file.</source>
        <translation>Умова «%1» потребує файла.</translation>
    </message>
    <message>
        <source>The file of the condition &apos;%1&apos; is one in the folder of settings, without &apos;/&apos; before it.</source>
        <translation>Файл умови «%1» вказують відносно теки параметрів, без «/» на початку.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a key.</source>
        <translation>Умова «%1» потребує ключа.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs &apos;if-session&apos; or &apos;unless-session&apos; and a session.</source>
        <translation>Умова «%1» потребує «if-session» або «unless-session» і сеансу.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a schema and a key.</source>
        <translation>Умова «%1» потребує схеми і ключа.</translation>
    </message>
    <message>
        <source>There is no condition &apos;%1&apos;.</source>
        <translation>Умови «%1» не існує.</translation>
    </message>
    <message>
        <source>A category is empty.</source>
        <translation>Одна з категорій порожня.</translation>
    </message>
    <message>
        <source>There is no registered category &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Серед зареєстрованих категорій немає «%1»; власна має починатися з «X-».</translation>
    </message>
    <message>
        <source>Change it to &apos;%1&apos;</source>
        <translation>Змінити на «%1»</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; also needs: %2.</source>
        <translation>Категорія «%1» потребує також: %2.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; goes with one of these: %2.</source>
        <translation>Категорію «%1» вживають з однією з таких: %2.</translation>
    </message>
    <message>
        <source>Add &apos;%1&apos;</source>
        <translation>Додати «%1»</translation>
    </message>
    <message>
        <source>Remove it</source>
        <translation>Прибрати</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is out of use.</source>
        <translation>Категорія «%1» вийшла з ужитку.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is only for entries that list desktops in &apos;Only show in&apos;.</source>
        <translation>Категорія «%1» призначена лише для записів, у яких у полі «Показувати лише у» перелічено середовища.</translation>
    </message>
    <message>
        <source>No main category is among them, so menus may not know where to show the entry.</source>
        <translation>Серед них немає жодної основної категорії, тож меню можуть не знати, де показувати запис.</translation>
    </message>
    <message>
        <source>Several main categories are among them, so the entry may be shown more than once.</source>
        <translation>Серед них кілька основних категорій, тож запис може з&apos;явитися більше одного разу.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; stands more than once.</source>
        <translation>«%1» трапляється більше одного разу.</translation>
    </message>
    <message>
        <source>Keep the first</source>
        <translation>Залишити перше</translation>
    </message>
    <message>
        <source>The application has no command.</source>
        <translation>Програма не має команди.</translation>
    </message>
    <message>
        <source>The link leads nowhere.</source>
        <translation>Посилання нікуди не веде.</translation>
    </message>
    <message>
        <source>A quote is not closed.</source>
        <translation>Лапки не закрито.</translation>
    </message>
    <message>
        <source>In quotes, a backslash has to stand before &apos;%1&apos;.</source>
        <translation>У лапках перед «%1» має стояти зворотна скісна риска.</translation>
    </message>
    <message>
        <source>The command ends in a single backslash, which stands for nothing.</source>
        <translation>Команда закінчується одиночною зворотною скісною рискою, яка нічого не позначає.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to stand in double quotes.</source>
        <translation>«%1» має стояти у подвійних лапках.</translation>
    </message>
    <message>
        <source>Close the quote</source>
        <translation>Закрити лапки</translation>
    </message>
    <message>
        <source>Put it in quotes</source>
        <translation>Взяти в лапки</translation>
    </message>
    <message>
        <source>Have a shell run it</source>
        <translation>Виконувати через оболонку</translation>
    </message>
    <message>
        <source>Write &apos;%&apos; as &apos;%%&apos;</source>
        <translation>Написати «%» як «%%»</translation>
    </message>
    <message>
        <source>A field code is not complete: &apos;%&apos; ends the command.</source>
        <translation>Неповний код поля: команда закінчується на «%».</translation>
    </message>
    <message>
        <source>There is no field code &apos;%%1&apos;.</source>
        <translation>Коду поля «%%1» не існує.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; is out of use; nothing is put in its place.</source>
        <translation>Код поля «%%1» вийшов з ужитку; замість нього нічого не підставляється.</translation>
    </message>
    <message>
        <source>Only one of &apos;%f&apos;, &apos;%F&apos;, &apos;%u&apos; and &apos;%U&apos; may stand in a command, and once.</source>
        <translation>У команді може стояти лише один з кодів «%f», «%F», «%u» і «%U», і лише один раз.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; stands more than once.</source>
        <translation>Код поля «%%1» трапляється більше одного разу.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; has to be an argument of its own, not in quotes.</source>
        <translation>Код поля «%%1» має бути окремим аргументом, не в лапках.</translation>
    </message>
    <message>
        <source>The path of the program has a blank: it has to stand in quotes.</source>
        <translation>У шляху до програми є пробіл: шлях має стояти в лапках.</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;.</source>
        <translation>Програми «%1» немає.</translation>
    </message>
    <message>
        <source>The command has to begin with a program.</source>
        <translation>Команда має починатися з програми.</translation>
    </message>
    <message>
        <source>&apos;Try exec&apos; takes the program alone, without quotes and arguments.</source>
        <translation>У полі «Команда перевірки» вказують лише програму, без лапок і аргументів.</translation>
    </message>
    <message>
        <source>Keep the program</source>
        <translation>Залишити програму</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;, so the entry is not shown.</source>
        <translation>Програми «%1» немає, тому запис не показується.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is missing.</source>
        <translation>Бракує «%1».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has translations only, and nothing for all other languages.</source>
        <translation>«%1» має лише переклади і нічого для всіх інших мов.</translation>
    </message>
    <message>
        <source>Take &apos;%1&apos;</source>
        <translation>Взяти «%1»</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is only for entries of the type &apos;%2&apos;.</source>
        <translation>«%1» — лише для записів типу «%2».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here.</source>
        <translation>«%1» тут більше не вживається.</translation>
    </message>
    <message>
        <source>No key can be called &apos;%1&apos;.</source>
        <translation>Ключ не може називатися «%1».</translation>
    </message>
    <message>
        <source>There is no key &apos;%1&apos; here; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Ключа «%1» тут не буває; власний має починатися з «X-».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; cannot be translated.</source>
        <translation>«%1» не можна перекласти.</translation>
    </message>
    <message>
        <source>&apos;Only show in&apos; and &apos;Not show in&apos; exclude each other.</source>
        <translation>«Показувати лише у» і «Не показувати у» виключають одне одного.</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>Файл порожній.</translation>
    </message>
    <message>
        <source>The first group of the file is not &apos;[Desktop Entry]&apos;.</source>
        <translation>Перша група файла — не «[Desktop Entry]».</translation>
    </message>
    <message>
        <source>The name of the file has to end in &apos;.%1&apos;.</source>
        <translation>Назва файла має закінчуватися на «.%1».</translation>
    </message>
    <message>
        <source>Lines of the file end in a carriage return.</source>
        <translation>Рядки файла закінчуються поверненням каретки.</translation>
    </message>
    <message>
        <source>A line of the file says nothing: %1</source>
        <translation>Рядок файла нічого не означає: %1</translation>
    </message>
    <message>
        <source>A line of the file stands before all groups: %1</source>
        <translation>Рядок файла стоїть перед усіма групами: %1</translation>
    </message>
    <message>
        <source>A line of the file begins with a blank: %1</source>
        <translation>Рядок файла починається з пробілу: %1</translation>
    </message>
    <message>
        <source>A blank stands behind a group: %1</source>
        <translation>Після групи стоїть пробіл: %1</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; stands more than once.</source>
        <translation>Група «%1» трапляється більше одного разу.</translation>
    </message>
    <message>
        <source>No group can be called &apos;%1&apos;.</source>
        <translation>Група не може називатися «%1».</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; is out of use.</source>
        <translation>Група «%1» вийшла з ужитку.</translation>
    </message>
    <message>
        <source>There is no group &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Групи «%1» не буває; власна має починатися з «X-».</translation>
    </message>
    <message>
        <source>The id &apos;%1&apos; of an action may only have letters A to Z, digits and &apos;-&apos;.</source>
        <translation>Ідентифікатор дії «%1» може містити лише літери від A до Z, цифри і «-».</translation>
    </message>
    <message>
        <source>The action &apos;%1&apos; is described, but &apos;Actions&apos; does not name it.</source>
        <translation>Дію «%1» описано, але не названо в полі «Actions».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has no &apos;/&apos;.</source>
        <translation>«%1» — не тип MIME: немає «/».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: nothing stands behind the &apos;/&apos;.</source>
        <translation>«%1» — не тип MIME: після «/» нічого немає.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: there is no kind &apos;%2&apos;.</source>
        <translation>«%1» — не тип MIME: виду «%2» не існує.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has a character that none has.</source>
        <translation>«%1» — не тип MIME: є неприпустимий символ.</translation>
    </message>
    <message>
        <source>MIME types like &apos;%1&apos; are not used for files.</source>
        <translation>Типи MIME на зразок «%1» для файлів не використовуються.</translation>
    </message>
    <message>
        <source>This computer does not know the MIME type &apos;%1&apos;.</source>
        <translation>На цьому комп&apos;ютері тип MIME «%1» невідомий.</translation>
    </message>
    <message>
        <source>An action has no id.</source>
        <translation>Одна з дій не має ідентифікатора.</translation>
    </message>
    <message>
        <source>Nothing says what the action &apos;%1&apos; is.</source>
        <translation>Ніде не сказано, чим є дія «%1».</translation>
    </message>
    <message>
        <source>There is no registered desktop &apos;%1&apos;; others have to begin with &apos;X-&apos;.</source>
        <translation>Серед зареєстрованих середовищ немає «%1»; інші мають починатися з «X-».</translation>
    </message>
    <message>
        <source>In your language the entry is shown as &apos;%1&apos;.</source>
        <translation>Вашою мовою запис показується як «%1».</translation>
    </message>
    <message>
        <source>The comment says no more than the name.</source>
        <translation>Коментар говорить не більше, ніж назва.</translation>
    </message>
    <message>
        <source>The comment says no more than the generic name.</source>
        <translation>Коментар говорить не більше, ніж загальна назва.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here; it has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>«%1» тут більше не вживається; має бути «true» або «false».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>Значенням «%1» має бути «true» або «false».</translation>
    </message>
    <message>
        <source>Change it to &apos;true&apos;</source>
        <translation>Змінити на «true»</translation>
    </message>
    <message>
        <source>The name of an icon has no suffix like &apos;%1&apos;.</source>
        <translation>Назва піктограми не має суфікса на зразок «%1».</translation>
    </message>
    <message>
        <source>Remove the suffix</source>
        <translation>Прибрати суфікс</translation>
    </message>
    <message>
        <source>No icon theme has an icon &apos;%1&apos;.</source>
        <translation>Жодна тема піктограм не має піктограми «%1».</translation>
    </message>
    <message>
        <source>Write the folder in full</source>
        <translation>Написати теку повністю</translation>
    </message>
    <message>
        <source>The address does not say how to reach it, as &apos;https:&apos; and &apos;file:&apos; do.</source>
        <translation>Адреса не каже, як до неї звернутися, — як це роблять «https:» і «file:».</translation>
    </message>
    <message>
        <source>The text is not encoded in UTF-8.</source>
        <translation>Текст не в кодуванні UTF-8.</translation>
    </message>
    <message>
        <source>A control character or tab may not stand here.</source>
        <translation>Керівний символ або табуляція тут неприпустимі.</translation>
    </message>
    <message>
        <source>The type has to be &apos;Application&apos;, &apos;Link&apos; or &apos;Directory&apos;, not &apos;%1&apos;.</source>
        <translation>Тип має бути «Application», «Link» або «Directory», а не «%1».</translation>
    </message>
    <message>
        <source>There is no version &apos;%1&apos; of the standard.</source>
        <translation>Версії «%1» стандарту не існує.</translation>
    </message>
    <message>
        <source>There is no encoding &apos;%1&apos;.</source>
        <translation>Кодування «%1» не існує.</translation>
    </message>
    <message>
        <source>There is no picture &apos;%1&apos;.</source>
        <translation>Зображення «%1» немає.</translation>
    </message>
    <message>
        <source>An icon has a name or a path that begins with &apos;/&apos;.</source>
        <translation>Піктограма повинна мати назву або шлях, що починається з «/».</translation>
    </message>
    <message>
        <source>The path of a folder begins with &apos;/&apos;.</source>
        <translation>Шлях до теки починається з «/».</translation>
    </message>
    <message>
        <source>There is no folder &apos;%1&apos;.</source>
        <translation>Теки «%1» немає.</translation>
    </message>
    <message>
        <source>There is no file &apos;%1&apos;.</source>
        <translation>Файла «%1» немає.</translation>
    </message>
    <message>
        <source>D-Bus cannot start &apos;%1&apos;: a file of a name like &apos;org.example.Program.desktop&apos; is needed.</source>
        <translation>D-Bus не може запустити «%1»: потрібен файл з назвою на зразок «org.example.Program.desktop».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no name of an interface; such names are like &apos;org.example.Viewer&apos;.</source>
        <translation>«%1» — не назва інтерфейсу; такі назви мають вигляд «org.example.Viewer».</translation>
    </message>
</context>
<context>
    <name>EntryTrial</name>
    <message>
        <source>The entry could not be written to a temporary file.</source>
        <translation>Не вдалося зберегти запис до тимчасового файла.</translation>
    </message>
</context>
<context>
    <name>KeyAssistance</name>
    <message>
        <source>Press the keys of the shortcut. Tab leaves the field.</source>
        <translation>Натисніть клавіші скорочення. Tab виходить із поля.</translation>
    </message>
    <message>
        <source>Key for action &apos;%1&apos;</source>
        <translation>Клавіша для дії «%1»</translation>
    </message>
    <message>
        <source>None: no key for action &apos;%1&apos;</source>
        <translation>Немає: дія «%1» не матиме клавіші</translation>
    </message>
    <message>
        <source>What speaks against the key for action &apos;%1&apos;</source>
        <translation>Що заважає скороченню дії «%1»</translation>
    </message>
</context>
<context>
    <name>KeyDescription</name>
    <message>
        <source>Whether the entry starts a program, opens an address or describes a folder of the menu.</source>
        <translation>Чи запис запускає програму, відкриває адресу або описує теку меню.</translation>
    </message>
    <message>
        <source>The name that menus show.</source>
        <translation>Назва, яку показують меню.</translation>
    </message>
    <message>
        <source>The icon that menus show: a name from the icon theme, or the full path of a picture.</source>
        <translation>Піктограма, яку показують меню: назва з теми піктограм або повний шлях до зображення.</translation>
    </message>
    <message>
        <source>The command that starts the program, with codes such as %f for the files that it opens.</source>
        <translation>Команда, що запускає програму, з кодами на зразок %f для файлів, які вона відкриває.</translation>
    </message>
    <message>
        <source>Whether the program needs a terminal window.</source>
        <translation>Чи потребує програма вікна термінала.</translation>
    </message>
    <message>
        <source>The folder in which the program starts.</source>
        <translation>Тека, у якій запускається програма.</translation>
    </message>
    <message>
        <source>A program that has to be installed; without it menus leave the entry out.</source>
        <translation>Програма, яку має бути встановлено; без неї меню пропускають запис.</translation>
    </message>
    <message>
        <source>The address that the entry opens.</source>
        <translation>Адреса, яку відкриває запис.</translation>
    </message>
    <message>
        <source>What kind of program it is, such as: Web browser.</source>
        <translation>Що це за програма, наприклад: браузер.</translation>
    </message>
    <message>
        <source>A sentence about the program, which menus show as a tip.</source>
        <translation>Речення про програму, яке меню показують як підказку.</translation>
    </message>
    <message>
        <source>Whether menus leave the entry out although the program can be used.</source>
        <translation>Чи пропускають меню запис, хоча програмою можна користуватися.</translation>
    </message>
    <message>
        <source>Whether the entry counts as deleted.</source>
        <translation>Чи вважається запис вилученим.</translation>
    </message>
    <message>
        <source>The desktop environments that alone show the entry; none means all.</source>
        <translation>Стільничні середовища, лише в яких показується запис; якщо не вказано — в усіх.</translation>
    </message>
    <message>
        <source>The desktop environments that do not show the entry.</source>
        <translation>Стільничні середовища, у яких запис не показується.</translation>
    </message>
    <message>
        <source>The types of files that the program opens.</source>
        <translation>Типи файлів, які відкриває програма.</translation>
    </message>
    <message>
        <source>The groups of the menu that the program belongs to.</source>
        <translation>Групи меню, до яких належить програма.</translation>
    </message>
    <message>
        <source>Words by which a search finds the program beside its name.</source>
        <translation>Слова, за якими пошук знаходить програму, крім її назви.</translation>
    </message>
    <message>
        <source>Whether the program tells when it has started, so that the pointer shows it until then.</source>
        <translation>Чи повідомляє програма про завершення запуску; доти вказівник показує, що вона запускається.</translation>
    </message>
    <message>
        <source>The class of the window by which the desktop knows that the program has started.</source>
        <translation>Клас вікна, за яким стільничне середовище дізнається, що програма запустилася.</translation>
    </message>
    <message>
        <source>Further things that the program can be started for, such as: New window.</source>
        <translation>Інші дії, для яких можна запустити програму, наприклад: нове вікно.</translation>
    </message>
    <message>
        <source>The version of the standard for entries that this one follows.</source>
        <translation>Версія стандарту записів, якої дотримується цей запис.</translation>
    </message>
    <message>
        <source>%1 Only for users of one language.</source>
        <comment>%1 is a sentence about a key</comment>
        <translation>%1 Лише для користувачів однієї мови.</translation>
    </message>
</context>
<context>
    <name>LanguageNote</name>
    <message>
        <source>Users of %1 see these texts.</source>
        <translation>Користувачі з мовою «%1» бачать ці тексти.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those of %2 where one is missing.</source>
        <translation>Користувачі з мовою «%1» бачать ці тексти, а де якогось бракує — тексти мови «%2».</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those without a language where one is missing.</source>
        <translation>Користувачі з мовою «%1» бачать ці тексти, а де якогось бракує — тексти без мови.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts of %2.</source>
        <translation>Користувачі з мовою «%1» бачать тексти мови «%2».</translation>
    </message>
    <message>
        <source>Users of %1 see the texts without a language.</source>
        <translation>Користувачі з мовою «%1» бачать тексти без мови.</translation>
    </message>
    <message>
        <source>%1 Texts of their own have: %2.</source>
        <comment>%1 is a sentence, %2 a list of languages</comment>
        <translation>%1 Власні тексти мають мови: %2.</translation>
    </message>
</context>
<context>
    <name>MenuDeletion</name>
    <message>
        <source>There is no trash for %1. It would be deleted for good: this cannot be undone. Delete it?</source>
        <translation>Для %1 немає смітника. Вилучення буде остаточним, його не можна скасувати. Вилучити?</translation>
    </message>
    <message numerus="yes">
        <source>There is no trash for %n of these items. They would be deleted for good: this cannot be undone. Delete them?</source>
        <translation>
            <numerusform>Для %n з цих об&apos;єктів немає смітника. Вилучення буде остаточним, його не можна скасувати. Вилучити?</numerusform>
            <numerusform>Для %n з цих об&apos;єктів немає смітника. Вилучення буде остаточним, його не можна скасувати. Вилучити?</numerusform>
            <numerusform>Для %n з цих об&apos;єктів немає смітника. Вилучення буде остаточним, його не можна скасувати. Вилучити?</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 cannot be deleted: %2</source>
        <translation>Не вдалося вилучити %1: %2</translation>
    </message>
    <message numerus="yes">
        <source>The deletion was canceled. %n items are still there, in whole or in part.</source>
        <translation>
            <numerusform>Вилучення перервано. Повністю або частково лишився %n об&apos;єкт.</numerusform>
            <numerusform>Вилучення перервано. Повністю або частково лишилися %n об&apos;єкти.</numerusform>
            <numerusform>Вилучення перервано. Повністю або частково лишилося %n об&apos;єктів.</numerusform>
        </translation>
    </message>
    <message>
        <source>The deletion was canceled. Still there, in whole or in part: %1.</source>
        <translation>Вилучення перервано. Повністю або частково лишилося: %1.</translation>
    </message>
</context>
<context>
    <name>MenuDrop</name>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;. Keep both gives the new one another file name, Replace puts the old one into the trash, Skip leaves the new one where it is; Cancel leaves everything as it is.</source>
        <translation>У теці «%1» вже є «%2». «Залишити обидва» дасть новому об&apos;єкту іншу назву файла, «Замінити» перемістить старий до смітника, «Пропустити» залишить новий на попередньому місці; «Скасувати» залишить усе як є.</translation>
    </message>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;, which the new one comes from. Keep both gives the new one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>У теці «%1» вже є «%2», від якого походить новий об&apos;єкт. «Залишити обидва» дасть новому іншу назву файла, «Пропустити» залишить його на попередньому місці; «Скасувати» залишить усе як є.</translation>
    </message>
    <message>
        <source>Another one that comes to the folder &apos;%1&apos; has the same file name as &apos;%2&apos;. Keep both gives this one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>Інший об&apos;єкт, який потрапляє до теки «%1», має таку саму назву файла, як «%2». «Залишити обидва» дасть цьому об&apos;єкту іншу назву файла, «Пропустити» залишить його на попередньому місці; «Скасувати» залишить усе як є.</translation>
    </message>
    <message>
        <source>Name already taken</source>
        <translation>Назву вже зайнято</translation>
    </message>
    <message>
        <source>&amp;Keep both</source>
        <translation>Залишити &amp;обидва</translation>
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
        <source>&amp;Do the same with all further ones</source>
        <translation>Так само чинити з &amp;усіма наступними</translation>
    </message>
</context>
<context>
    <name>MenuHistory</name>
    <message>
        <source>Undo</source>
        <translation>Скасувати</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Повторити</translation>
    </message>
    <message>
        <source>Done: %1</source>
        <translation>Готово: %1</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Пересування файлів...</translation>
    </message>
    <message>
        <source>Nothing was undone: %1</source>
        <translation>Нічого не скасовано: %1</translation>
    </message>
    <message>
        <source>Nothing was done again: %1</source>
        <translation>Нічого не повторено: %1</translation>
    </message>
    <message>
        <source>%1 is not there any more.</source>
        <translation>%1 більше немає.</translation>
    </message>
    <message>
        <source>There is another %1 by now.</source>
        <translation>Тепер є інший об&apos;єкт %1.</translation>
    </message>
    <message>
        <source>%1 was changed by another program.</source>
        <translation>%1: об&apos;єкт змінено іншою програмою.</translation>
    </message>
    <message>
        <source>%1 is not in the trash any more.</source>
        <translation>%1 більше немає у смітнику.</translation>
    </message>
    <message>
        <source>%1 cannot be put into the trash.</source>
        <translation>Не вдалося перемістити %1 до смітника.</translation>
    </message>
    <message>
        <source>It was canceled.</source>
        <translation>Операцію перервано.</translation>
    </message>
    <message>
        <source>%1 cannot be changed: %2</source>
        <translation>Не вдалося змінити %1: %2</translation>
    </message>
    <message>
        <source>Undo creation of %1</source>
        <translation>Скасувати створення: %1</translation>
    </message>
    <message>
        <source>Redo creation of %1</source>
        <translation>Повторити створення: %1</translation>
    </message>
    <message>
        <source>%1 was created.</source>
        <translation>Створено: %1.</translation>
    </message>
    <message>
        <source>Undo change of %1</source>
        <translation>Скасувати зміну: %1</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Повторити зміну: %1</translation>
    </message>
    <message>
        <source>%1 was changed.</source>
        <translation>Змінено: %1.</translation>
    </message>
    <message>
        <source>Undo deletion of %1</source>
        <translation>Скасувати вилучення: %1</translation>
    </message>
    <message>
        <source>Redo deletion of %1</source>
        <translation>Повторити вилучення: %1</translation>
    </message>
    <message>
        <source>%1 was deleted.</source>
        <translation>Вилучено: %1.</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Скасувати вилучення теки %1 (%n запис)</numerusform>
            <numerusform>Скасувати вилучення теки %1 (%n записи)</numerusform>
            <numerusform>Скасувати вилучення теки %1 (%n записів)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Повторити вилучення теки %1 (%n запис)</numerusform>
            <numerusform>Повторити вилучення теки %1 (%n записи)</numerusform>
            <numerusform>Повторити вилучення теки %1 (%n записів)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The folder %1 was deleted (%n entries).</source>
        <translation>
            <numerusform>Теку %1 вилучено (%n запис).</numerusform>
            <numerusform>Теку %1 вилучено (%n записи).</numerusform>
            <numerusform>Теку %1 вилучено (%n записів).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %n items</source>
        <translation>
            <numerusform>Скасувати вилучення %n об&apos;єкта</numerusform>
            <numerusform>Скасувати вилучення %n об&apos;єктів</numerusform>
            <numerusform>Скасувати вилучення %n об&apos;єктів</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %n items</source>
        <translation>
            <numerusform>Повторити вилучення %n об&apos;єкта</numerusform>
            <numerusform>Повторити вилучення %n об&apos;єктів</numerusform>
            <numerusform>Повторити вилучення %n об&apos;єктів</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were deleted.</source>
        <translation>
            <numerusform>Вилучено %n об&apos;єкт.</numerusform>
            <numerusform>Вилучено %n об&apos;єкти.</numerusform>
            <numerusform>Вилучено %n об&apos;єктів.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo moving of %1 to %2</source>
        <translation>Скасувати пересування %1 до %2</translation>
    </message>
    <message>
        <source>Redo moving of %1 to %2</source>
        <translation>Повторити пересування %1 до %2</translation>
    </message>
    <message>
        <source>%1 was moved to %2.</source>
        <translation>Пересунуто: %1 до %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo moving of %n items to %2</source>
        <translation>
            <numerusform>Скасувати пересування %n об&apos;єкта до %2</numerusform>
            <numerusform>Скасувати пересування %n об&apos;єктів до %2</numerusform>
            <numerusform>Скасувати пересування %n об&apos;єктів до %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo moving of %n items to %2</source>
        <translation>
            <numerusform>Повторити пересування %n об&apos;єкта до %2</numerusform>
            <numerusform>Повторити пересування %n об&apos;єктів до %2</numerusform>
            <numerusform>Повторити пересування %n об&apos;єктів до %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were moved to %2.</source>
        <translation>
            <numerusform>Пересунуто %n об&apos;єкт до %2.</numerusform>
            <numerusform>Пересунуто %n об&apos;єкти до %2.</numerusform>
            <numerusform>Пересунуто %n об&apos;єктів до %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo copying of %1 to %2</source>
        <translation>Скасувати копіювання %1 до %2</translation>
    </message>
    <message>
        <source>Redo copying of %1 to %2</source>
        <translation>Повторити копіювання %1 до %2</translation>
    </message>
    <message>
        <source>%1 was copied to %2.</source>
        <translation>Скопійовано: %1 до %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo copying of %n items to %2</source>
        <translation>
            <numerusform>Скасувати копіювання %n об&apos;єкта до %2</numerusform>
            <numerusform>Скасувати копіювання %n об&apos;єктів до %2</numerusform>
            <numerusform>Скасувати копіювання %n об&apos;єктів до %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo copying of %n items to %2</source>
        <translation>
            <numerusform>Повторити копіювання %n об&apos;єкта до %2</numerusform>
            <numerusform>Повторити копіювання %n об&apos;єктів до %2</numerusform>
            <numerusform>Повторити копіювання %n об&apos;єктів до %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were copied to %2.</source>
        <translation>
            <numerusform>Скопійовано %n об&apos;єкт до %2.</numerusform>
            <numerusform>Скопійовано %n об&apos;єкти до %2.</numerusform>
            <numerusform>Скопійовано %n об&apos;єктів до %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo reordering of %1</source>
        <translation>Скасувати перевпорядкування: %1</translation>
    </message>
    <message>
        <source>Redo reordering of %1</source>
        <translation>Повторити перевпорядкування: %1</translation>
    </message>
    <message>
        <source>%1 has another place.</source>
        <translation>%1 тепер на іншому місці.</translation>
    </message>
    <message>
        <source>Undo default menu</source>
        <translation>Скасувати створення типового меню</translation>
    </message>
    <message>
        <source>Redo default menu</source>
        <translation>Повторити створення типового меню</translation>
    </message>
    <message>
        <source>The default menu was built.</source>
        <translation>Типове меню створено.</translation>
    </message>
    <message>
        <source>Undo hiding of %1</source>
        <translation>Скасувати приховування: %1</translation>
    </message>
    <message>
        <source>Redo hiding of %1</source>
        <translation>Повторити приховування: %1</translation>
    </message>
    <message>
        <source>%1 is hidden: the menu no longer shows it.</source>
        <translation>Приховано: %1. Меню цього більше не показує.</translation>
    </message>
    <message>
        <source>Undo showing %1 again</source>
        <translation>Скасувати повернення до меню: %1</translation>
    </message>
    <message>
        <source>Redo showing %1 again</source>
        <translation>Повторити повернення до меню: %1</translation>
    </message>
    <message>
        <source>The menu shows %1 again.</source>
        <translation>Меню знову показує %1.</translation>
    </message>
    <message>
        <source>Undo deletion of folder %1 (1 entry)</source>
        <translation>Скасувати вилучення теки %1 (1 запис)</translation>
    </message>
    <message>
        <source>Redo deletion of folder %1 (1 entry)</source>
        <translation>Повторити вилучення теки %1 (1 запис)</translation>
    </message>
    <message>
        <source>The folder %1 was deleted (1 entry).</source>
        <translation>Теку %1 вилучено (1 запис).</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Скасувати вилучення об&apos;єктів: %1 (%n запис)</numerusform>
            <numerusform>Скасувати вилучення об&apos;єктів: %1 (%n записи)</numerusform>
            <numerusform>Скасувати вилучення об&apos;єктів: %1 (%n записів)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Повторити вилучення об&apos;єктів: %1 (%n запис)</numerusform>
            <numerusform>Повторити вилучення об&apos;єктів: %1 (%n записи)</numerusform>
            <numerusform>Повторити вилучення об&apos;єктів: %1 (%n записів)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 items were deleted (%n entries).</source>
        <translation>
            <numerusform>Вилучено об&apos;єктів: %1 (%n запис).</numerusform>
            <numerusform>Вилучено об&apos;єктів: %1 (%n записи).</numerusform>
            <numerusform>Вилучено об&apos;єктів: %1 (%n записів).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo reordering of %n items</source>
        <translation>
            <numerusform>Скасувати перевпорядкування %n об&apos;єкта</numerusform>
            <numerusform>Скасувати перевпорядкування %n об&apos;єктів</numerusform>
            <numerusform>Скасувати перевпорядкування %n об&apos;єктів</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo reordering of %n items</source>
        <translation>
            <numerusform>Повторити перевпорядкування %n об&apos;єкта</numerusform>
            <numerusform>Повторити перевпорядкування %n об&apos;єктів</numerusform>
            <numerusform>Повторити перевпорядкування %n об&apos;єктів</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items have other places.</source>
        <translation>
            <numerusform>%n об&apos;єкт тепер на іншому місці.</numerusform>
            <numerusform>%n об&apos;єкти тепер на інших місцях.</numerusform>
            <numerusform>%n об&apos;єктів тепер на інших місцях.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo hiding of %n items</source>
        <translation>
            <numerusform>Скасувати приховування %n об&apos;єкта</numerusform>
            <numerusform>Скасувати приховування %n об&apos;єктів</numerusform>
            <numerusform>Скасувати приховування %n об&apos;єктів</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo hiding of %n items</source>
        <translation>
            <numerusform>Повторити приховування %n об&apos;єкта</numerusform>
            <numerusform>Повторити приховування %n об&apos;єктів</numerusform>
            <numerusform>Повторити приховування %n об&apos;єктів</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items are hidden: the menu no longer shows them.</source>
        <translation>
            <numerusform>Приховано %n об&apos;єкт. Меню його більше не показує.</numerusform>
            <numerusform>Приховано %n об&apos;єкти. Меню їх більше не показує.</numerusform>
            <numerusform>Приховано %n об&apos;єктів. Меню їх більше не показує.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo showing %n items again</source>
        <translation>
            <numerusform>Скасувати повернення до меню %n об&apos;єкта</numerusform>
            <numerusform>Скасувати повернення до меню %n об&apos;єктів</numerusform>
            <numerusform>Скасувати повернення до меню %n об&apos;єктів</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo showing %n items again</source>
        <translation>
            <numerusform>Повторити повернення до меню %n об&apos;єкта</numerusform>
            <numerusform>Повторити повернення до меню %n об&apos;єктів</numerusform>
            <numerusform>Повторити повернення до меню %n об&apos;єктів</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The menu shows %n items again.</source>
        <translation>
            <numerusform>Меню знову показує %n об&apos;єкт.</numerusform>
            <numerusform>Меню знову показує %n об&apos;єкти.</numerusform>
            <numerusform>Меню знову показує %n об&apos;єктів.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo sorting of folder %1</source>
        <translation>Скасувати впорядкування теки %1</translation>
    </message>
    <message>
        <source>Redo sorting of folder %1</source>
        <translation>Повторити впорядкування теки %1</translation>
    </message>
    <message>
        <source>The folder %1 was sorted by name.</source>
        <translation>Теку %1 упорядковано за назвою.</translation>
    </message>
    <message>
        <source>Undo duplication of %1</source>
        <translation>Скасувати дублювання: %1</translation>
    </message>
    <message>
        <source>Redo duplication of %1</source>
        <translation>Повторити дублювання: %1</translation>
    </message>
    <message>
        <source>%1 was duplicated. The copy is selected.</source>
        <translation>Створено копію: %1. Її вибрано.</translation>
    </message>
    <message numerus="yes">
        <source>Undo duplication of %n items</source>
        <translation>
            <numerusform>Скасувати дублювання %n об&apos;єкта</numerusform>
            <numerusform>Скасувати дублювання %n об&apos;єктів</numerusform>
            <numerusform>Скасувати дублювання %n об&apos;єктів</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo duplication of %n items</source>
        <translation>
            <numerusform>Повторити дублювання %n об&apos;єкта</numerusform>
            <numerusform>Повторити дублювання %n об&apos;єктів</numerusform>
            <numerusform>Повторити дублювання %n об&apos;єктів</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were duplicated. The copies are selected.</source>
        <translation>
            <numerusform>Продубльовано %n об&apos;єкт. Копію вибрано.</numerusform>
            <numerusform>Продубльовано %n об&apos;єкти. Копії вибрано.</numerusform>
            <numerusform>Продубльовано %n об&apos;єктів. Копії вибрано.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo deletion of %1 items (1 entry)</source>
        <translation>Скасувати вилучення об&apos;єктів: %1 (1 запис)</translation>
    </message>
    <message>
        <source>Redo deletion of %1 items (1 entry)</source>
        <translation>Повторити вилучення об&apos;єктів: %1 (1 запис)</translation>
    </message>
    <message>
        <source>%1 items were deleted (1 entry).</source>
        <translation>Вилучено об&apos;єктів: %1 (1 запис).</translation>
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
    <message>
        <source>Can&apos;t link %1: %2</source>
        <translation>Не вдалося створити посилання на %1: %2</translation>
    </message>
</context>
<context>
    <name>SchemeMenu</name>
    <message>
        <source>This is not a regular file.</source>
        <translation>Це не звичайний файл.</translation>
    </message>
    <message>
        <source>Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <translation>Прийнято скорочень: %1, пропущено: %2. «Гаразд» вводить їх у дію, «Скинути» повертає попередні.</translation>
    </message>
    <message>
        <source>%3
Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <comment>%3: a sentence about lines that were skipped</comment>
        <translation>%3
Прийнято скорочень: %1, пропущено: %2. «Гаразд» вводить їх у дію, «Скинути» повертає попередні.</translation>
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
        <source>Save cheat sheet as &amp;text...</source>
        <translation>Зберегти пам&apos;ятку як &amp;текст...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>&amp;Копіювати пам&apos;ятку</translation>
    </message>
    <message>
        <source>Export keys</source>
        <translation>Експорт клавіш</translation>
    </message>
    <message>
        <source>Keys (*.ini);;All files (*)</source>
        <translation>Клавіші (*.ini);;Усі файли (*)</translation>
    </message>
    <message>
        <source>%1
Choose another folder or another name, and try again.</source>
        <translation>%1
Виберіть іншу теку або іншу назву та спробуйте ще раз.</translation>
    </message>
    <message>
        <source>Import keys</source>
        <translation>Імпорт клавіш</translation>
    </message>
    <message>
        <source>%1
Choose a file that was written with &apos;Export keys...&apos;.</source>
        <translation>%1
Виберіть файл, записаний за допомогою «Експорт клавіш...».</translation>
    </message>
    <message>
        <source>HTML documents (*.html);;All files (*)</source>
        <translation>Документи HTML (*.html);;Усі файли (*)</translation>
    </message>
    <message>
        <source>Plain text (*.txt);;All files (*)</source>
        <translation>Звичайний текст (*.txt);;Усі файли (*)</translation>
    </message>
    <message>
        <source>Save cheat sheet</source>
        <translation>Збереження пам&apos;ятки</translation>
    </message>
    <message>
        <source>The cheat sheet could not be saved to %1: %2
Choose another folder or another name, and try again.</source>
        <comment>%2: what the system says</comment>
        <translation>Не вдалося зберегти пам&apos;ятку до %1: %2
Виберіть іншу теку або іншу назву та спробуйте ще раз.</translation>
    </message>
</context>
<context>
    <name>SchemeQuestion</name>
    <message>
        <source>Import keys</source>
        <translation>Імпорт клавіш</translation>
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
        <source>&amp;Do the same with all further ones</source>
        <translation>Так само чинити з &amp;усіма наступними</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but the global action &apos;%3&apos; has it. Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>У файлі скорочення «%1» призначено дії «%2», але його використовує загальна дія «%3». «Пропустити» залишить дію «%2» як є; «Скасувати» не прийме нічого.</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but action &apos;%3&apos; has it, too. Replace takes it away from action &apos;%3&apos;, Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>У файлі скорочення «%1» призначено дії «%2», але його використовує також дія «%3». «Замінити» забере його у дії «%3», «Пропустити» залишить дію «%2» як є; «Скасувати» не прийме нічого.</translation>
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
    <message>
        <source>Shortcut &apos;%1&apos; is a further shortcut of action &apos;%2&apos;.</source>
        <translation>Скорочення «%1» — додаткове скорочення дії «%2».</translation>
    </message>
</context>
<context>
    <name>ShortcutDelegate</name>
    <message>
        <source>Back to no shortcut</source>
        <translation>Повернути: без скорочення</translation>
    </message>
    <message>
        <source>Back to %1</source>
        <translation>Повернути %1</translation>
    </message>
</context>
<context>
    <name>ShortcutFilterBar</name>
    <message>
        <source>Press keys</source>
        <translation>Натиснути клавіші</translation>
    </message>
    <message>
        <source>Changed only</source>
        <translation>Лише змінені</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Фільтр</translation>
    </message>
    <message>
        <source>Shows who has the keys that you press; Escape ends it.</source>
        <translation>Показує, хто має натиснуті клавіші; Escape завершує.</translation>
    </message>
    <message>
        <source>Shows the actions alone whose shortcut is not the default one, or was edited.</source>
        <translation>Показує лише дії, скорочення яких не типове або змінене.</translation>
    </message>
    <message>
        <source>Press the keys to look for</source>
        <translation>Натисніть шукані клавіші</translation>
    </message>
    <message>
        <source>Filter by name, group or shortcut</source>
        <translation>Фільтр за назвою, групою або скороченням</translation>
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
    <message>
        <source>%1, changed</source>
        <comment>%1: an action or a key</comment>
        <translation>%1, змінено</translation>
    </message>
    <message>
        <source>No shortcut</source>
        <translation>Немає скорочення</translation>
    </message>
    <message>
        <source>There is no default shortcut.</source>
        <translation>Типового скорочення немає.</translation>
    </message>
    <message>
        <source>The default shortcut is %1.</source>
        <translation>Типове скорочення: %1.</translation>
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
    <name>TreeAssistance</name>
    <message>
        <source>&amp;Reset this shortcut</source>
        <translation>&amp;Скинути це скорочення</translation>
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
    <message>
        <source>The file %1 is not a desktop entry: it has no group [Desktop Entry].</source>
        <translation>Файл %1 не є записом стільниці: у ньому немає групи [Desktop Entry].</translation>
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
    <message>
        <source>This menu cannot be changed: the folder %1 does not exist.</source>
        <translation>Це меню не можна змінити: теки %1 немає.</translation>
    </message>
    <message>
        <source>This menu cannot be changed: you may not write to the folder %1.</source>
        <translation>Це меню не можна змінити: немає права запису до теки %1.</translation>
    </message>
    <message>
        <source>Show hidden</source>
        <translation>Показати приховані</translation>
    </message>
    <message>
        <source>Filter by name, command or keyword</source>
        <translation>Фільтр за назвою, командою або ключовим словом</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Фільтр</translation>
    </message>
    <message>
        <source>Also show the entries that the menu leaves out</source>
        <translation>Показати й записи, які меню пропускає</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Скасувати</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Помилка</translation>
    </message>
    <message>
        <source>Start menu</source>
        <translation>Меню запуску</translation>
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
    <message>
        <source>Not in the menu: it is not meant for this desktop.</source>
        <translation>Немає в меню: запис не призначено для цього середовища.</translation>
    </message>
    <message>
        <source>Not in the menu: it is meant for other desktops only (%1).</source>
        <translation>Немає в меню: запис призначено лише для інших середовищ (%1).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked as deleted (Hidden).</source>
        <translation>Немає в меню: запис позначено як вилучений (Hidden).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked not to be displayed (NoDisplay).</source>
        <translation>Немає в меню: запис позначено як непоказуваний (NoDisplay).</translation>
    </message>
    <message>
        <source>Not in the menu: the program %1 is not installed (TryExec).</source>
        <translation>Немає в меню: програму %1 не встановлено (TryExec).</translation>
    </message>
    <message>
        <source>This file is not a desktop entry, whatever its name says.</source>
        <translation>Цей файл не є записом стільниці, що б не казала його назва.</translation>
    </message>
    <message>
        <source>This file cannot be read.</source>
        <translation>Цей файл не вдається прочитати.</translation>
    </message>
    <message>
        <source>This entry has no name. The name of its file is shown.</source>
        <translation>Цей запис не має назви. Показано назву його файла.</translation>
    </message>
    <message>
        <source>Taking back what was done...</source>
        <translation>Скасування зробленого...</translation>
    </message>
    <message>
        <source>The program that holds the clipboard does not answer. Nothing was pasted.</source>
        <translation>Програма, якій належить буфер обміну, не відповідає. Нічого не вставлено.</translation>
    </message>
    <message>
        <source>Nothing can be created in %1, because there is no such folder.</source>
        <translation>У %1 нічого не можна створити: такої теки немає.</translation>
    </message>
    <message>
        <source>%1 could not be saved. Make sure that the folder %2 may be written and that the disk is not full, then try again.</source>
        <translation>Не вдалося зберегти %1. Переконайтеся, що до теки %2 можна записувати і що диск не переповнено, та спробуйте ще раз.</translation>
    </message>
    <message>
        <source>%1 could not be deleted: %2. Make sure that the folder that holds it may be written, then try again.</source>
        <translation>Не вдалося вилучити %1: %2. Переконайтеся, що до теки, яка його містить, можна записувати, та спробуйте ще раз.</translation>
    </message>
    <message>
        <source>%1 was deleted in part only, because %2 could not be deleted: %3. Make sure that its folder may be written, then delete the rest.</source>
        <translation>%1: вилучено лише частину, бо не вдалося вилучити %2: %3. Переконайтеся, що до його теки можна записувати, та вилучіть решту.</translation>
    </message>
    <message>
        <source>Nothing in this menu matches &apos;%1&apos;.</source>
        <translation>У цьому меню немає нічого відповідного до «%1».</translation>
    </message>
    <message>
        <source>Searching the menu for &apos;%1&apos;...</source>
        <translation>Пошук «%1» у меню...</translation>
    </message>
    <message>
        <source>The menu is too large to be searched as a whole. Only a part of it was searched.</source>
        <translation>Меню завелике, щоб шукати в усьому. Пошук виконано лише в його частині.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; was not changed: the file %2 cannot be written.</source>
        <translation>«%1» не змінено: запис до файла %2 неможливий.</translation>
    </message>
    <message>
        <source>The order of the folder %1 could not be saved. Make sure that the folder may be written and that the disk is not full, then try again.</source>
        <translation>Не вдалося зберегти порядок у теці %1. Переконайтеся, що до теки можна записувати і що диск не переповнено, та спробуйте ще раз.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1. The menu was left as it is.</source>
        <translation>Не вдалося створити типове меню в %1. Меню залишилося попереднім.</translation>
    </message>
    <message>
        <source>Menu</source>
        <comment>the tree</comment>
        <translation>Меню</translation>
    </message>
    <message>
        <source>%1 cannot be edited, because the folder %2 may not be written.</source>
        <translation>%1 не можна редагувати: до теки %2 не можна записувати.</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Пересування файлів...</translation>
    </message>
    <message>
        <source>Copying files...</source>
        <translation>Копіювання файлів...</translation>
    </message>
    <message>
        <source>Deleting files...</source>
        <translation>Вилучення файлів...</translation>
    </message>
    <message>
        <source>The deletion of %1 was canceled. What was not yet deleted is still there.</source>
        <translation>Вилучення %1 перервано. Те, що ще не вилучено, лишилося на місці.</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Це меню порожнє. Натисніть %1, щоб створити запис, або клацніть тут правою кнопкою, щоб побачити, що ще можна додати.</translation>
    </message>
    <message>
        <source>the program %1 ended with an error</source>
        <translation>програма %1 завершилася з помилкою</translation>
    </message>
    <message>
        <source>the program %1 cannot be run</source>
        <translation>не вдалося виконати програму %1</translation>
    </message>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>І ще %n.</numerusform>
            <numerusform>І ще %n.</numerusform>
            <numerusform>І ще %n.</numerusform>
        </translation>
    </message>
    <message>
        <source>Open containin&amp;g folder</source>
        <translation>Ві&amp;дкрити теку розташування</translation>
    </message>
    <message>
        <source>The folder %1 was not opened: %2.</source>
        <translation>Теку %1 не відкрито: %2.</translation>
    </message>
    <message>
        <source>New &amp;folder</source>
        <translation>Нова &amp;тека</translation>
    </message>
    <message>
        <source>New entr&amp;y</source>
        <translation>Новий &amp;запис</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>З&amp;мінити</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Вилучити</translation>
    </message>
    <message>
        <source>E&amp;xecute</source>
        <translation>Ви&amp;конати</translation>
    </message>
    <message>
        <source>F&amp;ind</source>
        <translation>&amp;Пошук</translation>
    </message>
    <message>
        <source>Find &amp;Next</source>
        <translation>Знайти да&amp;лі</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Вир&amp;ізати</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>Копі&amp;ювати</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>Вст&amp;авити</translation>
    </message>
    <message>
        <source>Default &amp;menu...</source>
        <translation>Типове м&amp;еню...</translation>
    </message>
    <message>
        <source>&amp;Up</source>
        <translation>Вго&amp;ру</translation>
    </message>
    <message>
        <source>D&amp;own</source>
        <translation>В&amp;низ</translation>
    </message>
    <message>
        <source>Dup&amp;licate</source>
        <translation>Ду&amp;блювати</translation>
    </message>
    <message>
        <source>&amp;Hide</source>
        <translation>При&amp;ховати</translation>
    </message>
    <message>
        <source>Sho&amp;w again</source>
        <translation>Показати знов&amp;у</translation>
    </message>
    <message>
        <source>&amp;Reload</source>
        <translation>Перезавантаж&amp;ити</translation>
    </message>
    <message>
        <source>&amp;Sort by name</source>
        <translation>Упор&amp;ядкувати за назвою</translation>
    </message>
    <message>
        <source>The folder %1 is sorted by name already.</source>
        <translation>Теку %1 вже впорядковано за назвою.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1, because no application is installed. The menu was left as it is.</source>
        <translation>Не вдалося створити типове меню в %1: не встановлено жодної програми. Меню залишилося попереднім.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1: %2. The menu was left as it is.</source>
        <translation>Не вдалося створити типове меню в %1: %2. Меню залишилося попереднім.</translation>
    </message>
    <message>
        <source>%1 is no file on this computer. Nothing was moved or copied.</source>
        <translation>%1 — не файл на цьому комп&apos;ютері. Нічого не пересунуто і не скопійовано.</translation>
    </message>
    <message>
        <source>%1 was not started: %2.</source>
        <translation>Не вдалося запустити %1: %2.</translation>
    </message>
    <message>
        <source>This menu is empty. Right-click here and choose &apos;%2&apos; to fill it with the applications that are installed, or press %1 for a new entry.</source>
        <translation>Це меню порожнє. Клацніть тут правою кнопкою і виберіть «%2», щоб заповнити його встановленими програмами, або натисніть %1, щоб створити запис.</translation>
    </message>
    <message>
        <source>This menu is empty, because no application was found that is installed. Once there is one, right-click here and choose &apos;%2&apos;. Until then, press %1 for an entry of your own.</source>
        <translation>Це меню порожнє: не знайдено жодної встановленої програми. Коли вона з&apos;явиться, клацніть тут правою кнопкою і виберіть «%2». А поки натисніть %1, щоб створити власний запис.</translation>
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
    <name>VelUI::CategoryChooser</name>
    <message>
        <source>Main category</source>
        <translation>Основна категорія</translation>
    </message>
    <message>
        <source>Goes with %1</source>
        <translation>Вживається з: %1</translation>
    </message>
    <message>
        <source>Only beside &quot;Only show in&quot;</source>
        <translation>Лише разом з «Показувати лише у»</translation>
    </message>
    <message>
        <source>Deprecated</source>
        <translation>Застаріла</translation>
    </message>
    <message>
        <source>Extension</source>
        <comment>a category of somebody&apos;s own, X-...</comment>
        <translation>Розширення</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Не зареєстрована</translation>
    </message>
    <message>
        <source>Choose categories</source>
        <translation>Вибір категорій</translation>
    </message>
    <message>
        <source>Name</source>
        <comment>title of a column</comment>
        <translation>Назва</translation>
    </message>
    <message>
        <source>Category</source>
        <comment>title of a column</comment>
        <translation>Категорія</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Примітка</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryNames</name>
    <message>
        <source>Audio and video</source>
        <translation>Звук і відео</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>Звук</translation>
    </message>
    <message>
        <source>Video</source>
        <translation>Відео</translation>
    </message>
    <message>
        <source>Software development</source>
        <translation>Розробка програм</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>Освіта</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>Ігри</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>Графіка</translation>
    </message>
    <message>
        <source>Internet and network</source>
        <translation>Інтернет і мережа</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>Офіс</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>Наука</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Параметри</translation>
    </message>
    <message>
        <source>System tools</source>
        <translation>Системні засоби</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Стандартні</translation>
    </message>
    <message>
        <source>Build tools</source>
        <translation>Засоби збирання</translation>
    </message>
    <message>
        <source>Debuggers</source>
        <translation>Зневаджувачі</translation>
    </message>
    <message>
        <source>Development environments</source>
        <translation>Середовища розробки</translation>
    </message>
    <message>
        <source>Designers of user interfaces</source>
        <translation>Конструктори інтерфейсів</translation>
    </message>
    <message>
        <source>Profilers</source>
        <translation>Засоби профілювання</translation>
    </message>
    <message>
        <source>Revision control</source>
        <translation>Керування версіями</translation>
    </message>
    <message>
        <source>Translation tools</source>
        <translation>Засоби перекладу</translation>
    </message>
    <message>
        <source>Calendars</source>
        <translation>Календарі</translation>
    </message>
    <message>
        <source>Address books</source>
        <translation>Адресні книги</translation>
    </message>
    <message>
        <source>Databases</source>
        <translation>Бази даних</translation>
    </message>
    <message>
        <source>Dictionaries</source>
        <translation>Словники</translation>
    </message>
    <message>
        <source>Charts</source>
        <translation>Діаграми</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>Електронна пошта</translation>
    </message>
    <message>
        <source>Finances</source>
        <translation>Фінанси</translation>
    </message>
    <message>
        <source>Flow charts</source>
        <translation>Блок-схеми</translation>
    </message>
    <message>
        <source>Handheld devices</source>
        <translation>Кишенькові пристрої</translation>
    </message>
    <message>
        <source>Project management</source>
        <translation>Керування проєктами</translation>
    </message>
    <message>
        <source>Presentations</source>
        <translation>Презентації</translation>
    </message>
    <message>
        <source>Spreadsheets</source>
        <translation>Електронні таблиці</translation>
    </message>
    <message>
        <source>Word processors</source>
        <translation>Текстові процесори</translation>
    </message>
    <message>
        <source>Two-dimensional graphics</source>
        <translation>Двовимірна графіка</translation>
    </message>
    <message>
        <source>Vector graphics</source>
        <translation>Векторна графіка</translation>
    </message>
    <message>
        <source>Raster graphics</source>
        <translation>Растрова графіка</translation>
    </message>
    <message>
        <source>Three-dimensional graphics</source>
        <translation>Тривимірна графіка</translation>
    </message>
    <message>
        <source>Scanning</source>
        <translation>Сканування</translation>
    </message>
    <message>
        <source>Text recognition</source>
        <translation>Розпізнавання тексту</translation>
    </message>
    <message>
        <source>Photography</source>
        <translation>Фотографія</translation>
    </message>
    <message>
        <source>Desktop publishing</source>
        <translation>Настільні видавничі системи</translation>
    </message>
    <message>
        <source>Viewers</source>
        <translation>Переглядачі</translation>
    </message>
    <message>
        <source>Text tools</source>
        <translation>Робота з текстом</translation>
    </message>
    <message>
        <source>Desktop settings</source>
        <translation>Параметри стільниці</translation>
    </message>
    <message>
        <source>Hardware settings</source>
        <translation>Параметри обладнання</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>Друк</translation>
    </message>
    <message>
        <source>Package managers</source>
        <translation>Керування пакунками</translation>
    </message>
    <message>
        <source>Dial-up connections</source>
        <translation>Комутовані з&apos;єднання</translation>
    </message>
    <message>
        <source>Instant messaging</source>
        <translation>Миттєві повідомлення</translation>
    </message>
    <message>
        <source>Chat</source>
        <translation>Балачка</translation>
    </message>
    <message>
        <source>IRC</source>
        <translation>IRC</translation>
    </message>
    <message>
        <source>News feeds</source>
        <translation>Стрічки новин</translation>
    </message>
    <message>
        <source>File transfer</source>
        <translation>Передавання файлів</translation>
    </message>
    <message>
        <source>Amateur radio</source>
        <translation>Аматорське радіо</translation>
    </message>
    <message>
        <source>Newsgroups</source>
        <translation>Групи новин</translation>
    </message>
    <message>
        <source>File sharing</source>
        <translation>Обмін файлами</translation>
    </message>
    <message>
        <source>Remote access</source>
        <translation>Віддалений доступ</translation>
    </message>
    <message>
        <source>Telephony</source>
        <translation>Телефонія</translation>
    </message>
    <message>
        <source>Telephony tools</source>
        <translation>Засоби телефонії</translation>
    </message>
    <message>
        <source>Video conferences</source>
        <translation>Відеоконференції</translation>
    </message>
    <message>
        <source>Web browsers</source>
        <translation>Браузери</translation>
    </message>
    <message>
        <source>Web development</source>
        <translation>Веброзробка</translation>
    </message>
    <message>
        <source>MIDI</source>
        <translation>MIDI</translation>
    </message>
    <message>
        <source>Mixers</source>
        <translation>Мікшери</translation>
    </message>
    <message>
        <source>Sequencers</source>
        <translation>Секвенсори</translation>
    </message>
    <message>
        <source>Tuners</source>
        <translation>Тюнери</translation>
    </message>
    <message>
        <source>Television</source>
        <translation>Телебачення</translation>
    </message>
    <message>
        <source>Audio and video editing</source>
        <translation>Редагування звуку й відео</translation>
    </message>
    <message>
        <source>Players</source>
        <translation>Програвачі</translation>
    </message>
    <message>
        <source>Recorders</source>
        <translation>Програми для запису звуку й відео</translation>
    </message>
    <message>
        <source>Disc burning</source>
        <translation>Запис дисків</translation>
    </message>
    <message>
        <source>Action games</source>
        <translation>Ігри-бойовики</translation>
    </message>
    <message>
        <source>Adventure games</source>
        <translation>Пригодницькі ігри</translation>
    </message>
    <message>
        <source>Arcade games</source>
        <translation>Аркади</translation>
    </message>
    <message>
        <source>Board games</source>
        <translation>Настільні ігри</translation>
    </message>
    <message>
        <source>Falling blocks games</source>
        <translation>Ігри з фігурами, що падають</translation>
    </message>
    <message>
        <source>Card games</source>
        <translation>Карткові ігри</translation>
    </message>
    <message>
        <source>Games for children</source>
        <translation>Ігри для дітей</translation>
    </message>
    <message>
        <source>Logic games</source>
        <translation>Логічні ігри</translation>
    </message>
    <message>
        <source>Role-playing games</source>
        <translation>Рольові ігри</translation>
    </message>
    <message>
        <source>Shooters</source>
        <translation>Стрілянки</translation>
    </message>
    <message>
        <source>Simulations</source>
        <translation>Симулятори</translation>
    </message>
    <message>
        <source>Sports games</source>
        <translation>Спортивні ігри</translation>
    </message>
    <message>
        <source>Strategy games</source>
        <translation>Стратегії</translation>
    </message>
    <message>
        <source>Art</source>
        <translation>Мистецтво</translation>
    </message>
    <message>
        <source>Construction</source>
        <translation>Будівництво</translation>
    </message>
    <message>
        <source>Music</source>
        <translation>Музика</translation>
    </message>
    <message>
        <source>Languages</source>
        <translation>Мови</translation>
    </message>
    <message>
        <source>Artificial intelligence</source>
        <translation>Штучний інтелект</translation>
    </message>
    <message>
        <source>Astronomy</source>
        <translation>Астрономія</translation>
    </message>
    <message>
        <source>Biology</source>
        <translation>Біологія</translation>
    </message>
    <message>
        <source>Chemistry</source>
        <translation>Хімія</translation>
    </message>
    <message>
        <source>Computer science</source>
        <translation>Інформатика</translation>
    </message>
    <message>
        <source>Data visualization</source>
        <translation>Візуалізація даних</translation>
    </message>
    <message>
        <source>Economics</source>
        <translation>Економіка</translation>
    </message>
    <message>
        <source>Electricity</source>
        <translation>Електрика</translation>
    </message>
    <message>
        <source>Geography</source>
        <translation>Географія</translation>
    </message>
    <message>
        <source>Geology</source>
        <translation>Геологія</translation>
    </message>
    <message>
        <source>Earth sciences</source>
        <translation>Науки про Землю</translation>
    </message>
    <message>
        <source>History</source>
        <translation>Історія</translation>
    </message>
    <message>
        <source>Humanities</source>
        <translation>Гуманітарні науки</translation>
    </message>
    <message>
        <source>Image processing</source>
        <translation>Обробка зображень</translation>
    </message>
    <message>
        <source>Literature</source>
        <translation>Література</translation>
    </message>
    <message>
        <source>Maps</source>
        <translation>Карти</translation>
    </message>
    <message>
        <source>Mathematics</source>
        <translation>Математика</translation>
    </message>
    <message>
        <source>Numerical analysis</source>
        <translation>Числовий аналіз</translation>
    </message>
    <message>
        <source>Medicine</source>
        <translation>Медицина</translation>
    </message>
    <message>
        <source>Physics</source>
        <translation>Фізика</translation>
    </message>
    <message>
        <source>Robotics</source>
        <translation>Робототехніка</translation>
    </message>
    <message>
        <source>Spirituality</source>
        <translation>Духовність</translation>
    </message>
    <message>
        <source>Sports</source>
        <translation>Спорт</translation>
    </message>
    <message>
        <source>Parallel computing</source>
        <translation>Паралельні обчислення</translation>
    </message>
    <message>
        <source>Amusement</source>
        <translation>Розваги</translation>
    </message>
    <message>
        <source>Archiving</source>
        <translation>Архівування</translation>
    </message>
    <message>
        <source>Compression</source>
        <translation>Стискання даних</translation>
    </message>
    <message>
        <source>Electronics</source>
        <translation>Електроніка</translation>
    </message>
    <message>
        <source>Emulators</source>
        <translation>Емулятори</translation>
    </message>
    <message>
        <source>Engineering</source>
        <translation>Інженерна справа</translation>
    </message>
    <message>
        <source>File tools</source>
        <translation>Робота з файлами</translation>
    </message>
    <message>
        <source>File managers</source>
        <translation>Засоби керування файлами</translation>
    </message>
    <message>
        <source>Terminals</source>
        <translation>Термінали</translation>
    </message>
    <message>
        <source>File systems</source>
        <translation>Файлові системи</translation>
    </message>
    <message>
        <source>Monitors</source>
        <translation>Системні монітори</translation>
    </message>
    <message>
        <source>Security</source>
        <translation>Безпека</translation>
    </message>
    <message>
        <source>Accessibility</source>
        <translation>Доступність</translation>
    </message>
    <message>
        <source>Calculators</source>
        <translation>Калькулятори</translation>
    </message>
    <message>
        <source>Clocks</source>
        <translation>Годинники</translation>
    </message>
    <message>
        <source>Text editors</source>
        <translation>Текстові редактори</translation>
    </message>
    <message>
        <source>Documentation</source>
        <translation>Документація</translation>
    </message>
    <message>
        <source>For adults</source>
        <translation>Для дорослих</translation>
    </message>
    <message>
        <source>Core of the desktop</source>
        <translation>Основа стільничного середовища</translation>
    </message>
    <message>
        <source>Made with KDE</source>
        <translation>На основі KDE</translation>
    </message>
    <message>
        <source>Made with GNOME</source>
        <translation>На основі GNOME</translation>
    </message>
    <message>
        <source>Made with Xfce</source>
        <translation>На основі Xfce</translation>
    </message>
    <message>
        <source>Made with GTK</source>
        <translation>На основі GTK</translation>
    </message>
    <message>
        <source>Made with Qt</source>
        <translation>На основі Qt</translation>
    </message>
    <message>
        <source>Made with Motif</source>
        <translation>На основі Motif</translation>
    </message>
    <message>
        <source>Made with Java</source>
        <translation>На основі Java</translation>
    </message>
    <message>
        <source>For the console</source>
        <translation>Для консолі</translation>
    </message>
    <message>
        <source>Screen savers</source>
        <translation>Зберігачі екрана</translation>
    </message>
    <message>
        <source>Icons of the system tray</source>
        <translation>Піктограми системного лотка</translation>
    </message>
    <message>
        <source>Applets of a panel</source>
        <translation>Аплети панелі</translation>
    </message>
    <message>
        <source>Desktop shells</source>
        <translation>Оболонки стільничного середовища</translation>
    </message>
    <message>
        <source>Applications</source>
        <translation>Програми</translation>
    </message>
</context>
<context>
    <name>VelUI::ChoiceDialog</name>
    <message>
        <source>Filter</source>
        <translation>Фільтр</translation>
    </message>
    <message>
        <source>Type to filter</source>
        <translation>Введіть текст для фільтра</translation>
    </message>
    <message>
        <source>Reading...</source>
        <translation>Читання...</translation>
    </message>
    <message>
        <source>No match</source>
        <translation>Нічого не знайдено</translation>
    </message>
    <message numerus="yes">
        <source>%n chosen</source>
        <translation>
            <numerusform>Вибрано %n</numerusform>
            <numerusform>Вибрано %n</numerusform>
            <numerusform>Вибрано %n</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::DesktopChooser</name>
    <message>
        <source>Desktop environment</source>
        <translation>Стільничне середовище</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Примітка</translation>
    </message>
    <message>
        <source>This session</source>
        <translation>Цей сеанс</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Не зареєстроване</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsDialog</name>
    <message>
        <source>An action has no id. It can have &quot;%1&quot;.</source>
        <translation>Одна з дій не має ідентифікатора. Можна використати «%1».</translation>
    </message>
    <message>
        <source>Two actions have the id &quot;%1&quot;. The second one can have &quot;%2&quot;.</source>
        <translation>Дві дії мають ідентифікатор «%1». Другій можна дати «%2».</translation>
    </message>
    <message>
        <source>No entry can hold the id &quot;%1&quot;. It can be &quot;%2&quot;.</source>
        <translation>Запис не може містити ідентифікатор «%1». Можна використати «%2».</translation>
    </message>
    <message>
        <source>The id &quot;%1&quot; should have only A to Z, a to z, 0 to 9 and &quot;-&quot; in it, as &quot;%2&quot; has.</source>
        <translation>Ідентифікатор «%1» має містити лише A–Z, a–z, 0–9 і «-», як, наприклад, «%2».</translation>
    </message>
    <message numerus="yes">
        <source>%n more id(s) should be changed.</source>
        <translation>
            <numerusform>Слід змінити ще %n ідентифікатор.</numerusform>
            <numerusform>Слід змінити ще %n ідентифікатори.</numerusform>
            <numerusform>Слід змінити ще %n ідентифікаторів.</numerusform>
        </translation>
    </message>
    <message>
        <source>Use &quot;%1&quot;</source>
        <translation>Використати «%1»</translation>
    </message>
    <message>
        <source>Use the proposed ids</source>
        <translation>Використати запропоновані ідентифікатори</translation>
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
    <name>VelUI::EditStringsDialog</name>
    <message>
        <source>The &quot;;&quot; in &quot;%1&quot; does not separate items, it becomes part of one item.</source>
        <translation>Знак «;» у «%1» не розділяє елементи, а стає частиною одного елемента.</translation>
    </message>
    <message numerus="yes">
        <source>Make %n item(s) of it</source>
        <translation>
            <numerusform>Зробити з цього %n елемент</numerusform>
            <numerusform>Зробити з цього %n елементи</numerusform>
            <numerusform>Зробити з цього %n елементів</numerusform>
        </translation>
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
    <name>VelUI::EntryFormAssistance</name>
    <message>
        <source>Te&amp;xt</source>
        <comment>button: shows the file of the entry</comment>
        <translation>Те&amp;кст</translation>
    </message>
    <message>
        <source>Shows the file as it would be saved</source>
        <translation>Показує файл таким, яким його буде збережено</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryTextDialog</name>
    <message>
        <source>Text of the entry</source>
        <translation>Текст запису</translation>
    </message>
    <message>
        <source>The file as it would be saved</source>
        <translation>Файл таким, яким його буде збережено</translation>
    </message>
    <message>
        <source>Nothing is changed.</source>
        <translation>Нічого не змінено.</translation>
    </message>
    <message>
        <source>≠ changed lines: %1, + new lines: %2, removed lines: %3</source>
        <translation>≠ змінені рядки: %1, + нові рядки: %2, вилучені рядки: %3</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldChoosers</name>
    <message>
        <source>Choose %1</source>
        <comment>name of a &quot;Choose...&quot; button</comment>
        <translation>Вибрати: %1</translation>
    </message>
    <message>
        <source>Choose...</source>
        <translation>Вибрати...</translation>
    </message>
    <message>
        <source>Chooses from all that are known (Alt+Down)</source>
        <translation>Вибір з усього, що відомо (Alt+Down)</translation>
    </message>
    <message>
        <source>Chooses an installed program (Alt+Down)</source>
        <translation>Вибір встановленої програми (Alt+Down)</translation>
    </message>
    <message>
        <source>Insert</source>
        <comment>button: a field code</comment>
        <translation>Вставити</translation>
    </message>
    <message>
        <source>Insert a field code</source>
        <translation>Вставити код поля</translation>
    </message>
    <message>
        <source>Inserts a code that stands for the files to open, or for a part of this entry</source>
        <translation>Вставляє код, що позначає файли, які слід відкрити, або частину цього запису</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldCodes</name>
    <message>
        <source>%f: one file; for several files the program is started several times</source>
        <translation>%f: один файл; для кількох файлів програма запускається кілька разів</translation>
    </message>
    <message>
        <source>%F: all files, each as a word of its own</source>
        <translation>%F: усі файли, кожен окремим словом</translation>
    </message>
    <message>
        <source>%u: one address (URL) or file; for several the program is started several times</source>
        <translation>%u: одна адреса (URL) або файл; для кількох програма запускається кілька разів</translation>
    </message>
    <message>
        <source>%U: all addresses (URLs) or files, each as a word of its own</source>
        <translation>%U: усі адреси (URL) або файли, кожен елемент окремим словом</translation>
    </message>
    <message>
        <source>%i: --icon and the icon of this entry, if it has one</source>
        <translation>%i: --icon і піктограма цього запису, якщо вона є</translation>
    </message>
    <message>
        <source>%c: the name of this entry, translated</source>
        <translation>%c: назва цього запису в перекладі</translation>
    </message>
    <message>
        <source>%k: where the file of this entry lies</source>
        <translation>%k: де розташовано файл цього запису</translation>
    </message>
    <message>
        <source>%%: a percent sign</source>
        <translation>%%: знак відсотка</translation>
    </message>
</context>
<context>
    <name>VelUI::FindingLine</name>
    <message>
        <source>Fix</source>
        <translation>Виправити</translation>
    </message>
    <message>
        <source>Fix: %1</source>
        <comment>on a button; %1 is what it does</comment>
        <translation>Виправити: %1</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>how bad something is, and what it is</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Помилка</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Попередження</translation>
    </message>
    <message>
        <source>Hint</source>
        <translation>Зауваження</translation>
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
        <translation>Скасувати зміну: %1</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Скасувати</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Повторити зміну: %1</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Повторити</translation>
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
    <name>VelUI::LanguageBar</name>
    <message>
        <source>&amp;Language:</source>
        <translation>&amp;Мова:</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Мова</translation>
    </message>
    <message>
        <source>Another language...</source>
        <translation>Інша мова...</translation>
    </message>
    <message>
        <source>Another language</source>
        <translation>Інша мова</translation>
    </message>
    <message>
        <source>Unknown language</source>
        <translation>Невідома мова</translation>
    </message>
    <message>
        <source>%1 (%2), yours: %3 of %4 texts</source>
        <translation>%1 (%2), ваша: текстів %3 з %4</translation>
    </message>
    <message>
        <source>%1 (%2), yours: no text yet</source>
        <translation>%1 (%2), ваша: текстів ще немає</translation>
    </message>
    <message>
        <source>%1 (%2): %3 of %4 texts</source>
        <translation>%1 (%2): текстів %3 з %4</translation>
    </message>
    <message>
        <source>%1 (%2): no text yet</source>
        <translation>%1 (%2): текстів ще немає</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageDialog</name>
    <message>
        <source>Another language</source>
        <translation>Інша мова</translation>
    </message>
    <message>
        <source>&amp;Language or its code, such as pt_BR:</source>
        <translation>&amp;Мова або її код, наприклад pt_BR:</translation>
    </message>
    <message>
        <source>Language or its code</source>
        <translation>Мова або її код</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>a language and its code</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>No language has such a code: it is like de, pt_BR or sr@latin.</source>
        <translation>Жодна мова не має такого коду: код виглядає як de, pt_BR або sr@latin.</translation>
    </message>
    <message>
        <source>The code %1 is well-formed, but no language of this name is known.</source>
        <translation>Код %1 складено правильно, але мови з такою назвою не відомо.</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeChooser</name>
    <message>
        <source>Choose MIME types</source>
        <translation>Вибір типів MIME</translation>
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
        <translation>Опис</translation>
    </message>
    <message>
        <source>File names</source>
        <translation>Назви файлів</translation>
    </message>
    <message>
        <source>Not in the database</source>
        <translation>Немає в базі даних</translation>
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
<context>
    <name>VelUI::ProgramChooser</name>
    <message>
        <source>Choose a program</source>
        <translation>Вибір програми</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramSource</name>
    <message>
        <source>Program</source>
        <comment>title of a column</comment>
        <translation>Програма</translation>
    </message>
    <message>
        <source>Folder</source>
        <comment>title of a column</comment>
        <translation>Тека</translation>
    </message>
</context>
<context>
    <name>VelUI::RowFindings</name>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>І ще %n.</numerusform>
            <numerusform>І ще %n.</numerusform>
            <numerusform>І ще %n.</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::TrialLine</name>
    <message>
        <source>Stop</source>
        <comment>button: ends the trial of an entry</comment>
        <translation>Зупинити</translation>
    </message>
    <message>
        <source>T&amp;ry</source>
        <comment>button: runs the entry</comment>
        <translation>Випро&amp;бувати</translation>
    </message>
    <message>
        <source>Stops the trial</source>
        <translation>Зупиняє пробний запуск</translation>
    </message>
    <message>
        <source>Runs the entry as it is now, without saving it</source>
        <translation>Запускає запис таким, яким він є зараз, не зберігаючи його</translation>
    </message>
    <message>
        <source>The program vel-open, which runs entries, could not be started: %1</source>
        <translation>Не вдалося запустити програму vel-open, яка виконує записи: %1</translation>
    </message>
    <message>
        <source>The trial was stopped.</source>
        <translation>Пробний запуск зупинено.</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0).</source>
        <translation>Запис запущено (код завершення 0).</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0): %1</source>
        <translation>Запис запущено (код завершення 0): %1</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1).</source>
        <translation>Не вдалося запустити запис (код завершення %1).</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1): %2</source>
        <translation>Не вдалося запустити запис (код завершення %1): %2</translation>
    </message>
</context>
</TS>

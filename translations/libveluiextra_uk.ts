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
        <source>Hide</source>
        <translation>Приховати</translation>
    </message>
    <message>
        <source>Show again</source>
        <translation>Показати знову</translation>
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
        <source>Reload</source>
        <translation>Перезавантажити</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Це меню порожнє. Натисніть %1, щоб створити запис, або клацніть тут правою кнопкою, щоб побачити, що ще можна додати.</translation>
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

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
        <source>Hide</source>
        <translation>Скрыть</translation>
    </message>
    <message>
        <source>Show again</source>
        <translation>Показать снова</translation>
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
        <source>Reload</source>
        <translation>Обновить</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Это меню пусто. Нажмите %1, чтобы создать запись, или щёлкните здесь правой кнопкой, чтобы увидеть, что ещё можно добавить.</translation>
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

<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="pl" sourcelanguage="en">
<context>
    <name>ActionListEdit</name>
    <message>
        <source>Form</source>
        <translation>Formularz</translation>
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
        <translation>Przejdź</translation>
    </message>
    <message>
        <source>Go to action &apos;%1&apos;</source>
        <translation>Przejdź do działania „%1”</translation>
    </message>
    <message>
        <source>Take over</source>
        <translation>Przejmij</translation>
    </message>
    <message>
        <source>Take over &apos;%1&apos; from action &apos;%2&apos;</source>
        <translation>Przejmij „%1” od działania „%2”</translation>
    </message>
    <message>
        <source>Further clashes: %1</source>
        <translation>Dalsze konflikty: %1</translation>
    </message>
</context>
<context>
    <name>EditActionsDialog</name>
    <message>
        <source>Actions</source>
        <translation>Działania</translation>
    </message>
</context>
<context>
    <name>EditActionsWidget</name>
    <message>
        <source>Form</source>
        <translation>Formularz</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Dodaj...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Edytuj...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Usuń</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>W górę</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>W dół</translation>
    </message>
</context>
<context>
    <name>EditShortcutsAssistance</name>
    <message>
        <source>Schemes</source>
        <translation>Schematy</translation>
    </message>
    <message>
        <source>No action matches the filter.</source>
        <translation>Żadne działanie nie pasuje do filtra.</translation>
    </message>
    <message>
        <source>No action has the shortcut %1.</source>
        <translation>Żadne działanie nie ma skrótu %1.</translation>
    </message>
</context>
<context>
    <name>EditShortcutsDialog</name>
    <message>
        <source>None</source>
        <translation>Brak</translation>
    </message>
    <message>
        <source>Configure shortcuts</source>
        <translation>Ustawienia skrótów</translation>
    </message>
    <message>
        <source>Choose a key for selected action</source>
        <translation>Wybór klawisza dla zaznaczonego działania</translation>
    </message>
    <message>
        <source>Default key:</source>
        <translation>Klawisz domyślny:</translation>
    </message>
    <message>
        <source>Assign key:</source>
        <translation>Przypisz klawisz:</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>Skrót „%1” jest już używany przez globalne działanie „%2”.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;. Please try another.</source>
        <translation>Skrót „%1” jest już używany przez działanie „%2”. Proszę wybrać inny.</translation>
    </message>
    <message>
        <source>Shortcuts conflict</source>
        <translation>Sprzeczność skrótów</translation>
    </message>
    <message>
        <source>Apply changes</source>
        <translation>Zastosowanie zmian</translation>
    </message>
    <message>
        <source>Some shortcuts have been changed. Do you want to apply changes?</source>
        <translation>Niektóre skróty zostały zmienione. Czy zastosować zmiany?</translation>
    </message>
</context>
<context>
    <name>EditStringsDialog</name>
    <message>
        <source>Strings</source>
        <translation>Ciągi znaków</translation>
    </message>
</context>
<context>
    <name>EditableListWidget</name>
    <message>
        <source>Form</source>
        <translation>Formularz</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Dodaj...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Edytuj...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Usuń</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>W górę</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>W dół</translation>
    </message>
</context>
<context>
    <name>KeyAssistance</name>
    <message>
        <source>Press the keys of the shortcut. Tab leaves the field.</source>
        <translation>Naciśnij klawisze skrótu. Tab opuszcza pole.</translation>
    </message>
    <message>
        <source>Key for action &apos;%1&apos;</source>
        <translation>Klawisz dla działania „%1”</translation>
    </message>
    <message>
        <source>None: no key for action &apos;%1&apos;</source>
        <translation>Brak: żadnego klawisza dla działania „%1”</translation>
    </message>
    <message>
        <source>What speaks against the key for action &apos;%1&apos;</source>
        <translation>Co przemawia przeciw skrótowi działania „%1”</translation>
    </message>
</context>
<context>
    <name>MenuDeletion</name>
    <message>
        <source>There is no trash for %1. It would be deleted for good: this cannot be undone. Delete it?</source>
        <translation>Dla %1 nie ma kosza. Usunięcie byłoby ostateczne i nie da się go cofnąć. Usunąć?</translation>
    </message>
    <message numerus="yes">
        <source>There is no trash for %n of these items. They would be deleted for good: this cannot be undone. Delete them?</source>
        <translation>
            <numerusform>Dla %n z tych elementów nie ma kosza. Usunięcie byłoby ostateczne i nie da się go cofnąć. Usunąć?</numerusform>
            <numerusform>Dla %n z tych elementów nie ma kosza. Usunięcie byłoby ostateczne i nie da się go cofnąć. Usunąć?</numerusform>
            <numerusform>Dla %n z tych elementów nie ma kosza. Usunięcie byłoby ostateczne i nie da się go cofnąć. Usunąć?</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 cannot be deleted: %2</source>
        <translation>Nie można usunąć %1: %2</translation>
    </message>
</context>
<context>
    <name>MenuHistory</name>
    <message>
        <source>Undo</source>
        <translation>Cofnij</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Ponów</translation>
    </message>
    <message>
        <source>Done: %1</source>
        <translation>Gotowe: %1</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Przenoszenie plików...</translation>
    </message>
    <message>
        <source>Nothing was undone: %1</source>
        <translation>Niczego nie cofnięto: %1</translation>
    </message>
    <message>
        <source>Nothing was done again: %1</source>
        <translation>Niczego nie ponowiono: %1</translation>
    </message>
    <message>
        <source>%1 is not there any more.</source>
        <translation>%1 już nie istnieje.</translation>
    </message>
    <message>
        <source>There is another %1 by now.</source>
        <translation>Jest teraz inny element %1.</translation>
    </message>
    <message>
        <source>%1 was changed by another program.</source>
        <translation>Element %1 został zmieniony przez inny program.</translation>
    </message>
    <message>
        <source>%1 is not in the trash any more.</source>
        <translation>Elementu %1 nie ma już w koszu.</translation>
    </message>
    <message>
        <source>%1 cannot be put into the trash.</source>
        <translation>Nie można przenieść %1 do kosza.</translation>
    </message>
    <message>
        <source>It was canceled.</source>
        <translation>Anulowano.</translation>
    </message>
    <message>
        <source>%1 cannot be changed: %2</source>
        <translation>Nie można zmienić %1: %2</translation>
    </message>
    <message>
        <source>Undo creation of %1</source>
        <translation>Cofnij utworzenie %1</translation>
    </message>
    <message>
        <source>Redo creation of %1</source>
        <translation>Ponów utworzenie %1</translation>
    </message>
    <message>
        <source>%1 was created.</source>
        <translation>Utworzono %1.</translation>
    </message>
    <message>
        <source>Undo change of %1</source>
        <translation>Cofnij zmianę %1</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Ponów zmianę %1</translation>
    </message>
    <message>
        <source>%1 was changed.</source>
        <translation>Zmieniono %1.</translation>
    </message>
    <message>
        <source>Undo deletion of %1</source>
        <translation>Cofnij usunięcie %1</translation>
    </message>
    <message>
        <source>Redo deletion of %1</source>
        <translation>Ponów usunięcie %1</translation>
    </message>
    <message>
        <source>%1 was deleted.</source>
        <translation>Usunięto %1.</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Cofnij usunięcie katalogu %1 (%n wpis)</numerusform>
            <numerusform>Cofnij usunięcie katalogu %1 (%n wpisy)</numerusform>
            <numerusform>Cofnij usunięcie katalogu %1 (%n wpisów)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Ponów usunięcie katalogu %1 (%n wpis)</numerusform>
            <numerusform>Ponów usunięcie katalogu %1 (%n wpisy)</numerusform>
            <numerusform>Ponów usunięcie katalogu %1 (%n wpisów)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The folder %1 was deleted (%n entries).</source>
        <translation>
            <numerusform>Usunięto katalog %1 (%n wpis).</numerusform>
            <numerusform>Usunięto katalog %1 (%n wpisy).</numerusform>
            <numerusform>Usunięto katalog %1 (%n wpisów).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %n items</source>
        <translation>
            <numerusform>Cofnij usunięcie %n elementu</numerusform>
            <numerusform>Cofnij usunięcie %n elementów</numerusform>
            <numerusform>Cofnij usunięcie %n elementów</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %n items</source>
        <translation>
            <numerusform>Ponów usunięcie %n elementu</numerusform>
            <numerusform>Ponów usunięcie %n elementów</numerusform>
            <numerusform>Ponów usunięcie %n elementów</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were deleted.</source>
        <translation>
            <numerusform>Usunięto %n element.</numerusform>
            <numerusform>Usunięto %n elementy.</numerusform>
            <numerusform>Usunięto %n elementów.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo moving of %1 to %2</source>
        <translation>Cofnij przeniesienie %1 do %2</translation>
    </message>
    <message>
        <source>Redo moving of %1 to %2</source>
        <translation>Ponów przeniesienie %1 do %2</translation>
    </message>
    <message>
        <source>%1 was moved to %2.</source>
        <translation>Przeniesiono %1 do %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo moving of %n items to %2</source>
        <translation>
            <numerusform>Cofnij przeniesienie %n elementu do %2</numerusform>
            <numerusform>Cofnij przeniesienie %n elementów do %2</numerusform>
            <numerusform>Cofnij przeniesienie %n elementów do %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo moving of %n items to %2</source>
        <translation>
            <numerusform>Ponów przeniesienie %n elementu do %2</numerusform>
            <numerusform>Ponów przeniesienie %n elementów do %2</numerusform>
            <numerusform>Ponów przeniesienie %n elementów do %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were moved to %2.</source>
        <translation>
            <numerusform>Przeniesiono %n element do %2.</numerusform>
            <numerusform>Przeniesiono %n elementy do %2.</numerusform>
            <numerusform>Przeniesiono %n elementów do %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo copying of %1 to %2</source>
        <translation>Cofnij skopiowanie %1 do %2</translation>
    </message>
    <message>
        <source>Redo copying of %1 to %2</source>
        <translation>Ponów skopiowanie %1 do %2</translation>
    </message>
    <message>
        <source>%1 was copied to %2.</source>
        <translation>Skopiowano %1 do %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo copying of %n items to %2</source>
        <translation>
            <numerusform>Cofnij skopiowanie %n elementu do %2</numerusform>
            <numerusform>Cofnij skopiowanie %n elementów do %2</numerusform>
            <numerusform>Cofnij skopiowanie %n elementów do %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo copying of %n items to %2</source>
        <translation>
            <numerusform>Ponów skopiowanie %n elementu do %2</numerusform>
            <numerusform>Ponów skopiowanie %n elementów do %2</numerusform>
            <numerusform>Ponów skopiowanie %n elementów do %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were copied to %2.</source>
        <translation>
            <numerusform>Skopiowano %n element do %2.</numerusform>
            <numerusform>Skopiowano %n elementy do %2.</numerusform>
            <numerusform>Skopiowano %n elementów do %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo reordering of %1</source>
        <translation>Cofnij zmianę kolejności %1</translation>
    </message>
    <message>
        <source>Redo reordering of %1</source>
        <translation>Ponów zmianę kolejności %1</translation>
    </message>
    <message>
        <source>%1 has another place.</source>
        <translation>%1 ma inne miejsce.</translation>
    </message>
    <message>
        <source>Undo default menu</source>
        <translation>Cofnij menu domyślne</translation>
    </message>
    <message>
        <source>Redo default menu</source>
        <translation>Ponów menu domyślne</translation>
    </message>
    <message>
        <source>The default menu was built.</source>
        <translation>Utworzono menu domyślne.</translation>
    </message>
    <message>
        <source>Undo hiding of %1</source>
        <translation>Cofnij ukrycie %1</translation>
    </message>
    <message>
        <source>Redo hiding of %1</source>
        <translation>Ponów ukrycie %1</translation>
    </message>
    <message>
        <source>%1 is hidden: the menu no longer shows it.</source>
        <translation>Ukryto %1: menu już tego nie pokazuje.</translation>
    </message>
    <message>
        <source>Undo showing %1 again</source>
        <translation>Cofnij ponowne pokazanie %1</translation>
    </message>
    <message>
        <source>Redo showing %1 again</source>
        <translation>Ponów ponowne pokazanie %1</translation>
    </message>
    <message>
        <source>The menu shows %1 again.</source>
        <translation>Menu znów pokazuje %1.</translation>
    </message>
    <message>
        <source>Undo deletion of folder %1 (1 entry)</source>
        <translation>Cofnij usunięcie katalogu %1 (1 wpis)</translation>
    </message>
    <message>
        <source>Redo deletion of folder %1 (1 entry)</source>
        <translation>Ponów usunięcie katalogu %1 (1 wpis)</translation>
    </message>
    <message>
        <source>The folder %1 was deleted (1 entry).</source>
        <translation>Usunięto katalog %1 (1 wpis).</translation>
    </message>
</context>
<context>
    <name>QFileSystemModel</name>
    <message>
        <source>%1 does not exist.</source>
        <translation>%1 nie istnieje.</translation>
    </message>
    <message>
        <source>%1 exists and was left as it is.</source>
        <translation>%1 już istnieje i pozostaje bez zmian.</translation>
    </message>
    <message>
        <source>%1 cannot be put into itself.</source>
        <translation>Nie można umieścić %1 w samym sobie.</translation>
    </message>
    <message>
        <source>%1 cannot be written.</source>
        <translation>Nie można zapisać %1.</translation>
    </message>
    <message>
        <source>Can&apos;t move %1: %2</source>
        <translation>Nie można przenieść %1: %2</translation>
    </message>
    <message>
        <source>Can&apos;t copy %1: %2</source>
        <translation>Nie można skopiować %1: %2</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Uwaga</translation>
    </message>
    <message>
        <source>%1 already exists. Overwrite?</source>
        <translation>%1 już istnieje. Zastąpić?</translation>
    </message>
</context>
<context>
    <name>SchemeMenu</name>
    <message>
        <source>This is not a regular file.</source>
        <translation>To nie jest zwykły plik.</translation>
    </message>
    <message>
        <source>Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <translation>Przejęte skróty: %1, pominięte: %2. OK je zatwierdza, Wyzeruj je wycofuje.</translation>
    </message>
    <message>
        <source>%3
Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <comment>%3: a sentence about lines that were skipped</comment>
        <translation>%3
Przejęte skróty: %1, pominięte: %2. OK je zatwierdza, Wyzeruj je wycofuje.</translation>
    </message>
    <message>
        <source>&amp;Export keys...</source>
        <translation>&amp;Eksportuj klawisze...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>&amp;Importuj klawisze...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>Zapisz ściągę jako &amp;HTML...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;text...</source>
        <translation>Zapisz ściągę jako &amp;tekst...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>&amp;Kopiuj ściągę</translation>
    </message>
    <message>
        <source>Export keys</source>
        <translation>Eksportuj klawisze</translation>
    </message>
    <message>
        <source>Keys (*.ini);;All files (*)</source>
        <translation>Klawisze (*.ini);;Wszystkie pliki (*)</translation>
    </message>
    <message>
        <source>%1
Choose another folder or another name, and try again.</source>
        <translation>%1
Wybierz inny katalog lub inną nazwę i spróbuj ponownie.</translation>
    </message>
    <message>
        <source>Import keys</source>
        <translation>Importuj klawisze</translation>
    </message>
    <message>
        <source>%1
Choose a file that was written with &apos;Export keys...&apos;.</source>
        <translation>%1
Wybierz plik zapisany za pomocą „Eksportuj klawisze...”.</translation>
    </message>
    <message>
        <source>HTML documents (*.html);;All files (*)</source>
        <translation>Dokumenty HTML (*.html);;Wszystkie pliki (*)</translation>
    </message>
    <message>
        <source>Plain text (*.txt);;All files (*)</source>
        <translation>Zwykły tekst (*.txt);;Wszystkie pliki (*)</translation>
    </message>
    <message>
        <source>Save cheat sheet</source>
        <translation>Zapisz ściągę</translation>
    </message>
    <message>
        <source>The cheat sheet could not be saved to %1: %2
Choose another folder or another name, and try again.</source>
        <comment>%2: what the system says</comment>
        <translation>Nie można zapisać ściągi do %1: %2
Wybierz inny katalog lub inną nazwę i spróbuj ponownie.</translation>
    </message>
</context>
<context>
    <name>SchemeQuestion</name>
    <message>
        <source>Import keys</source>
        <translation>Importuj klawisze</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Zastąp</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>&amp;Pomiń</translation>
    </message>
    <message>
        <source>&amp;Do the same with all further ones</source>
        <translation>Zrób &amp;tak samo ze wszystkimi następnymi</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but the global action &apos;%3&apos; has it. Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>Plik zawiera skrót „%1” dla działania „%2”, ale ma go globalne działanie „%3”. Pomiń pozostawia działanie „%2” bez zmian; Anuluj niczego nie przejmuje.</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but action &apos;%3&apos; has it, too. Replace takes it away from action &apos;%3&apos;, Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>Plik zawiera skrót „%1” dla działania „%2”, ale ma go też działanie „%3”. Zastąp odbiera go działaniu „%3”, Pomiń pozostawia działanie „%2” bez zmian; Anuluj niczego nie przejmuje.</translation>
    </message>
</context>
<context>
    <name>ShortcutClash</name>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;.</source>
        <translation>Skrót „%1” jest już używany przez działanie „%2”.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; of action &apos;%3&apos; begins with &apos;%1&apos;.</source>
        <translation>Skrót „%2” działania „%3” zaczyna się od „%1”.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; begins with &apos;%1&apos;, the shortcut of action &apos;%3&apos;.</source>
        <translation>Skrót „%2” zaczyna się od „%1”, skrótu działania „%3”.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; opens the menu &apos;%2&apos;.</source>
        <translation>Skrót „%1” otwiera menu „%2”.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; leads to &apos;%2&apos; in the window.</source>
        <translation>Skrót „%1” prowadzi do „%2” w oknie.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is the standard shortcut for &apos;%2&apos;.</source>
        <translation>Skrót „%1” jest standardowym skrótem dla „%2”.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>Skrót „%1” jest już używany przez globalne działanie „%2”.</translation>
    </message>
    <message>
        <source>With &apos;%1&apos; as a shortcut this key cannot be typed into texts.</source>
        <translation>Gdy „%1” jest skrótem, tego klawisza nie można używać do wpisywania tekstu.</translation>
    </message>
    <message>
        <source>The current keyboard layout cannot produce &apos;%1&apos;.</source>
        <translation>Bieżący układ klawiatury nie pozwala uzyskać „%1”.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is a further shortcut of action &apos;%2&apos;.</source>
        <translation>Skrót „%1” jest dodatkowym skrótem działania „%2”.</translation>
    </message>
</context>
<context>
    <name>ShortcutDelegate</name>
    <message>
        <source>Back to no shortcut</source>
        <translation>Wróć do braku skrótu</translation>
    </message>
    <message>
        <source>Back to %1</source>
        <translation>Wróć do %1</translation>
    </message>
</context>
<context>
    <name>ShortcutFilterBar</name>
    <message>
        <source>Press keys</source>
        <translation>Naciśnij klawisze</translation>
    </message>
    <message>
        <source>Changed only</source>
        <translation>Tylko zmienione</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtr</translation>
    </message>
    <message>
        <source>Shows who has the keys that you press; Escape ends it.</source>
        <translation>Pokazuje, kto ma naciśnięte klawisze; Escape to kończy.</translation>
    </message>
    <message>
        <source>Shows the actions alone whose shortcut is not the default one, or was edited.</source>
        <translation>Pokazuje tylko działania, których skrót nie jest domyślny lub był edytowany.</translation>
    </message>
    <message>
        <source>Press the keys to look for</source>
        <translation>Naciśnij szukane klawisze</translation>
    </message>
    <message>
        <source>Filter by name, group or shortcut</source>
        <translation>Filtruj według nazwy, grupy lub skrótu</translation>
    </message>
</context>
<context>
    <name>ShortcutScheme</name>
    <message>
        <source>The shortcuts could not be saved to %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Nie można zapisać skrótów w %1: %2</translation>
    </message>
    <message>
        <source>The shortcuts could not be read from %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Nie można odczytać skrótów z %1: %2</translation>
    </message>
    <message>
        <source>%1 is not a regular file.</source>
        <translation>%1 nie jest zwykłym plikiem.</translation>
    </message>
    <message>
        <source>%1 is too large for a file of shortcuts.</source>
        <translation>%1 jest za duży jak na plik skrótów.</translation>
    </message>
    <message>
        <source>%1 holds no shortcuts.</source>
        <translation>%1 nie zawiera skrótów.</translation>
    </message>
    <message>
        <source>Unreadable shortcuts in %1 were skipped: %2</source>
        <comment>%2: their number</comment>
        <translation>Pominięto nieczytelne skróty w %1: %2</translation>
    </message>
</context>
<context>
    <name>ShortcutSheet</name>
    <message>
        <source>Keyboard shortcuts</source>
        <comment>title of a printed sheet</comment>
        <translation>Skróty klawiszowe</translation>
    </message>
</context>
<context>
    <name>ShortcutsModel</name>
    <message>
        <source>Action</source>
        <translation>Działanie</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Skrót</translation>
    </message>
    <message>
        <source>%1, changed</source>
        <comment>%1: an action or a key</comment>
        <translation>%1, zmienione</translation>
    </message>
    <message>
        <source>No shortcut</source>
        <translation>Brak skrótu</translation>
    </message>
    <message>
        <source>There is no default shortcut.</source>
        <translation>Nie ma skrótu domyślnego.</translation>
    </message>
    <message>
        <source>The default shortcut is %1.</source>
        <translation>Skrót domyślny to %1.</translation>
    </message>
</context>
<context>
    <name>StandardKeyNames</name>
    <message>
        <source>Help</source>
        <translation>Pomoc</translation>
    </message>
    <message>
        <source>What&apos;s this?</source>
        <translation>Co to jest?</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Otwórz</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Zamknij</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Zapisz</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>Zapisz jako</translation>
    </message>
    <message>
        <source>New</source>
        <translation>Nowy</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Usuń</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Wytnij</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Kopiuj</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Wklej</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Cofnij</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Przywróć</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Wstecz</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Dalej</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Odśwież</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Powiększ</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Pomniejsz</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Drukuj</translation>
    </message>
    <message>
        <source>New tab</source>
        <translation>Nowa karta</translation>
    </message>
    <message>
        <source>Next tab</source>
        <translation>Następna karta</translation>
    </message>
    <message>
        <source>Previous tab</source>
        <translation>Poprzednia karta</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Znajdź</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Znajdź następne</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Znajdź poprzednie</translation>
    </message>
    <message>
        <source>Replace</source>
        <translation>Zastąp</translation>
    </message>
    <message>
        <source>Select all</source>
        <translation>Zaznacz wszystko</translation>
    </message>
    <message>
        <source>Deselect</source>
        <translation>Usuń zaznaczenie</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Pełny ekran</translation>
    </message>
    <message>
        <source>Preferences</source>
        <translation>Ustawienia</translation>
    </message>
    <message>
        <source>Quit</source>
        <translation>Zakończ</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Anuluj</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Pogrubienie</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Kursywa</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Podkreślenie</translation>
    </message>
    <message>
        <source>Move the cursor</source>
        <translation>Przesuń kursor</translation>
    </message>
    <message>
        <source>Select text</source>
        <translation>Zaznacz tekst</translation>
    </message>
    <message>
        <source>Edit text</source>
        <translation>Edytuj tekst</translation>
    </message>
</context>
<context>
    <name>StringListEdit</name>
    <message>
        <source>Form</source>
        <translation>Formularz</translation>
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
        <translation>&amp;Przywróć ten skrót</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryEditDialog</name>
    <message>
        <source>Warning</source>
        <translation>Ostrzeżenie</translation>
    </message>
    <message>
        <source>no executable</source>
        <translation>brak pliku wykonywalnego</translation>
    </message>
    <message>
        <source>can&apos;t find executable</source>
        <translation>nie można znaleźć pliku wykonywalnego</translation>
    </message>
    <message>
        <source>can&apos;t find try executable</source>
        <translation>nie można znaleźć pliku wykonywalnego do sprawdzenia</translation>
    </message>
    <message>
        <source>can&apos;t find URL</source>
        <translation>nie można znaleźć adresu URL</translation>
    </message>
    <message>
        <source>wrong/incomplete desktop entry</source>
        <translation>błędny lub niepełny wpis pulpitu</translation>
    </message>
    <message>
        <source>Can&apos;t save position on desktop for %1</source>
        <translation>Nie można zapisać położenia %1 na pulpicie</translation>
    </message>
    <message>
        <source>Copy from...</source>
        <translation>Skopiuj z...</translation>
    </message>
    <message>
        <source>Can&apos;t load file %1</source>
        <translation>Nie można wczytać pliku %1</translation>
    </message>
    <message>
        <source>Desktop Entry Editor</source>
        <translation>Edytor wpisów pulpitu</translation>
    </message>
    <message>
        <source>You create hidden desktop entry</source>
        <translation>Tworzysz ukryty wpis pulpitu</translation>
    </message>
    <message>
        <source>Can&apos;t save file %1</source>
        <translation>Nie można zapisać pliku %1</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Pomoc</translation>
    </message>
    <message>
        <source>&lt;b&gt;Desktop entry&lt;/b&gt; is a multipurpose info file for installed apps, devices, etc. It can be used to build menu entries, shortcuts, etc. This dialog implements the &apos;Desktop Entry Standard&apos; of &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Desktop entry file is a text ini-like file with one main section [Desktop Entry] and possible additional sections for each action defined in the main section field &apos;Actions&apos;. All fields are text string pairs: key=value. Value can also be a semicolon separated string list.</source>
        <translation>&lt;b&gt;Wpis pulpitu&lt;/b&gt; to uniwersalny plik z informacjami o zainstalowanych programach, urządzeniach itp. Można z niego tworzyć pozycje menu, skróty itp. To okno jest zgodne z normą „Desktop Entry Standard” ze strony &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Plik wpisu pulpitu to plik tekstowy podobny do pliku ini z jedną sekcją główną [Desktop Entry] i ewentualnymi dodatkowymi sekcjami dla każdego działania określonego w polu „Actions” sekcji głównej. Wszystkie pola są parami ciągów znaków: klucz=wartość. Wartością może być także lista ciągów znaków oddzielonych średnikami.</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryPropsWidgetPrivate</name>
    <message>
        <source>Information about the URL</source>
        <translation>Informacje o adresie URL</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Pokaż tylko w</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Nie pokazuj w</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Dodaj środowisko pulpitu:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Edytuj środowisko pulpitu:</translation>
    </message>
    <message>
        <source>MIME type or file name extension:</source>
        <translation>Typ MIME lub rozszerzenie nazwy pliku:</translation>
    </message>
    <message>
        <source>MIME type</source>
        <translation>Typ MIME</translation>
    </message>
    <message>
        <source>Add MIME type</source>
        <translation>Dodawanie typu MIME</translation>
    </message>
    <message>
        <source>Edit MIME type</source>
        <translation>Edycja typu MIME</translation>
    </message>
    <message>
        <source>Categories</source>
        <translation>Kategorie</translation>
    </message>
    <message>
        <source>Add category</source>
        <translation>Dodawanie kategorii</translation>
    </message>
    <message>
        <source>Category:</source>
        <translation>Kategoria:</translation>
    </message>
    <message>
        <source>Edit category</source>
        <translation>Edycja kategorii</translation>
    </message>
    <message>
        <source>Keywords</source>
        <translation>Słowa kluczowe</translation>
    </message>
    <message>
        <source>Add keyword</source>
        <translation>Dodawanie słowa kluczowego</translation>
    </message>
    <message>
        <source>Keyword:</source>
        <translation>Słowo kluczowe:</translation>
    </message>
    <message>
        <source>Edit keyword</source>
        <translation>Edycja słowa kluczowego</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Działania</translation>
    </message>
    <message>
        <source>Add action</source>
        <translation>Dodawanie działania</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Edycja działania</translation>
    </message>
    <message>
        <source>Application</source>
        <translation>Program</translation>
    </message>
    <message>
        <source>Link</source>
        <translation>Dowiązanie</translation>
    </message>
    <message>
        <source>Directory</source>
        <translation>Katalog</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Uwaga</translation>
    </message>
    <message>
        <source>Desktop entry type was changed.
Some field values may be lost...
Continue?</source>
        <translation>Zmieniono rodzaj wpisu pulpitu.
Wartości niektórych pól mogą zostać utracone...
Kontynuować?</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>Rodzaj</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nazwa</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Ikona</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Polecenie</translation>
    </message>
    <message>
        <source>Terminal</source>
        <translation>Terminal</translation>
    </message>
    <message>
        <source>Path</source>
        <translation>Katalog początkowy</translation>
    </message>
    <message>
        <source>Try exec</source>
        <translation>Polecenie sprawdzające</translation>
    </message>
    <message>
        <source>Url</source>
        <translation>Adres URL</translation>
    </message>
    <message>
        <source>Generic name</source>
        <translation>Nazwa ogólna</translation>
    </message>
    <message>
        <source>Comment</source>
        <translation>Komentarz</translation>
    </message>
    <message>
        <source>No display</source>
        <translation>Nie wyświetlaj</translation>
    </message>
    <message>
        <source>Hidden</source>
        <translation>Ukryty</translation>
    </message>
    <message>
        <source>Startup notify</source>
        <translation>Powiadomienie o uruchomieniu</translation>
    </message>
    <message>
        <source>Startup WM class</source>
        <translation>Klasa okna przy uruchomieniu</translation>
    </message>
    <message>
        <source>Version</source>
        <translation>Wersja</translation>
    </message>
</context>
<context>
    <name>VelMenuDialog</name>
    <message>
        <source>Edit</source>
        <translation>Edytuj</translation>
    </message>
    <message>
        <source>Send command to vel-wm to update
 edited menu, toolbar, etc.</source>
        <translation>Wyślij do vel-wm polecenie uaktualnienia
 zmienionego menu, paska narzędzi itp.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Ostrzeżenie</translation>
    </message>
    <message>
        <source>Can&apos;t send command to vel-wm</source>
        <translation>Nie można wysłać polecenia do vel-wm</translation>
    </message>
    <message>
        <source>This menu cannot be changed: the folder %1 does not exist.</source>
        <translation>Tego menu nie można zmienić: katalog %1 nie istnieje.</translation>
    </message>
    <message>
        <source>This menu cannot be changed: you may not write to the folder %1.</source>
        <translation>Tego menu nie można zmienić: nie wolno pisać do katalogu %1.</translation>
    </message>
    <message>
        <source>Show hidden</source>
        <translation>Pokaż ukryte</translation>
    </message>
    <message>
        <source>Filter by name, command or keyword</source>
        <translation>Filtruj według nazwy, polecenia lub słowa kluczowego</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtr</translation>
    </message>
    <message>
        <source>Also show the entries that the menu leaves out</source>
        <translation>Pokaż także wpisy pomijane w menu</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Cofnij</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Błąd</translation>
    </message>
    <message>
        <source>Start menu</source>
        <translation>Menu startowe</translation>
    </message>
</context>
<context>
    <name>VelMenuView</name>
    <message>
        <source>Warning</source>
        <translation>Ostrzeżenie</translation>
    </message>
    <message>
        <source>Can&apos;t start:
%1 %2</source>
        <translation>Nie można uruchomić:
%1 %2</translation>
    </message>
    <message>
        <source>All previous shortcuts
will be lost. Are you sure?</source>
        <translation>Wszystkie poprzednie skróty
zostaną utracone. Czy na pewno?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Edytuj</translation>
    </message>
    <message>
        <source>New folder</source>
        <translation>Nowy katalog</translation>
    </message>
    <message>
        <source>New entry</source>
        <translation>Nowy wpis</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Usuń</translation>
    </message>
    <message>
        <source>Execute</source>
        <translation>Wykonaj</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Znajdź</translation>
    </message>
    <message>
        <source>Find Next</source>
        <translation>Znajdź następne</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Wytnij</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Skopiuj</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Wklej</translation>
    </message>
    <message>
        <source>Default menu...</source>
        <translation>Menu domyślne...</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>W górę</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>W dół</translation>
    </message>
    <message>
        <source>Move</source>
        <translation>Przenieś</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Anuluj</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Grupa</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Skrót</translation>
    </message>
    <message>
        <source>Can&apos;t edit non desktop file</source>
        <translation>Można edytować tylko pliki desktop</translation>
    </message>
    <message>
        <source>Desktop Entry %1</source>
        <translation>Wpis pulpitu %1</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Uwaga</translation>
    </message>
    <message>
        <source>Are you sure to delete it?</source>
        <translation>Czy na pewno usunąć?</translation>
    </message>
    <message>
        <source>Find string:</source>
        <translation>Znajdź ciąg znaków:</translation>
    </message>
    <message>
        <source>&apos;%1&apos; not found .</source>
        <translation>Nie znaleziono „%1”.</translation>
    </message>
    <message>
        <source>Not in the menu: it is not meant for this desktop.</source>
        <translation>Nie ma w menu: wpis nie jest przeznaczony dla tego pulpitu.</translation>
    </message>
    <message>
        <source>Not in the menu: it is meant for other desktops only (%1).</source>
        <translation>Nie ma w menu: wpis jest przeznaczony tylko dla innych pulpitów (%1).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked as deleted (Hidden).</source>
        <translation>Nie ma w menu: wpis jest oznaczony jako usunięty (Hidden).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked not to be displayed (NoDisplay).</source>
        <translation>Nie ma w menu: wpis jest oznaczony jako niepokazywany (NoDisplay).</translation>
    </message>
    <message>
        <source>Not in the menu: the program %1 is not installed (TryExec).</source>
        <translation>Nie ma w menu: program %1 nie jest zainstalowany (TryExec).</translation>
    </message>
    <message>
        <source>This file is not a desktop entry, whatever its name says.</source>
        <translation>Ten plik nie jest wpisem pulpitu, mimo swojej nazwy.</translation>
    </message>
    <message>
        <source>This file cannot be read.</source>
        <translation>Nie można odczytać tego pliku.</translation>
    </message>
    <message>
        <source>This entry has no name. The name of its file is shown.</source>
        <translation>Ten wpis nie ma nazwy. Pokazana jest nazwa jego pliku.</translation>
    </message>
    <message>
        <source>Taking back what was done...</source>
        <translation>Cofanie zmian...</translation>
    </message>
    <message>
        <source>The program that holds the clipboard does not answer. Nothing was pasted.</source>
        <translation>Program, do którego należy schowek, nie odpowiada. Niczego nie wklejono.</translation>
    </message>
    <message>
        <source>Nothing can be created in %1, because there is no such folder.</source>
        <translation>Niczego nie można utworzyć w %1, bo nie ma takiego katalogu.</translation>
    </message>
    <message>
        <source>%1 could not be saved. Make sure that the folder %2 may be written and that the disk is not full, then try again.</source>
        <translation>Nie można zapisać %1. Upewnij się, że do katalogu %2 wolno pisać i że dysk nie jest pełny, a potem spróbuj ponownie.</translation>
    </message>
    <message>
        <source>%1 could not be deleted: %2. Make sure that the folder that holds it may be written, then try again.</source>
        <translation>Nie można usunąć %1: %2. Upewnij się, że do katalogu nadrzędnego wolno pisać, a potem spróbuj ponownie.</translation>
    </message>
    <message>
        <source>%1 was deleted in part only, because %2 could not be deleted: %3. Make sure that its folder may be written, then delete the rest.</source>
        <translation>Usunięto tylko część %1, bo nie można usunąć %2: %3. Upewnij się, że do jego katalogu wolno pisać, a potem usuń resztę.</translation>
    </message>
    <message>
        <source>Nothing in this menu matches &apos;%1&apos;.</source>
        <translation>Nic w tym menu nie pasuje do „%1”.</translation>
    </message>
    <message>
        <source>Searching the menu for &apos;%1&apos;...</source>
        <translation>Szukanie „%1” w menu...</translation>
    </message>
    <message>
        <source>The menu is too large to be searched as a whole. Only a part of it was searched.</source>
        <translation>Menu jest zbyt duże, by przeszukać je w całości. Przeszukano tylko część.</translation>
    </message>
    <message>
        <source>Hide</source>
        <translation>Ukryj</translation>
    </message>
    <message>
        <source>Show again</source>
        <translation>Pokaż znowu</translation>
    </message>
    <message>
        <source>&apos;%1&apos; was not changed: the file %2 cannot be written.</source>
        <translation>„%1” nie zmieniono: nie można zapisać pliku %2.</translation>
    </message>
    <message>
        <source>The order of the folder %1 could not be saved. Make sure that the folder may be written and that the disk is not full, then try again.</source>
        <translation>Nie można zapisać kolejności w katalogu %1. Upewnij się, że do katalogu wolno pisać i że dysk nie jest pełny, a potem spróbuj ponownie.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1. The menu was left as it is.</source>
        <translation>Nie można utworzyć menu domyślnego w %1. Menu pozostało bez zmian.</translation>
    </message>
    <message>
        <source>Menu</source>
        <comment>the tree</comment>
        <translation>Menu</translation>
    </message>
    <message>
        <source>%1 cannot be edited, because the folder %2 may not be written.</source>
        <translation>Nie można edytować %1, bo do katalogu %2 nie wolno pisać.</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Przenoszenie plików...</translation>
    </message>
    <message>
        <source>Copying files...</source>
        <translation>Kopiowanie plików...</translation>
    </message>
    <message>
        <source>Deleting files...</source>
        <translation>Usuwanie plików...</translation>
    </message>
    <message>
        <source>The deletion of %1 was canceled. What was not yet deleted is still there.</source>
        <translation>Usuwanie %1 zostało anulowane. Co nie zostało jeszcze usunięte, nadal istnieje.</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Wczytaj ponownie</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>To menu jest puste. Naciśnij %1, aby dodać nowy wpis, lub kliknij tu prawym przyciskiem, aby zobaczyć, co jeszcze można dodać.</translation>
    </message>
</context>
<context>
    <name>VelUI::ActionPropsDialog</name>
    <message>
        <source>Id</source>
        <translation>Identyfikator</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nazwa</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Ikona</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Polecenie</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Pokaż tylko w</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Dodaj środowisko pulpitu:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Edytuj środowisko pulpitu:</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Nie pokazuj w</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsWidget</name>
    <message>
        <source>Add action</source>
        <translation>Dodawanie działania</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Edycja działania</translation>
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
        <translation>Dodawanie ciągu znaków</translation>
    </message>
    <message>
        <source>String:</source>
        <translation>Ciąg znaków:</translation>
    </message>
    <message>
        <source>Edit string</source>
        <translation>Edycja ciągu znaków</translation>
    </message>
</context>
<context>
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>Edytuj: %1</translation>
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
        <translation>Wybór pliku wykonywalnego programu</translation>
    </message>
</context>
</TS>

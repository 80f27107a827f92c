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
    <name>EntryCheck</name>
    <message>
        <source>The condition &apos;%1&apos; needs a file.</source>
        <translation>Warunek „%1” wymaga pliku.</translation>
    </message>
    <message>
        <source>The file of the condition &apos;%1&apos; is one in the folder of settings, without &apos;/&apos; before it.</source>
        <translation>Plik warunku „%1” znajduje się w katalogu ustawień i nie ma przed nazwą „/”.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a key.</source>
        <translation>Warunek „%1” wymaga klucza.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs &apos;if-session&apos; or &apos;unless-session&apos; and a session.</source>
        <translation>Warunek „%1” wymaga „if-session” lub „unless-session” oraz sesji.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a schema and a key.</source>
        <translation>Warunek „%1” wymaga schematu i klucza.</translation>
    </message>
    <message>
        <source>There is no condition &apos;%1&apos;.</source>
        <translation>Nie ma warunku „%1”.</translation>
    </message>
    <message>
        <source>A category is empty.</source>
        <translation>Jedna z kategorii jest pusta.</translation>
    </message>
    <message>
        <source>There is no registered category &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Nie ma zarejestrowanej kategorii „%1”; własna musi zaczynać się od „X-”.</translation>
    </message>
    <message>
        <source>Change it to &apos;%1&apos;</source>
        <translation>Zmień na „%1”</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; also needs: %2.</source>
        <translation>Kategoria „%1” wymaga także: %2.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; goes with one of these: %2.</source>
        <translation>Kategoria „%1” łączy się z jedną z tych: %2.</translation>
    </message>
    <message>
        <source>Add &apos;%1&apos;</source>
        <translation>Dodaj „%1”</translation>
    </message>
    <message>
        <source>Remove it</source>
        <translation>Usuń</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is out of use.</source>
        <translation>Kategoria „%1” wyszła z użycia.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is only for entries that list desktops in &apos;Only show in&apos;.</source>
        <translation>Kategoria „%1” jest tylko dla wpisów, które wymieniają środowiska w polu „Pokaż tylko w”.</translation>
    </message>
    <message>
        <source>No main category is among them, so menus may not know where to show the entry.</source>
        <translation>Nie ma wśród nich kategorii głównej, więc menu mogą nie wiedzieć, gdzie pokazać wpis.</translation>
    </message>
    <message>
        <source>Several main categories are among them, so the entry may be shown more than once.</source>
        <translation>Jest wśród nich kilka kategorii głównych, więc wpis może pojawić się więcej niż raz.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; stands more than once.</source>
        <translation>„%1” występuje więcej niż raz.</translation>
    </message>
    <message>
        <source>Keep the first</source>
        <translation>Zachowaj pierwsze wystąpienie</translation>
    </message>
    <message>
        <source>The application has no command.</source>
        <translation>Program nie ma polecenia.</translation>
    </message>
    <message>
        <source>The link leads nowhere.</source>
        <translation>Dowiązanie prowadzi donikąd.</translation>
    </message>
    <message>
        <source>A quote is not closed.</source>
        <translation>Cudzysłów nie jest zamknięty.</translation>
    </message>
    <message>
        <source>In quotes, a backslash has to stand before &apos;%1&apos;.</source>
        <translation>W cudzysłowie przed „%1” musi stać ukośnik odwrotny.</translation>
    </message>
    <message>
        <source>The command ends in a single backslash, which stands for nothing.</source>
        <translation>Polecenie kończy się pojedynczym ukośnikiem odwrotnym, który nic nie oznacza.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to stand in double quotes.</source>
        <translation>„%1” musi stać w podwójnym cudzysłowie.</translation>
    </message>
    <message>
        <source>Close the quote</source>
        <translation>Zamknij cudzysłów</translation>
    </message>
    <message>
        <source>Put it in quotes</source>
        <translation>Ujmij w cudzysłów</translation>
    </message>
    <message>
        <source>Have a shell run it</source>
        <translation>Wykonaj w powłoce</translation>
    </message>
    <message>
        <source>Write &apos;%&apos; as &apos;%%&apos;</source>
        <translation>Zapisz „%” jako „%%”</translation>
    </message>
    <message>
        <source>A field code is not complete: &apos;%&apos; ends the command.</source>
        <translation>Kod pola jest niepełny: polecenie kończy się znakiem „%”.</translation>
    </message>
    <message>
        <source>There is no field code &apos;%%1&apos;.</source>
        <translation>Nie ma kodu pola „%%1”.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; is out of use; nothing is put in its place.</source>
        <translation>Kod pola „%%1” wyszedł z użycia; niczym się go nie zastępuje.</translation>
    </message>
    <message>
        <source>Only one of &apos;%f&apos;, &apos;%F&apos;, &apos;%u&apos; and &apos;%U&apos; may stand in a command, and once.</source>
        <translation>W poleceniu może wystąpić tylko jeden z kodów „%f”, „%F”, „%u” i „%U”, i tylko raz.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; stands more than once.</source>
        <translation>Kod pola „%%1” występuje więcej niż raz.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; has to be an argument of its own, not in quotes.</source>
        <translation>Kod pola „%%1” musi być osobnym argumentem, bez cudzysłowu.</translation>
    </message>
    <message>
        <source>The path of the program has a blank: it has to stand in quotes.</source>
        <translation>Ścieżka programu zawiera odstęp: musi być ujęta w cudzysłów.</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;.</source>
        <translation>Nie ma programu „%1”.</translation>
    </message>
    <message>
        <source>The command has to begin with a program.</source>
        <translation>Polecenie musi zaczynać się od programu.</translation>
    </message>
    <message>
        <source>&apos;Try exec&apos; takes the program alone, without quotes and arguments.</source>
        <translation>„Polecenie sprawdzające” przyjmuje sam program, bez cudzysłowów i argumentów.</translation>
    </message>
    <message>
        <source>Keep the program</source>
        <translation>Zostaw sam program</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;, so the entry is not shown.</source>
        <translation>Nie ma programu „%1”, więc wpis nie jest pokazywany.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is missing.</source>
        <translation>Brakuje „%1”.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has translations only, and nothing for all other languages.</source>
        <translation>„%1” ma tylko tłumaczenia, a nic dla pozostałych języków.</translation>
    </message>
    <message>
        <source>Take &apos;%1&apos;</source>
        <translation>Użyj „%1”</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is only for entries of the type &apos;%2&apos;.</source>
        <translation>„%1” jest tylko dla wpisów rodzaju „%2”.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here.</source>
        <translation>„%1” nie jest już tutaj używane.</translation>
    </message>
    <message>
        <source>No key can be called &apos;%1&apos;.</source>
        <translation>Żaden klucz nie może nazywać się „%1”.</translation>
    </message>
    <message>
        <source>There is no key &apos;%1&apos; here; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Nie ma tutaj klucza „%1”; własny musi zaczynać się od „X-”.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; cannot be translated.</source>
        <translation>„%1” nie może być tłumaczone.</translation>
    </message>
    <message>
        <source>&apos;Only show in&apos; and &apos;Not show in&apos; exclude each other.</source>
        <translation>„Pokaż tylko w” i „Nie pokazuj w” wykluczają się wzajemnie.</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>Plik jest pusty.</translation>
    </message>
    <message>
        <source>The first group of the file is not &apos;[Desktop Entry]&apos;.</source>
        <translation>Pierwszą grupą pliku nie jest „[Desktop Entry]”.</translation>
    </message>
    <message>
        <source>The name of the file has to end in &apos;.%1&apos;.</source>
        <translation>Nazwa pliku musi kończyć się na „.%1”.</translation>
    </message>
    <message>
        <source>Lines of the file end in a carriage return.</source>
        <translation>Wiersze pliku kończą się znakiem powrotu karetki.</translation>
    </message>
    <message>
        <source>A line of the file says nothing: %1</source>
        <translation>Wiersz pliku nic nie znaczy: %1</translation>
    </message>
    <message>
        <source>A line of the file stands before all groups: %1</source>
        <translation>Wiersz pliku stoi przed wszystkimi grupami: %1</translation>
    </message>
    <message>
        <source>A line of the file begins with a blank: %1</source>
        <translation>Wiersz pliku zaczyna się odstępem: %1</translation>
    </message>
    <message>
        <source>A blank stands behind a group: %1</source>
        <translation>Za grupą stoi odstęp: %1</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; stands more than once.</source>
        <translation>Grupa „%1” występuje więcej niż raz.</translation>
    </message>
    <message>
        <source>No group can be called &apos;%1&apos;.</source>
        <translation>Żadna grupa nie może nazywać się „%1”.</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; is out of use.</source>
        <translation>Grupa „%1” wyszła z użycia.</translation>
    </message>
    <message>
        <source>There is no group &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Nie ma grupy „%1”; własna musi zaczynać się od „X-”.</translation>
    </message>
    <message>
        <source>The id &apos;%1&apos; of an action may only have letters A to Z, digits and &apos;-&apos;.</source>
        <translation>Identyfikator działania „%1” może zawierać tylko litery od A do Z, cyfry i „-”.</translation>
    </message>
    <message>
        <source>The action &apos;%1&apos; is described, but &apos;Actions&apos; does not name it.</source>
        <translation>Działanie „%1” jest opisane, ale nie wymieniono go w polu „Actions”.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has no &apos;/&apos;.</source>
        <translation>„%1” nie jest typem MIME: brakuje „/”.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: nothing stands behind the &apos;/&apos;.</source>
        <translation>„%1” nie jest typem MIME: za „/” nic nie ma.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: there is no kind &apos;%2&apos;.</source>
        <translation>„%1” nie jest typem MIME: nie ma rodzaju „%2”.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has a character that none has.</source>
        <translation>„%1” nie jest typem MIME: zawiera znak, którego nie ma żaden typ.</translation>
    </message>
    <message>
        <source>MIME types like &apos;%1&apos; are not used for files.</source>
        <translation>Typów MIME takich jak „%1” nie używa się dla plików.</translation>
    </message>
    <message>
        <source>This computer does not know the MIME type &apos;%1&apos;.</source>
        <translation>Ten komputer nie zna typu MIME „%1”.</translation>
    </message>
    <message>
        <source>An action has no id.</source>
        <translation>Jedno z działań nie ma identyfikatora.</translation>
    </message>
    <message>
        <source>Nothing says what the action &apos;%1&apos; is.</source>
        <translation>Nic nie mówi, czym jest działanie „%1”.</translation>
    </message>
    <message>
        <source>There is no registered desktop &apos;%1&apos;; others have to begin with &apos;X-&apos;.</source>
        <translation>Nie ma zarejestrowanego środowiska „%1”; inne muszą zaczynać się od „X-”.</translation>
    </message>
    <message>
        <source>In your language the entry is shown as &apos;%1&apos;.</source>
        <translation>W Twoim języku wpis jest pokazywany jako „%1”.</translation>
    </message>
    <message>
        <source>The comment says no more than the name.</source>
        <translation>Komentarz nie mówi nic ponad nazwę.</translation>
    </message>
    <message>
        <source>The comment says no more than the generic name.</source>
        <translation>Komentarz nie mówi nic ponad nazwę ogólną.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here; it has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>„%1” nie jest już tutaj używane; musi to być „true” lub „false”.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>„%1” musi mieć wartość „true” lub „false”.</translation>
    </message>
    <message>
        <source>Change it to &apos;true&apos;</source>
        <translation>Zmień na „true”</translation>
    </message>
    <message>
        <source>The name of an icon has no suffix like &apos;%1&apos;.</source>
        <translation>Nazwa ikony nie ma rozszerzenia takiego jak „%1”.</translation>
    </message>
    <message>
        <source>Remove the suffix</source>
        <translation>Usuń rozszerzenie</translation>
    </message>
    <message>
        <source>No icon theme has an icon &apos;%1&apos;.</source>
        <translation>Żaden motyw ikon nie zawiera ikony „%1”.</translation>
    </message>
    <message>
        <source>Write the folder in full</source>
        <translation>Zapisz pełną ścieżkę katalogu</translation>
    </message>
    <message>
        <source>The address does not say how to reach it, as &apos;https:&apos; and &apos;file:&apos; do.</source>
        <translation>Adres nie mówi, jak do niego dotrzeć, jak robią to „https:” i „file:”.</translation>
    </message>
    <message>
        <source>The text is not encoded in UTF-8.</source>
        <translation>Tekst nie jest zakodowany w UTF-8.</translation>
    </message>
    <message>
        <source>A control character or tab may not stand here.</source>
        <translation>Nie może tu stać znak sterujący ani tabulator.</translation>
    </message>
    <message>
        <source>The type has to be &apos;Application&apos;, &apos;Link&apos; or &apos;Directory&apos;, not &apos;%1&apos;.</source>
        <translation>Rodzajem musi być „Application”, „Link” lub „Directory”, a nie „%1”.</translation>
    </message>
    <message>
        <source>There is no version &apos;%1&apos; of the standard.</source>
        <translation>Nie ma wersji „%1” standardu.</translation>
    </message>
    <message>
        <source>There is no encoding &apos;%1&apos;.</source>
        <translation>Nie ma kodowania „%1”.</translation>
    </message>
    <message>
        <source>There is no picture &apos;%1&apos;.</source>
        <translation>Nie ma obrazu „%1”.</translation>
    </message>
    <message>
        <source>An icon has a name or a path that begins with &apos;/&apos;.</source>
        <translation>Ikona ma nazwę albo ścieżkę zaczynającą się od „/”.</translation>
    </message>
    <message>
        <source>The path of a folder begins with &apos;/&apos;.</source>
        <translation>Ścieżka katalogu zaczyna się od „/”.</translation>
    </message>
    <message>
        <source>There is no folder &apos;%1&apos;.</source>
        <translation>Nie ma katalogu „%1”.</translation>
    </message>
    <message>
        <source>There is no file &apos;%1&apos;.</source>
        <translation>Nie ma pliku „%1”.</translation>
    </message>
    <message>
        <source>D-Bus cannot start &apos;%1&apos;: a file of a name like &apos;org.example.Program.desktop&apos; is needed.</source>
        <translation>D-Bus nie może uruchomić „%1”: potrzebny jest plik o nazwie w rodzaju „org.example.Program.desktop”.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no name of an interface; such names are like &apos;org.example.Viewer&apos;.</source>
        <translation>„%1” nie jest nazwą interfejsu; takie nazwy wyglądają jak „org.example.Viewer”.</translation>
    </message>
</context>
<context>
    <name>EntryTrial</name>
    <message>
        <source>The entry could not be written to a temporary file.</source>
        <translation>Nie można zapisać wpisu w pliku tymczasowym.</translation>
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
    <name>KeyDescription</name>
    <message>
        <source>Whether the entry starts a program, opens an address or describes a folder of the menu.</source>
        <translation>Czy wpis uruchamia program, otwiera adres, czy opisuje katalog menu.</translation>
    </message>
    <message>
        <source>The name that menus show.</source>
        <translation>Nazwa pokazywana w menu.</translation>
    </message>
    <message>
        <source>The icon that menus show: a name from the icon theme, or the full path of a picture.</source>
        <translation>Ikona pokazywana w menu: nazwa z motywu ikon lub pełna ścieżka obrazu.</translation>
    </message>
    <message>
        <source>The command that starts the program, with codes such as %f for the files that it opens.</source>
        <translation>Polecenie uruchamiające program, z kodami takimi jak %f dla otwieranych plików.</translation>
    </message>
    <message>
        <source>Whether the program needs a terminal window.</source>
        <translation>Czy program potrzebuje okna terminala.</translation>
    </message>
    <message>
        <source>The folder in which the program starts.</source>
        <translation>Katalog, w którym program jest uruchamiany.</translation>
    </message>
    <message>
        <source>A program that has to be installed; without it menus leave the entry out.</source>
        <translation>Program, który musi być zainstalowany; bez niego menu pomijają wpis.</translation>
    </message>
    <message>
        <source>The address that the entry opens.</source>
        <translation>Adres, który wpis otwiera.</translation>
    </message>
    <message>
        <source>What kind of program it is, such as: Web browser.</source>
        <translation>Jakiego rodzaju jest to program, na przykład: Przeglądarka internetowa.</translation>
    </message>
    <message>
        <source>A sentence about the program, which menus show as a tip.</source>
        <translation>Zdanie o programie, które menu pokazują jako podpowiedź.</translation>
    </message>
    <message>
        <source>Whether menus leave the entry out although the program can be used.</source>
        <translation>Czy menu pomijają wpis, choć programu można używać.</translation>
    </message>
    <message>
        <source>Whether the entry counts as deleted.</source>
        <translation>Czy wpis uchodzi za usunięty.</translation>
    </message>
    <message>
        <source>The desktop environments that alone show the entry; none means all.</source>
        <translation>Środowiska pulpitu, które jako jedyne pokazują wpis; brak oznacza wszystkie.</translation>
    </message>
    <message>
        <source>The desktop environments that do not show the entry.</source>
        <translation>Środowiska pulpitu, które nie pokazują wpisu.</translation>
    </message>
    <message>
        <source>The types of files that the program opens.</source>
        <translation>Typy plików, które program otwiera.</translation>
    </message>
    <message>
        <source>The groups of the menu that the program belongs to.</source>
        <translation>Grupy menu, do których program należy.</translation>
    </message>
    <message>
        <source>Words by which a search finds the program beside its name.</source>
        <translation>Słowa, po których wyszukiwanie znajduje program oprócz jego nazwy.</translation>
    </message>
    <message>
        <source>Whether the program tells when it has started, so that the pointer shows it until then.</source>
        <translation>Czy program zgłasza, że się uruchomił, tak by do tego czasu wskaźnik to pokazywał.</translation>
    </message>
    <message>
        <source>The class of the window by which the desktop knows that the program has started.</source>
        <translation>Klasa okna, po której środowisko pulpitu poznaje, że program się uruchomił.</translation>
    </message>
    <message>
        <source>Further things that the program can be started for, such as: New window.</source>
        <translation>Inne rzeczy, do których można uruchomić program, na przykład: Nowe okno.</translation>
    </message>
    <message>
        <source>The version of the standard for entries that this one follows.</source>
        <translation>Wersja standardu wpisów, z którą ten wpis jest zgodny.</translation>
    </message>
    <message>
        <source>%1 Only for users of one language.</source>
        <comment>%1 is a sentence about a key</comment>
        <translation>%1 Tylko dla użytkowników jednego języka.</translation>
    </message>
</context>
<context>
    <name>LanguageNote</name>
    <message>
        <source>Users of %1 see these texts.</source>
        <translation>Użytkownicy języka „%1” widzą te teksty.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those of %2 where one is missing.</source>
        <translation>Użytkownicy języka „%1” widzą te teksty, a gdzie któregoś brakuje, tekst języka „%2”.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those without a language where one is missing.</source>
        <translation>Użytkownicy języka „%1” widzą te teksty, a gdzie któregoś brakuje, tekst bez języka.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts of %2.</source>
        <translation>Użytkownicy języka „%1” widzą teksty języka „%2”.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts without a language.</source>
        <translation>Użytkownicy języka „%1” widzą teksty bez języka.</translation>
    </message>
    <message>
        <source>%1 Texts of their own have: %2.</source>
        <comment>%1 is a sentence, %2 a list of languages</comment>
        <translation>%1 Własne teksty mają: %2.</translation>
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
    <message numerus="yes">
        <source>The deletion was canceled. %n items are still there, in whole or in part.</source>
        <translation>
            <numerusform>Usuwanie zostało anulowane. %n element nadal istnieje, w całości lub w części.</numerusform>
            <numerusform>Usuwanie zostało anulowane. %n elementy nadal istnieją, w całości lub w części.</numerusform>
            <numerusform>Usuwanie zostało anulowane. %n elementów nadal istnieje, w całości lub w części.</numerusform>
        </translation>
    </message>
    <message>
        <source>The deletion was canceled. Still there, in whole or in part: %1.</source>
        <translation>Usuwanie zostało anulowane. Nadal istnieją, w całości lub w części: %1.</translation>
    </message>
</context>
<context>
    <name>MenuDrop</name>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;. Keep both gives the new one another file name, Replace puts the old one into the trash, Skip leaves the new one where it is; Cancel leaves everything as it is.</source>
        <translation>Katalog „%1” zawiera już „%2”. „Zachowaj oba” nadaje nowemu elementowi inną nazwę pliku, „Zastąp” przenosi stary do kosza, „Pomiń” pozostawia nowy tam, gdzie jest; „Anuluj” pozostawia wszystko bez zmian.</translation>
    </message>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;, which the new one comes from. Keep both gives the new one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>Katalog „%1” zawiera już „%2”, od którego nowy element pochodzi. „Zachowaj oba” nadaje nowemu elementowi inną nazwę pliku, „Pomiń” pozostawia go tam, gdzie jest; „Anuluj” pozostawia wszystko bez zmian.</translation>
    </message>
    <message>
        <source>Another one that comes to the folder &apos;%1&apos; has the same file name as &apos;%2&apos;. Keep both gives this one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>Inny element trafiający do katalogu „%1” ma tę samą nazwę pliku co „%2”. „Zachowaj oba” nadaje temu elementowi inną nazwę pliku, „Pomiń” pozostawia go tam, gdzie jest; „Anuluj” pozostawia wszystko bez zmian.</translation>
    </message>
    <message>
        <source>Name already taken</source>
        <translation>Nazwa jest już zajęta</translation>
    </message>
    <message>
        <source>&amp;Keep both</source>
        <translation>Zachowaj &amp;oba</translation>
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
    <message numerus="yes">
        <source>Undo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Cofnij usunięcie %1 elementów (%n wpis)</numerusform>
            <numerusform>Cofnij usunięcie %1 elementów (%n wpisy)</numerusform>
            <numerusform>Cofnij usunięcie %1 elementów (%n wpisów)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Ponów usunięcie %1 elementów (%n wpis)</numerusform>
            <numerusform>Ponów usunięcie %1 elementów (%n wpisy)</numerusform>
            <numerusform>Ponów usunięcie %1 elementów (%n wpisów)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 items were deleted (%n entries).</source>
        <translation>
            <numerusform>Usunięte elementy: %1 (%n wpis).</numerusform>
            <numerusform>Usunięte elementy: %1 (%n wpisy).</numerusform>
            <numerusform>Usunięte elementy: %1 (%n wpisów).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo reordering of %n items</source>
        <translation>
            <numerusform>Cofnij zmianę kolejności %n elementu</numerusform>
            <numerusform>Cofnij zmianę kolejności %n elementów</numerusform>
            <numerusform>Cofnij zmianę kolejności %n elementów</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo reordering of %n items</source>
        <translation>
            <numerusform>Ponów zmianę kolejności %n elementu</numerusform>
            <numerusform>Ponów zmianę kolejności %n elementów</numerusform>
            <numerusform>Ponów zmianę kolejności %n elementów</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items have other places.</source>
        <translation>
            <numerusform>%n element ma inne miejsce.</numerusform>
            <numerusform>%n elementy mają inne miejsca.</numerusform>
            <numerusform>%n elementów ma inne miejsca.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo hiding of %n items</source>
        <translation>
            <numerusform>Cofnij ukrycie %n elementu</numerusform>
            <numerusform>Cofnij ukrycie %n elementów</numerusform>
            <numerusform>Cofnij ukrycie %n elementów</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo hiding of %n items</source>
        <translation>
            <numerusform>Ponów ukrycie %n elementu</numerusform>
            <numerusform>Ponów ukrycie %n elementów</numerusform>
            <numerusform>Ponów ukrycie %n elementów</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items are hidden: the menu no longer shows them.</source>
        <translation>
            <numerusform>Ukryto %n element: menu już go nie pokazuje.</numerusform>
            <numerusform>Ukryto %n elementy: menu już ich nie pokazuje.</numerusform>
            <numerusform>Ukryto %n elementów: menu już ich nie pokazuje.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo showing %n items again</source>
        <translation>
            <numerusform>Cofnij ponowne pokazanie %n elementu</numerusform>
            <numerusform>Cofnij ponowne pokazanie %n elementów</numerusform>
            <numerusform>Cofnij ponowne pokazanie %n elementów</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo showing %n items again</source>
        <translation>
            <numerusform>Ponów ponowne pokazanie %n elementu</numerusform>
            <numerusform>Ponów ponowne pokazanie %n elementów</numerusform>
            <numerusform>Ponów ponowne pokazanie %n elementów</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The menu shows %n items again.</source>
        <translation>
            <numerusform>Menu znów pokazuje %n element.</numerusform>
            <numerusform>Menu znów pokazuje %n elementy.</numerusform>
            <numerusform>Menu znów pokazuje %n elementów.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo sorting of folder %1</source>
        <translation>Cofnij sortowanie katalogu %1</translation>
    </message>
    <message>
        <source>Redo sorting of folder %1</source>
        <translation>Ponów sortowanie katalogu %1</translation>
    </message>
    <message>
        <source>The folder %1 was sorted by name.</source>
        <translation>Posortowano katalog %1 według nazwy.</translation>
    </message>
    <message>
        <source>Undo duplication of %1</source>
        <translation>Cofnij powielenie %1</translation>
    </message>
    <message>
        <source>Redo duplication of %1</source>
        <translation>Ponów powielenie %1</translation>
    </message>
    <message>
        <source>%1 was duplicated. The copy is selected.</source>
        <translation>Powielono %1. Kopia jest zaznaczona.</translation>
    </message>
    <message numerus="yes">
        <source>Undo duplication of %n items</source>
        <translation>
            <numerusform>Cofnij powielenie %n elementu</numerusform>
            <numerusform>Cofnij powielenie %n elementów</numerusform>
            <numerusform>Cofnij powielenie %n elementów</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo duplication of %n items</source>
        <translation>
            <numerusform>Ponów powielenie %n elementu</numerusform>
            <numerusform>Ponów powielenie %n elementów</numerusform>
            <numerusform>Ponów powielenie %n elementów</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were duplicated. The copies are selected.</source>
        <translation>
            <numerusform>Powielono %n element. Kopia jest zaznaczona.</numerusform>
            <numerusform>Powielono %n elementy. Kopie są zaznaczone.</numerusform>
            <numerusform>Powielono %n elementów. Kopie są zaznaczone.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo deletion of %1 items (1 entry)</source>
        <translation>Cofnij usunięcie %1 elementów (1 wpis)</translation>
    </message>
    <message>
        <source>Redo deletion of %1 items (1 entry)</source>
        <translation>Ponów usunięcie %1 elementów (1 wpis)</translation>
    </message>
    <message>
        <source>%1 items were deleted (1 entry).</source>
        <translation>Usunięte elementy: %1 (1 wpis).</translation>
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
    <message>
        <source>Can&apos;t link %1: %2</source>
        <translation>Nie można utworzyć dowiązania %1: %2</translation>
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
    <message>
        <source>The file %1 is not a desktop entry: it has no group [Desktop Entry].</source>
        <translation>Plik %1 nie jest wpisem pulpitu: nie ma grupy [Desktop Entry].</translation>
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
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>To menu jest puste. Naciśnij %1, aby dodać nowy wpis, lub kliknij tu prawym przyciskiem, aby zobaczyć, co jeszcze można dodać.</translation>
    </message>
    <message>
        <source>the program %1 ended with an error</source>
        <translation>program %1 zakończył się błędem</translation>
    </message>
    <message>
        <source>the program %1 cannot be run</source>
        <translation>nie można uruchomić programu %1</translation>
    </message>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>I jeszcze %n.</numerusform>
            <numerusform>I jeszcze %n.</numerusform>
            <numerusform>I jeszcze %n.</numerusform>
        </translation>
    </message>
    <message>
        <source>Open containin&amp;g folder</source>
        <translation>Otwó&amp;rz katalog nadrzędny</translation>
    </message>
    <message>
        <source>The folder %1 was not opened: %2.</source>
        <translation>Nie otwarto katalogu %1: %2.</translation>
    </message>
    <message>
        <source>New &amp;folder</source>
        <translation>Nowy &amp;katalog</translation>
    </message>
    <message>
        <source>New entr&amp;y</source>
        <translation>Nowy &amp;wpis</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Edytuj</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Usuń</translation>
    </message>
    <message>
        <source>E&amp;xecute</source>
        <translation>Wyko&amp;naj</translation>
    </message>
    <message>
        <source>F&amp;ind</source>
        <translation>&amp;Znajdź</translation>
    </message>
    <message>
        <source>Find &amp;Next</source>
        <translation>Znajdź n&amp;astępne</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>W&amp;ytnij</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>Skop&amp;iuj</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>Wk&amp;lej</translation>
    </message>
    <message>
        <source>Default &amp;menu...</source>
        <translation>&amp;Menu domyślne...</translation>
    </message>
    <message>
        <source>&amp;Up</source>
        <translation>W &amp;górę</translation>
    </message>
    <message>
        <source>D&amp;own</source>
        <translation>W &amp;dół</translation>
    </message>
    <message>
        <source>Dup&amp;licate</source>
        <translation>&amp;Powiel</translation>
    </message>
    <message>
        <source>&amp;Hide</source>
        <translation>Ukry&amp;j</translation>
    </message>
    <message>
        <source>Sho&amp;w again</source>
        <translation>P&amp;okaż znowu</translation>
    </message>
    <message>
        <source>&amp;Reload</source>
        <translation>Wczy&amp;taj ponownie</translation>
    </message>
    <message>
        <source>&amp;Sort by name</source>
        <translation>&amp;Sortuj według nazwy</translation>
    </message>
    <message>
        <source>The folder %1 is sorted by name already.</source>
        <translation>Katalog %1 jest już posortowany według nazwy.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1, because no application is installed. The menu was left as it is.</source>
        <translation>Nie można utworzyć menu domyślnego w %1, bo nie zainstalowano żadnego programu. Menu pozostało bez zmian.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1: %2. The menu was left as it is.</source>
        <translation>Nie można utworzyć menu domyślnego w %1: %2. Menu pozostało bez zmian.</translation>
    </message>
    <message>
        <source>%1 is no file on this computer. Nothing was moved or copied.</source>
        <translation>%1 nie jest plikiem na tym komputerze. Niczego nie przeniesiono ani nie skopiowano.</translation>
    </message>
    <message>
        <source>%1 was not started: %2.</source>
        <translation>Nie uruchomiono %1: %2.</translation>
    </message>
    <message>
        <source>This menu is empty. Right-click here and choose &apos;%2&apos; to fill it with the applications that are installed, or press %1 for a new entry.</source>
        <translation>To menu jest puste. Kliknij tu prawym przyciskiem i wybierz „%2”, aby wypełnić je zainstalowanymi programami, lub naciśnij %1, aby dodać nowy wpis.</translation>
    </message>
    <message>
        <source>This menu is empty, because no application was found that is installed. Once there is one, right-click here and choose &apos;%2&apos;. Until then, press %1 for an entry of your own.</source>
        <translation>To menu jest puste, bo nie znaleziono żadnego zainstalowanego programu. Gdy jakiś się pojawi, kliknij tu prawym przyciskiem i wybierz „%2”. Do tego czasu naciśnij %1, aby dodać własny wpis.</translation>
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
    <name>VelUI::CategoryChooser</name>
    <message>
        <source>Main category</source>
        <translation>Kategoria główna</translation>
    </message>
    <message>
        <source>Goes with %1</source>
        <translation>Łączy się z: %1</translation>
    </message>
    <message>
        <source>Only beside &quot;Only show in&quot;</source>
        <translation>Tylko razem z „Pokaż tylko w”</translation>
    </message>
    <message>
        <source>Deprecated</source>
        <translation>Przestarzała</translation>
    </message>
    <message>
        <source>Extension</source>
        <comment>a category of somebody&apos;s own, X-...</comment>
        <translation>Rozszerzenie</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Niezarejestrowana</translation>
    </message>
    <message>
        <source>Choose categories</source>
        <translation>Wybór kategorii</translation>
    </message>
    <message>
        <source>Name</source>
        <comment>title of a column</comment>
        <translation>Nazwa</translation>
    </message>
    <message>
        <source>Category</source>
        <comment>title of a column</comment>
        <translation>Kategoria</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Uwaga</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryNames</name>
    <message>
        <source>Audio and video</source>
        <translation>Dźwięk i obraz</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>Dźwięk</translation>
    </message>
    <message>
        <source>Video</source>
        <translation>Wideo</translation>
    </message>
    <message>
        <source>Software development</source>
        <translation>Programowanie</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>Edukacja</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>Gry</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>Grafika</translation>
    </message>
    <message>
        <source>Internet and network</source>
        <translation>Internet i sieć</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>Biuro</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>Nauka</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Ustawienia</translation>
    </message>
    <message>
        <source>System tools</source>
        <translation>Narzędzia systemowe</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Akcesoria</translation>
    </message>
    <message>
        <source>Build tools</source>
        <translation>Narzędzia do budowania programów</translation>
    </message>
    <message>
        <source>Debuggers</source>
        <translation>Debugery</translation>
    </message>
    <message>
        <source>Development environments</source>
        <translation>Środowiska programistyczne</translation>
    </message>
    <message>
        <source>Designers of user interfaces</source>
        <translation>Projektowanie interfejsów</translation>
    </message>
    <message>
        <source>Profilers</source>
        <translation>Profilery</translation>
    </message>
    <message>
        <source>Revision control</source>
        <translation>Kontrola wersji</translation>
    </message>
    <message>
        <source>Translation tools</source>
        <translation>Narzędzia do tłumaczeń</translation>
    </message>
    <message>
        <source>Calendars</source>
        <translation>Kalendarze</translation>
    </message>
    <message>
        <source>Address books</source>
        <translation>Książki adresowe</translation>
    </message>
    <message>
        <source>Databases</source>
        <translation>Bazy danych</translation>
    </message>
    <message>
        <source>Dictionaries</source>
        <translation>Słowniki</translation>
    </message>
    <message>
        <source>Charts</source>
        <translation>Wykresy</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>Poczta elektroniczna</translation>
    </message>
    <message>
        <source>Finances</source>
        <translation>Finanse</translation>
    </message>
    <message>
        <source>Flow charts</source>
        <translation>Schematy blokowe</translation>
    </message>
    <message>
        <source>Handheld devices</source>
        <translation>Urządzenia kieszonkowe</translation>
    </message>
    <message>
        <source>Project management</source>
        <translation>Zarządzanie projektami</translation>
    </message>
    <message>
        <source>Presentations</source>
        <translation>Prezentacje</translation>
    </message>
    <message>
        <source>Spreadsheets</source>
        <translation>Arkusze kalkulacyjne</translation>
    </message>
    <message>
        <source>Word processors</source>
        <translation>Edytory dokumentów</translation>
    </message>
    <message>
        <source>Two-dimensional graphics</source>
        <translation>Grafika dwuwymiarowa</translation>
    </message>
    <message>
        <source>Vector graphics</source>
        <translation>Grafika wektorowa</translation>
    </message>
    <message>
        <source>Raster graphics</source>
        <translation>Grafika rastrowa</translation>
    </message>
    <message>
        <source>Three-dimensional graphics</source>
        <translation>Grafika trójwymiarowa</translation>
    </message>
    <message>
        <source>Scanning</source>
        <translation>Skanowanie</translation>
    </message>
    <message>
        <source>Text recognition</source>
        <translation>Rozpoznawanie tekstu</translation>
    </message>
    <message>
        <source>Photography</source>
        <translation>Fotografia</translation>
    </message>
    <message>
        <source>Desktop publishing</source>
        <translation>Skład publikacji</translation>
    </message>
    <message>
        <source>Viewers</source>
        <translation>Przeglądarki plików</translation>
    </message>
    <message>
        <source>Text tools</source>
        <translation>Narzędzia tekstowe</translation>
    </message>
    <message>
        <source>Desktop settings</source>
        <translation>Ustawienia pulpitu</translation>
    </message>
    <message>
        <source>Hardware settings</source>
        <translation>Ustawienia sprzętu</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>Drukowanie</translation>
    </message>
    <message>
        <source>Package managers</source>
        <translation>Zarządzanie pakietami</translation>
    </message>
    <message>
        <source>Dial-up connections</source>
        <translation>Połączenia wdzwaniane</translation>
    </message>
    <message>
        <source>Instant messaging</source>
        <translation>Komunikatory</translation>
    </message>
    <message>
        <source>Chat</source>
        <translation>Rozmowy</translation>
    </message>
    <message>
        <source>IRC</source>
        <translation>IRC</translation>
    </message>
    <message>
        <source>News feeds</source>
        <translation>Kanały wiadomości</translation>
    </message>
    <message>
        <source>File transfer</source>
        <translation>Przesyłanie plików</translation>
    </message>
    <message>
        <source>Amateur radio</source>
        <translation>Krótkofalarstwo</translation>
    </message>
    <message>
        <source>Newsgroups</source>
        <translation>Grupy dyskusyjne</translation>
    </message>
    <message>
        <source>File sharing</source>
        <translation>Wymiana plików</translation>
    </message>
    <message>
        <source>Remote access</source>
        <translation>Dostęp zdalny</translation>
    </message>
    <message>
        <source>Telephony</source>
        <translation>Telefonia</translation>
    </message>
    <message>
        <source>Telephony tools</source>
        <translation>Narzędzia telefoniczne</translation>
    </message>
    <message>
        <source>Video conferences</source>
        <translation>Wideokonferencje</translation>
    </message>
    <message>
        <source>Web browsers</source>
        <translation>Przeglądarki internetowe</translation>
    </message>
    <message>
        <source>Web development</source>
        <translation>Tworzenie stron internetowych</translation>
    </message>
    <message>
        <source>MIDI</source>
        <translation>MIDI</translation>
    </message>
    <message>
        <source>Mixers</source>
        <translation>Miksery</translation>
    </message>
    <message>
        <source>Sequencers</source>
        <translation>Sekwencery</translation>
    </message>
    <message>
        <source>Tuners</source>
        <translation>Stroiki</translation>
    </message>
    <message>
        <source>Television</source>
        <translation>Telewizja</translation>
    </message>
    <message>
        <source>Audio and video editing</source>
        <translation>Edycja dźwięku i wideo</translation>
    </message>
    <message>
        <source>Players</source>
        <translation>Odtwarzacze</translation>
    </message>
    <message>
        <source>Recorders</source>
        <translation>Rejestratory</translation>
    </message>
    <message>
        <source>Disc burning</source>
        <translation>Nagrywanie płyt</translation>
    </message>
    <message>
        <source>Action games</source>
        <translation>Gry akcji</translation>
    </message>
    <message>
        <source>Adventure games</source>
        <translation>Gry przygodowe</translation>
    </message>
    <message>
        <source>Arcade games</source>
        <translation>Gry zręcznościowe</translation>
    </message>
    <message>
        <source>Board games</source>
        <translation>Gry planszowe</translation>
    </message>
    <message>
        <source>Falling blocks games</source>
        <translation>Spadające klocki</translation>
    </message>
    <message>
        <source>Card games</source>
        <translation>Gry karciane</translation>
    </message>
    <message>
        <source>Games for children</source>
        <translation>Gry dla dzieci</translation>
    </message>
    <message>
        <source>Logic games</source>
        <translation>Gry logiczne</translation>
    </message>
    <message>
        <source>Role-playing games</source>
        <translation>Gry fabularne</translation>
    </message>
    <message>
        <source>Shooters</source>
        <translation>Strzelanki</translation>
    </message>
    <message>
        <source>Simulations</source>
        <translation>Symulacje</translation>
    </message>
    <message>
        <source>Sports games</source>
        <translation>Gry sportowe</translation>
    </message>
    <message>
        <source>Strategy games</source>
        <translation>Gry strategiczne</translation>
    </message>
    <message>
        <source>Art</source>
        <translation>Sztuka</translation>
    </message>
    <message>
        <source>Construction</source>
        <translation>Budownictwo</translation>
    </message>
    <message>
        <source>Music</source>
        <translation>Muzyka</translation>
    </message>
    <message>
        <source>Languages</source>
        <translation>Języki</translation>
    </message>
    <message>
        <source>Artificial intelligence</source>
        <translation>Sztuczna inteligencja</translation>
    </message>
    <message>
        <source>Astronomy</source>
        <translation>Astronomia</translation>
    </message>
    <message>
        <source>Biology</source>
        <translation>Biologia</translation>
    </message>
    <message>
        <source>Chemistry</source>
        <translation>Chemia</translation>
    </message>
    <message>
        <source>Computer science</source>
        <translation>Informatyka</translation>
    </message>
    <message>
        <source>Data visualization</source>
        <translation>Wizualizacja danych</translation>
    </message>
    <message>
        <source>Economics</source>
        <translation>Ekonomia</translation>
    </message>
    <message>
        <source>Electricity</source>
        <translation>Elektryczność</translation>
    </message>
    <message>
        <source>Geography</source>
        <translation>Geografia</translation>
    </message>
    <message>
        <source>Geology</source>
        <translation>Geologia</translation>
    </message>
    <message>
        <source>Earth sciences</source>
        <translation>Nauki o Ziemi</translation>
    </message>
    <message>
        <source>History</source>
        <translation>Historia</translation>
    </message>
    <message>
        <source>Humanities</source>
        <translation>Nauki humanistyczne</translation>
    </message>
    <message>
        <source>Image processing</source>
        <translation>Przetwarzanie obrazów</translation>
    </message>
    <message>
        <source>Literature</source>
        <translation>Literatura</translation>
    </message>
    <message>
        <source>Maps</source>
        <translation>Mapy</translation>
    </message>
    <message>
        <source>Mathematics</source>
        <translation>Matematyka</translation>
    </message>
    <message>
        <source>Numerical analysis</source>
        <translation>Analiza numeryczna</translation>
    </message>
    <message>
        <source>Medicine</source>
        <translation>Medycyna</translation>
    </message>
    <message>
        <source>Physics</source>
        <translation>Fizyka</translation>
    </message>
    <message>
        <source>Robotics</source>
        <translation>Robotyka</translation>
    </message>
    <message>
        <source>Spirituality</source>
        <translation>Duchowość</translation>
    </message>
    <message>
        <source>Sports</source>
        <translation>Sport</translation>
    </message>
    <message>
        <source>Parallel computing</source>
        <translation>Obliczenia równoległe</translation>
    </message>
    <message>
        <source>Amusement</source>
        <translation>Rozrywka</translation>
    </message>
    <message>
        <source>Archiving</source>
        <translation>Archiwizacja</translation>
    </message>
    <message>
        <source>Compression</source>
        <translation>Kompresja</translation>
    </message>
    <message>
        <source>Electronics</source>
        <translation>Elektronika</translation>
    </message>
    <message>
        <source>Emulators</source>
        <translation>Emulatory</translation>
    </message>
    <message>
        <source>Engineering</source>
        <translation>Inżynieria</translation>
    </message>
    <message>
        <source>File tools</source>
        <translation>Narzędzia plikowe</translation>
    </message>
    <message>
        <source>File managers</source>
        <translation>Menedżery plików</translation>
    </message>
    <message>
        <source>Terminals</source>
        <translation>Terminale</translation>
    </message>
    <message>
        <source>File systems</source>
        <translation>Systemy plików</translation>
    </message>
    <message>
        <source>Monitors</source>
        <translation>Monitory systemu</translation>
    </message>
    <message>
        <source>Security</source>
        <translation>Bezpieczeństwo</translation>
    </message>
    <message>
        <source>Accessibility</source>
        <translation>Ułatwienia dostępu</translation>
    </message>
    <message>
        <source>Calculators</source>
        <translation>Kalkulatory</translation>
    </message>
    <message>
        <source>Clocks</source>
        <translation>Zegary</translation>
    </message>
    <message>
        <source>Text editors</source>
        <translation>Edytory tekstu</translation>
    </message>
    <message>
        <source>Documentation</source>
        <translation>Dokumentacja</translation>
    </message>
    <message>
        <source>For adults</source>
        <translation>Dla dorosłych</translation>
    </message>
    <message>
        <source>Core of the desktop</source>
        <translation>Rdzeń środowiska pulpitu</translation>
    </message>
    <message>
        <source>Made with KDE</source>
        <translation>Oparte na KDE</translation>
    </message>
    <message>
        <source>Made with GNOME</source>
        <translation>Oparte na GNOME</translation>
    </message>
    <message>
        <source>Made with Xfce</source>
        <translation>Oparte na Xfce</translation>
    </message>
    <message>
        <source>Made with GTK</source>
        <translation>Oparte na GTK</translation>
    </message>
    <message>
        <source>Made with Qt</source>
        <translation>Oparte na Qt</translation>
    </message>
    <message>
        <source>Made with Motif</source>
        <translation>Oparte na Motif</translation>
    </message>
    <message>
        <source>Made with Java</source>
        <translation>Oparte na Javie</translation>
    </message>
    <message>
        <source>For the console</source>
        <translation>Dla konsoli</translation>
    </message>
    <message>
        <source>Screen savers</source>
        <translation>Wygaszacze ekranu</translation>
    </message>
    <message>
        <source>Icons of the system tray</source>
        <translation>Ikony zasobnika systemowego</translation>
    </message>
    <message>
        <source>Applets of a panel</source>
        <translation>Aplety panelu</translation>
    </message>
    <message>
        <source>Desktop shells</source>
        <translation>Powłoki pulpitu</translation>
    </message>
    <message>
        <source>Applications</source>
        <translation>Programy</translation>
    </message>
</context>
<context>
    <name>VelUI::ChoiceDialog</name>
    <message>
        <source>Filter</source>
        <translation>Filtr</translation>
    </message>
    <message>
        <source>Type to filter</source>
        <translation>Pisz, aby filtrować</translation>
    </message>
    <message>
        <source>Reading...</source>
        <translation>Odczytywanie...</translation>
    </message>
    <message>
        <source>No match</source>
        <translation>Nic nie pasuje</translation>
    </message>
    <message numerus="yes">
        <source>%n chosen</source>
        <translation>
            <numerusform>Wybrano: %n</numerusform>
            <numerusform>Wybrano: %n</numerusform>
            <numerusform>Wybrano: %n</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::DesktopChooser</name>
    <message>
        <source>Desktop environment</source>
        <translation>Środowisko pulpitu</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Uwaga</translation>
    </message>
    <message>
        <source>This session</source>
        <translation>Ta sesja</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Niezarejestrowane</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsDialog</name>
    <message>
        <source>An action has no id. It can have &quot;%1&quot;.</source>
        <translation>Jedno z działań nie ma identyfikatora. Może mieć „%1”.</translation>
    </message>
    <message>
        <source>Two actions have the id &quot;%1&quot;. The second one can have &quot;%2&quot;.</source>
        <translation>Dwa działania mają identyfikator „%1”. Drugie może mieć „%2”.</translation>
    </message>
    <message>
        <source>No entry can hold the id &quot;%1&quot;. It can be &quot;%2&quot;.</source>
        <translation>Żaden wpis nie może zawierać identyfikatora „%1”. Może to być „%2”.</translation>
    </message>
    <message>
        <source>The id &quot;%1&quot; should have only A to Z, a to z, 0 to 9 and &quot;-&quot; in it, as &quot;%2&quot; has.</source>
        <translation>Identyfikator „%1” powinien zawierać tylko znaki od A do Z, od a do z, od 0 do 9 i „-”, jak „%2”.</translation>
    </message>
    <message numerus="yes">
        <source>%n more id(s) should be changed.</source>
        <translation>
            <numerusform>Należy zmienić jeszcze %n identyfikator.</numerusform>
            <numerusform>Należy zmienić jeszcze %n identyfikatory.</numerusform>
            <numerusform>Należy zmienić jeszcze %n identyfikatorów.</numerusform>
        </translation>
    </message>
    <message>
        <source>Use &quot;%1&quot;</source>
        <translation>Użyj „%1”</translation>
    </message>
    <message>
        <source>Use the proposed ids</source>
        <translation>Użyj proponowanych identyfikatorów</translation>
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
    <name>VelUI::EditStringsDialog</name>
    <message>
        <source>The &quot;;&quot; in &quot;%1&quot; does not separate items, it becomes part of one item.</source>
        <translation>Znak „;” w „%1” nie rozdziela elementów, lecz staje się częścią jednego elementu.</translation>
    </message>
    <message numerus="yes">
        <source>Make %n item(s) of it</source>
        <translation>
            <numerusform>Zrób z tego %n element</numerusform>
            <numerusform>Zrób z tego %n elementy</numerusform>
            <numerusform>Zrób z tego %n elementów</numerusform>
        </translation>
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
    <name>VelUI::EntryFormAssistance</name>
    <message>
        <source>Te&amp;xt</source>
        <comment>button: shows the file of the entry</comment>
        <translation>Te&amp;kst</translation>
    </message>
    <message>
        <source>Shows the file as it would be saved</source>
        <translation>Pokazuje plik w postaci, w jakiej zostałby zapisany</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryTextDialog</name>
    <message>
        <source>Text of the entry</source>
        <translation>Tekst wpisu</translation>
    </message>
    <message>
        <source>The file as it would be saved</source>
        <translation>Plik w postaci, w jakiej zostałby zapisany</translation>
    </message>
    <message>
        <source>Nothing is changed.</source>
        <translation>Nic nie zmieniono.</translation>
    </message>
    <message>
        <source>≠ changed lines: %1, + new lines: %2, removed lines: %3</source>
        <translation>≠ zmienione wiersze: %1, + nowe wiersze: %2, usunięte wiersze: %3</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldChoosers</name>
    <message>
        <source>Choose %1</source>
        <comment>name of a &quot;Choose...&quot; button</comment>
        <translation>Wybierz: %1</translation>
    </message>
    <message>
        <source>Choose...</source>
        <translation>Wybierz...</translation>
    </message>
    <message>
        <source>Chooses from all that are known (Alt+Down)</source>
        <translation>Wybiera spośród wszystkich znanych (Alt+strzałka w dół)</translation>
    </message>
    <message>
        <source>Chooses an installed program (Alt+Down)</source>
        <translation>Wybiera zainstalowany program (Alt+strzałka w dół)</translation>
    </message>
    <message>
        <source>Insert</source>
        <comment>button: a field code</comment>
        <translation>Wstaw</translation>
    </message>
    <message>
        <source>Insert a field code</source>
        <translation>Wstaw kod pola</translation>
    </message>
    <message>
        <source>Inserts a code that stands for the files to open, or for a part of this entry</source>
        <translation>Wstawia kod oznaczający otwierane pliki lub część tego wpisu</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldCodes</name>
    <message>
        <source>%f: one file; for several files the program is started several times</source>
        <translation>%f: jeden plik; dla kilku plików program jest uruchamiany kilka razy</translation>
    </message>
    <message>
        <source>%F: all files, each as a word of its own</source>
        <translation>%F: wszystkie pliki, każdy jako osobne słowo</translation>
    </message>
    <message>
        <source>%u: one address (URL) or file; for several the program is started several times</source>
        <translation>%u: jeden adres (URL) lub plik; dla kilku program jest uruchamiany kilka razy</translation>
    </message>
    <message>
        <source>%U: all addresses (URLs) or files, each as a word of its own</source>
        <translation>%U: wszystkie adresy (URL) lub pliki, każdy jako osobne słowo</translation>
    </message>
    <message>
        <source>%i: --icon and the icon of this entry, if it has one</source>
        <translation>%i: --icon i ikona tego wpisu, jeśli ją ma</translation>
    </message>
    <message>
        <source>%c: the name of this entry, translated</source>
        <translation>%c: nazwa tego wpisu, przetłumaczona</translation>
    </message>
    <message>
        <source>%k: where the file of this entry lies</source>
        <translation>%k: położenie pliku tego wpisu</translation>
    </message>
    <message>
        <source>%%: a percent sign</source>
        <translation>%%: znak procentu</translation>
    </message>
</context>
<context>
    <name>VelUI::FindingLine</name>
    <message>
        <source>Fix</source>
        <translation>Napraw</translation>
    </message>
    <message>
        <source>Fix: %1</source>
        <comment>on a button; %1 is what it does</comment>
        <translation>Napraw: %1</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>how bad something is, and what it is</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Błąd</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Ostrzeżenie</translation>
    </message>
    <message>
        <source>Hint</source>
        <translation>Wskazówka</translation>
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
        <translation>Cofnij zmianę: %1</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Cofnij</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Ponów zmianę: %1</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Ponów</translation>
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
    <name>VelUI::LanguageBar</name>
    <message>
        <source>&amp;Language:</source>
        <translation>&amp;Język:</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Język</translation>
    </message>
    <message>
        <source>Another language...</source>
        <translation>Inny język...</translation>
    </message>
    <message>
        <source>Another language</source>
        <translation>Inny język</translation>
    </message>
    <message>
        <source>Unknown language</source>
        <translation>Nieznany język</translation>
    </message>
    <message>
        <source>%1 (%2), yours: %3 of %4 texts</source>
        <translation>%1 (%2), Twój: %3 z %4 tekstów</translation>
    </message>
    <message>
        <source>%1 (%2), yours: no text yet</source>
        <translation>%1 (%2), Twój: jeszcze bez tekstów</translation>
    </message>
    <message>
        <source>%1 (%2): %3 of %4 texts</source>
        <translation>%1 (%2): %3 z %4 tekstów</translation>
    </message>
    <message>
        <source>%1 (%2): no text yet</source>
        <translation>%1 (%2): jeszcze bez tekstów</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageDialog</name>
    <message>
        <source>Another language</source>
        <translation>Inny język</translation>
    </message>
    <message>
        <source>&amp;Language or its code, such as pt_BR:</source>
        <translation>&amp;Język lub jego kod, na przykład pt_BR:</translation>
    </message>
    <message>
        <source>Language or its code</source>
        <translation>Język lub jego kod</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>a language and its code</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>No language has such a code: it is like de, pt_BR or sr@latin.</source>
        <translation>Żaden język nie ma takiego kodu: kod wygląda jak de, pt_BR lub sr@latin.</translation>
    </message>
    <message>
        <source>The code %1 is well-formed, but no language of this name is known.</source>
        <translation>Kod %1 jest poprawnie zbudowany, ale nie jest znany język o tej nazwie.</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeChooser</name>
    <message>
        <source>Choose MIME types</source>
        <translation>Wybór typów MIME</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeSource</name>
    <message>
        <source>MIME type</source>
        <translation>Typ MIME</translation>
    </message>
    <message>
        <source>Description</source>
        <translation>Opis</translation>
    </message>
    <message>
        <source>File names</source>
        <translation>Nazwy plików</translation>
    </message>
    <message>
        <source>Not in the database</source>
        <translation>Brak w bazie danych</translation>
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
<context>
    <name>VelUI::ProgramChooser</name>
    <message>
        <source>Choose a program</source>
        <translation>Wybór programu</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramSource</name>
    <message>
        <source>Program</source>
        <comment>title of a column</comment>
        <translation>Program</translation>
    </message>
    <message>
        <source>Folder</source>
        <comment>title of a column</comment>
        <translation>Katalog</translation>
    </message>
</context>
<context>
    <name>VelUI::RowFindings</name>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>I jeszcze %n.</numerusform>
            <numerusform>I jeszcze %n.</numerusform>
            <numerusform>I jeszcze %n.</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::TrialLine</name>
    <message>
        <source>Stop</source>
        <comment>button: ends the trial of an entry</comment>
        <translation>Zatrzymaj</translation>
    </message>
    <message>
        <source>T&amp;ry</source>
        <comment>button: runs the entry</comment>
        <translation>W&amp;ypróbuj</translation>
    </message>
    <message>
        <source>Stops the trial</source>
        <translation>Zatrzymuje próbę</translation>
    </message>
    <message>
        <source>Runs the entry as it is now, without saving it</source>
        <translation>Uruchamia wpis w obecnej postaci, bez zapisywania</translation>
    </message>
    <message>
        <source>The program vel-open, which runs entries, could not be started: %1</source>
        <translation>Nie można uruchomić programu vel-open, który uruchamia wpisy: %1</translation>
    </message>
    <message>
        <source>The trial was stopped.</source>
        <translation>Próba została zatrzymana.</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0).</source>
        <translation>Wpis został uruchomiony (kod wyjścia 0).</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0): %1</source>
        <translation>Wpis został uruchomiony (kod wyjścia 0): %1</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1).</source>
        <translation>Nie można uruchomić wpisu (kod wyjścia %1).</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1): %2</source>
        <translation>Nie można uruchomić wpisu (kod wyjścia %1): %2</translation>
    </message>
</context>
</TS>

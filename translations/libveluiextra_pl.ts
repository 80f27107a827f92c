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

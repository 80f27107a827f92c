<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="pl" sourcelanguage="en">
<context>
    <name>DesktopEntryPages</name>
    <message>
        <source>&amp;Read-only</source>
        <translation>Tylko do &amp;odczytu</translation>
    </message>
    <message>
        <source>&amp;Button beside the address</source>
        <translation>&amp;Przycisk obok adresu</translation>
    </message>
    <message>
        <source>Information requested for %1</source>
        <translation>Poproszono o informacje o %1</translation>
    </message>
    <message>
        <source>Use the buttons beside the fields to edit commands, files, icons, lists and actions.</source>
        <translation>Polecenia i pliki, ikony, listy i działania edytuje się przyciskami ich pól.</translation>
    </message>
    <message>
        <source>Properties form</source>
        <translation>Formularz właściwości</translation>
    </message>
    <message>
        <source>Desktop entries</source>
        <translation>Wpisy pulpitu</translation>
    </message>
    <message>
        <source>Paths, icons, lists and actions</source>
        <translation>Ścieżki, ikony, listy i działania</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Pomoc w pracy</translation>
    </message>
</context>
<context>
    <name>EditorCommands</name>
    <message>
        <source>Open</source>
        <translation>Otwórz</translation>
    </message>
    <message>
        <source>Cannot read %1.</source>
        <translation>Nie można odczytać %1.</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Zapisz</translation>
    </message>
    <message>
        <source>Cannot write %1.</source>
        <translation>Nie można zapisać %1.</translation>
    </message>
    <message>
        <source>Go to line</source>
        <translation>Przejście do wiersza</translation>
    </message>
    <message>
        <source>Line:</source>
        <translation>Wiersz:</translation>
    </message>
    <message>
        <source>File</source>
        <translation>Plik</translation>
    </message>
    <message>
        <source>&amp;New</source>
        <translation>&amp;Nowy</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>&amp;Otwórz...</translation>
    </message>
    <message>
        <source>&amp;Save...</source>
        <translation>&amp;Zapisz...</translation>
    </message>
    <message>
        <source>Insert &amp;date</source>
        <translation>Wstaw &amp;datę</translation>
    </message>
    <message>
        <source>Insert &amp;time</source>
        <translation>Wstaw &amp;godzinę</translation>
    </message>
    <message>
        <source>Insert &amp;rule</source>
        <translation>Wstaw &amp;linię rozdzielającą</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Edycja</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Cofnij</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>P&amp;rzywróć</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>W&amp;ytnij</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>S&amp;kopiuj</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>&amp;Wklej</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>Z&amp;aznacz wszystko</translation>
    </message>
    <message>
        <source>Select word</source>
        <translation>Zaznacz słowo</translation>
    </message>
    <message>
        <source>Select line</source>
        <translation>Zaznacz wiersz</translation>
    </message>
    <message>
        <source>Select paragraph</source>
        <translation>Zaznacz akapit</translation>
    </message>
    <message>
        <source>Find selected a&amp;gain</source>
        <translation>Znajdź &amp;następne zaznaczone</translation>
    </message>
    <message>
        <source>Find selected backward</source>
        <translation>Znajdź poprzednie zaznaczone</translation>
    </message>
    <message>
        <source>Find selected word</source>
        <translation>Znajdź zaznaczone słowo</translation>
    </message>
    <message>
        <source>Find selected, matching case</source>
        <translation>Znajdź zaznaczone z uwzględnieniem wielkości liter</translation>
    </message>
    <message>
        <source>Go to &amp;line...</source>
        <translation>Przejdź do w&amp;iersza...</translation>
    </message>
    <message>
        <source>Go to start</source>
        <translation>Przejdź na początek</translation>
    </message>
    <message>
        <source>Go to end</source>
        <translation>Przejdź na koniec</translation>
    </message>
    <message>
        <source>Go to next paragraph</source>
        <translation>Przejdź do następnego akapitu</translation>
    </message>
    <message>
        <source>Go to previous paragraph</source>
        <translation>Przejdź do poprzedniego akapitu</translation>
    </message>
    <message>
        <source>Delete word to the left</source>
        <translation>Usuń słowo po lewej</translation>
    </message>
    <message>
        <source>Delete word to the right</source>
        <translation>Usuń słowo po prawej</translation>
    </message>
    <message>
        <source>Delete to start of line</source>
        <translation>Usuń do początku wiersza</translation>
    </message>
    <message>
        <source>Delete to end of line</source>
        <translation>Usuń do końca wiersza</translation>
    </message>
    <message>
        <source>To upper case</source>
        <translation>Na wielkie litery</translation>
    </message>
    <message>
        <source>To lower case</source>
        <translation>Na małe litery</translation>
    </message>
    <message>
        <source>Swap case</source>
        <translation>Zamień wielkość liter</translation>
    </message>
    <message>
        <source>Capitalize</source>
        <translation>Wielka pierwsza litera</translation>
    </message>
    <message>
        <source>Move line up</source>
        <translation>Przenieś wiersz w górę</translation>
    </message>
    <message>
        <source>Move line down</source>
        <translation>Przenieś wiersz w dół</translation>
    </message>
    <message>
        <source>New line above</source>
        <translation>Nowy wiersz powyżej</translation>
    </message>
    <message>
        <source>New line below</source>
        <translation>Nowy wiersz poniżej</translation>
    </message>
    <message>
        <source>Duplicate lines</source>
        <translation>Powiel wiersze</translation>
    </message>
    <message>
        <source>Join lines</source>
        <translation>Połącz wiersze</translation>
    </message>
    <message>
        <source>Sort lines</source>
        <translation>Uporządkuj wiersze</translation>
    </message>
    <message>
        <source>Reverse lines</source>
        <translation>Odwróć kolejność wierszy</translation>
    </message>
    <message>
        <source>Remove duplicate lines</source>
        <translation>Usuń powtórzone wiersze</translation>
    </message>
    <message>
        <source>Remove empty lines</source>
        <translation>Usuń puste wiersze</translation>
    </message>
    <message>
        <source>Trim lines</source>
        <translation>Przytnij wiersze</translation>
    </message>
    <message>
        <source>Indent lines</source>
        <translation>Zwiększ wcięcie wierszy</translation>
    </message>
    <message>
        <source>Unindent lines</source>
        <translation>Zmniejsz wcięcie wierszy</translation>
    </message>
    <message>
        <source>Comment lines</source>
        <translation>Wykomentuj wiersze</translation>
    </message>
    <message>
        <source>Uncomment lines</source>
        <translation>Odkomentuj wiersze</translation>
    </message>
    <message>
        <source>Tabs to spaces</source>
        <translation>Tabulatory na odstępy</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Widok</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>&amp;Powiększ</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>Po&amp;mniejsz</translation>
    </message>
    <message>
        <source>&amp;Wrap lines</source>
        <translation>&amp;Zawijaj wiersze</translation>
    </message>
    <message>
        <source>&amp;Fixed-width font</source>
        <translation>&amp;Stała szerokość</translation>
    </message>
    <message>
        <source>&amp;Proportional font</source>
        <translation>P&amp;roporcjonalna szerokość</translation>
    </message>
    <message>
        <source>O&amp;verwrite</source>
        <translation>Zas&amp;tępuj</translation>
    </message>
    <message>
        <source>&amp;Read only</source>
        <translation>Tylko do &amp;odczytu</translation>
    </message>
    <message>
        <source>Wide cur&amp;sor</source>
        <translation>Szero&amp;ki kursor</translation>
    </message>
    <message>
        <source>&amp;Center on cursor</source>
        <translation>Wyśro&amp;dkuj na kursorze</translation>
    </message>
    <message>
        <source>Scroll &amp;up</source>
        <translation>Przewiń w &amp;górę</translation>
    </message>
    <message>
        <source>Scroll &amp;down</source>
        <translation>Przewiń w dó&amp;ł</translation>
    </message>
    <message>
        <source>Scroll to &amp;top</source>
        <translation>Przewiń na po&amp;czątek</translation>
    </message>
    <message>
        <source>Scroll to botto&amp;m</source>
        <translation>Przewiń na koni&amp;ec</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Tekst</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Klawisze</translation>
    </message>
    <message>
        <source>The file has %1 for %2, but %3 has it, too.</source>
        <translation>Plik zawiera %1 dla %2, ale ma to też %3.</translation>
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
        <source>Save cheat sheet as te&amp;xt...</source>
        <translation>Zapisz ściągę jako te&amp;kst...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>Kopiuj ś&amp;ciągę</translation>
    </message>
</context>
<context>
    <name>EntryWindow</name>
    <message>
        <source>Unsaved changes</source>
        <translation>Niezapisane zmiany</translation>
    </message>
    <message>
        <source>The entry %1 was changed.
Save the changes?</source>
        <translation>Wpis %1 został zmieniony.
Zapisać zmiany?</translation>
    </message>
</context>
<context>
    <name>FileIconsPage</name>
    <message>
        <source>File icons</source>
        <translation>Ikony plików</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>Modele</translation>
    </message>
</context>
<context>
    <name>GalleryWindow</name>
    <message>
        <source>Widget gallery</source>
        <translation>Galeria elementów interfejsu</translation>
    </message>
    <message>
        <source>Pages</source>
        <translation>Strony</translation>
    </message>
    <message>
        <source>Code of this page</source>
        <translation>Kod tej strony</translation>
    </message>
</context>
<context>
    <name>KeyNamesPage</name>
    <message>
        <source>&amp;Press keys:</source>
        <translation>&amp;Naciśnij klawisze:</translation>
    </message>
    <message>
        <source>In the window manager&apos;s notation:</source>
        <translation>W zapisie zarządcy okien:</translation>
    </message>
    <message>
        <source>Read back:</source>
        <translation>Odczytano z powrotem:</translation>
    </message>
    <message>
        <source>Global action with these keys:</source>
        <translation>Globalne działanie z tymi klawiszami:</translation>
    </message>
    <message>
        <source>Key names</source>
        <translation>Nazwy klawiszy</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Skróty</translation>
    </message>
</context>
<context>
    <name>MenuPages</name>
    <message>
        <source>&amp;Pick an entry...</source>
        <translation>Wy&amp;bierz wpis...</translation>
    </message>
    <message>
        <source>Edit the &amp;menu...</source>
        <translation>Edytuj &amp;menu...</translation>
    </message>
    <message>
        <source>Edit an e&amp;ntry...</source>
        <translation>Edytuj &amp;wpis...</translation>
    </message>
    <message>
        <source>Menu tree</source>
        <translation>Drzewo menu</translation>
    </message>
    <message>
        <source>Menus</source>
        <translation>Menu</translation>
    </message>
    <message>
        <source>Menu and entry dialogs</source>
        <translation>Okna dialogowe menu i wpisu</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Pomoc w pracy</translation>
    </message>
</context>
<context>
    <name>RadioGroupBoxPage</name>
    <message>
        <source>&amp;Automatic configuration</source>
        <translation>Ustawienia &amp;samoczynne</translation>
    </message>
    <message>
        <source>Script address:</source>
        <translation>Adres skryptu:</translation>
    </message>
    <message>
        <source>Ask again at every start</source>
        <translation>Pytaj ponownie przy każdym uruchomieniu</translation>
    </message>
    <message>
        <source>&amp;Manual configuration</source>
        <translation>Ustawienia &amp;ręczne</translation>
    </message>
    <message>
        <source>Host:</source>
        <translation>Komputer:</translation>
    </message>
    <message>
        <source>Port:</source>
        <translation>Port:</translation>
    </message>
    <message>
        <source>Protocol:</source>
        <translation>Protokół:</translation>
    </message>
    <message>
        <source>&amp;Direct connection</source>
        <translation>&amp;Bezpośrednie połączenie</translation>
    </message>
    <message>
        <source>There is nothing to set.</source>
        <translation>Nic nie trzeba ustawiać.</translation>
    </message>
    <message>
        <source>Radio group boxes</source>
        <translation>Pola grup z przyciskiem opcji</translation>
    </message>
    <message>
        <source>Widgets</source>
        <translation>Elementy interfejsu</translation>
    </message>
</context>
<context>
    <name>SettingsPage</name>
    <message>
        <source>Settings file</source>
        <translation>Plik ustawień</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Ustawienia</translation>
    </message>
    <message>
        <source>F&amp;lat buttons</source>
        <translation>&amp;Płaskie przyciski</translation>
    </message>
    <message>
        <source>S&amp;ection:</source>
        <translation>&amp;Sekcja:</translation>
    </message>
    <message>
        <source>&amp;Font:</source>
        <translation>&amp;Czcionka:</translation>
    </message>
    <message>
        <source>&amp;Size:</source>
        <translation>&amp;Rozmiar:</translation>
    </message>
    <message>
        <source>Contents of the file on disk</source>
        <translation>Zawartość pliku na dysku</translation>
    </message>
    <message>
        <source>Name a settings file on the command line to edit it here.</source>
        <translation>Podaj plik ustawień w wierszu poleceń, aby edytować go tutaj.</translation>
    </message>
    <message>
        <source>%1 cannot be opened.</source>
        <translation>Nie można otworzyć %1.</translation>
    </message>
</context>
<context>
    <name>ShortcutsPage</name>
    <message>
        <source>Delete the whole line</source>
        <translation>Usuń cały wiersz</translation>
    </message>
    <message>
        <source>Last command: %1</source>
        <translation>Ostatnie polecenie: %1</translation>
    </message>
    <message>
        <source>one line
another line
and a third one
</source>
        <translation>jeden wiersz
drugi wiersz
i jeszcze trzeci
</translation>
    </message>
    <message>
        <source>Go to the editor</source>
        <translation>Przejdź do edytora</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Widok</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Ustawienia</translation>
    </message>
    <message>
        <source>Configure shortcuts...</source>
        <translation>Ustawienia skrótów...</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Skróty</translation>
    </message>
    <message>
        <source>Configure shortcuts in the plain dialog...</source>
        <translation>Ustaw skróty w prostym oknie...</translation>
    </message>
</context>
<context>
    <name>vel-entryedit</name>
    <message>
        <source>Edits a desktop entry.</source>
        <translation>Edytuje wpis pulpitu.</translation>
    </message>
    <message>
        <source>Make a new entry when there is no such file.</source>
        <translation>Utwórz nowy wpis, jeśli nie ma takiego pliku.</translation>
    </message>
    <message>
        <source>Begin with the values of the entry &lt;file&gt;.</source>
        <translation>Zacznij od wartości wpisu &lt;file&gt;.</translation>
    </message>
    <message>
        <source>Show the entry only.</source>
        <translation>Tylko pokaż wpis.</translation>
    </message>
    <message>
        <source>The entry to edit.</source>
        <translation>Wpis do edycji.</translation>
    </message>
    <message>
        <source>one file has to be named</source>
        <translation>należy podać jeden plik</translation>
    </message>
    <message>
        <source>cannot open %1</source>
        <translation>nie można otworzyć %1</translation>
    </message>
    <message>
        <source>cannot open %1: there is no such file, --create makes a new entry</source>
        <translation>nie można otworzyć %1: nie ma takiego pliku, --create tworzy nowy wpis</translation>
    </message>
    <message>
        <source>cannot open %1: it is no regular file</source>
        <translation>nie można otworzyć %1: to nie jest zwykły plik</translation>
    </message>
    <message>
        <source>cannot open %1: %2</source>
        <translation>nie można otworzyć %1: %2</translation>
    </message>
</context>
<context>
    <name>vel-gallery</name>
    <message>
        <source>the page %1 did not finish loading</source>
        <translation>strona %1 nie została przygotowana</translation>
    </message>
    <message>
        <source>cannot write %1</source>
        <translation>nie można zapisać %1</translation>
    </message>
    <message>
        <source>cannot make the folder %1</source>
        <translation>nie można utworzyć katalogu %1</translation>
    </message>
    <message>
        <source>Shows the library&apos;s widgets, dialogs and models in action.</source>
        <translation>Pokazuje elementy interfejsu, okna dialogowe i modele biblioteki w działaniu.</translation>
    </message>
    <message>
        <source>Start with the page &lt;name&gt;.</source>
        <translation>Zacznij od strony &lt;name&gt;.</translation>
    </message>
    <message>
        <source>Write screenshots of every page, or of the page given with --page, to &lt;dir&gt; and exit.</source>
        <translation>Zapisz w &lt;dir&gt; obrazy wszystkich stron lub strony podanej w --page i zakończ.</translation>
    </message>
    <message>
        <source>The settings file that the settings page edits.</source>
        <translation>Plik ustawień edytowany na stronie ustawień.</translation>
    </message>
    <message>
        <source>Widget gallery</source>
        <translation>Galeria elementów interfejsu</translation>
    </message>
    <message>
        <source>there is no page %1</source>
        <translation>nie ma strony %1</translation>
    </message>
</context>
<context>
    <name>vel-menuedit</name>
    <message>
        <source>cannot create the start menu %1</source>
        <translation>nie można utworzyć menu startowego %1</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>nie ma takiego katalogu: %1</translation>
    </message>
    <message>
        <source>not a directory: %1</source>
        <translation>to nie jest katalog: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>nie można odczytać katalogu %1</translation>
    </message>
    <message>
        <source>Edits the start menu, or picks an entry of it.</source>
        <translation>Edytuje menu startowe lub wybiera z niego wpis.</translation>
    </message>
    <message>
        <source>Show the menu directory &lt;dir&gt; instead of the start menu.</source>
        <translation>Pokaż katalog menu &lt;dir&gt; zamiast menu startowego.</translation>
    </message>
    <message>
        <source>Show the desktop folder.</source>
        <translation>Pokaż katalog pulpitu.</translation>
    </message>
    <message>
        <source>Show the tool bar.</source>
        <translation>Pokaż pasek narzędzi.</translation>
    </message>
    <message>
        <source>Look only, change nothing.</source>
        <translation>Tylko podgląd, bez żadnych zmian.</translation>
    </message>
    <message>
        <source>Show icons of &lt;pixels&gt; pixels.</source>
        <translation>Pokazuj ikony o wielkości &lt;pixels&gt; pikseli.</translation>
    </message>
    <message>
        <source>Pick an entry and print its path and its command line.</source>
        <translation>Wybierz wpis i wypisz jego ścieżkę i wiersz poleceń.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>nieoczekiwany argument: %1</translation>
    </message>
    <message>
        <source>only one of --dir, --desktop and --toolbar can be given</source>
        <translation>można podać tylko jedną z opcji --dir, --desktop i --toolbar</translation>
    </message>
    <message>
        <source>--icon-size needs a number of pixels from 1 to 512, not &quot;%1&quot;</source>
        <translation>--icon-size wymaga liczby pikseli od 1 do 512, a nie „%1”</translation>
    </message>
</context>
<context>
    <name>vel-menuprint</name>
    <message>
        <source>Prints a menu directory in its order.</source>
        <translation>Wypisuje katalog menu w jego kolejności.</translation>
    </message>
    <message>
        <source>The menu directory; the start menu when none is given.</source>
        <translation>Katalog menu; menu startowe, jeśli żadnego nie podano.</translation>
    </message>
    <message>
        <source>unknown format: %1</source>
        <translation>nieznany format: %1</translation>
    </message>
    <message>
        <source>more than one directory</source>
        <translation>podano więcej niż jeden katalog</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>nie ma takiego katalogu: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>nie można odczytać katalogu %1</translation>
    </message>
    <message>
        <source>The menu has more than %1 items or %2 levels, and the rest of it is left out. Look for links that lead into the same folders again.</source>
        <translation>Menu ma więcej niż %1 elementów lub %2 poziomów; reszta została pominięta. Poszukaj dowiązań, które wciąż prowadzą do tych samych katalogów.</translation>
    </message>
    <message>
        <source>What to print: %1. The default is text.</source>
        <translation>Co wypisać: %1. Domyślnie text.</translation>
    </message>
    <message>
        <source>The icon theme to take the files of icons from; the user&apos;s own when none is given.</source>
        <translation>Motyw ikon, z którego brane są pliki ikon; motyw użytkownika, jeśli żadnego nie podano.</translation>
    </message>
    <message>
        <source>The edge of the icons in pixels, 24 by default.</source>
        <translation>Długość boku ikon w pikselach, domyślnie 24.</translation>
    </message>
    <message>
        <source>Reads one of the lines that rofi or dmenu was given from standard input and starts its entry.</source>
        <translation>Odczytaj ze standardowego wejścia jeden z wierszy przekazanych do rofi lub dmenu i uruchom jego wpis.</translation>
    </message>
    <message>
        <source>the size of icons is not between 1 and %1</source>
        <translation>rozmiar ikon nie mieści się między 1 a %1</translation>
    </message>
    <message>
        <source>The start menu is empty: no application is installed.</source>
        <translation>Menu startowe jest puste: nie zainstalowano żadnego programu.</translation>
    </message>
    <message>
        <source>The start menu %1 cannot be made: %2</source>
        <translation>Nie można utworzyć menu startowego %1: %2</translation>
    </message>
    <message>
        <source>%1 is left out, as the line end in its name cannot be written in this format. Rename it.</source>
        <translation>%1 zostaje pominięte, bo znaku końca wiersza w nazwie nie można zapisać w tym formacie. Zmień nazwę.</translation>
    </message>
    <message>
        <source>The start menu is empty: nothing in %1 is shown.</source>
        <translation>Menu startowe jest puste: nic z %1 nie jest pokazywane.</translation>
    </message>
    <message>
        <source>cannot run vel-open: %1</source>
        <translation>nie można uruchomić vel-open: %1</translation>
    </message>
    <message>
        <source>There is no &quot;%1&quot; in the menu.</source>
        <translation>W menu nie ma „%1”.</translation>
    </message>
</context>
<context>
    <name>vel-wmbridge</name>
    <message>
        <source>Owns the window manager&apos;s command channel on a desktop that has none, and runs a command of the shell for each kind of update. The variable VEL_COMMAND holds the line that came.</source>
        <translation>Utrzymuje kanał poleceń zarządcy okien na pulpicie, który go nie ma, i wykonuje polecenie powłoki dla każdego rodzaju uaktualnienia. Zmienna VEL_COMMAND zawiera otrzymany wiersz.</translation>
    </message>
    <message>
        <source>Run when the start menu has changed.</source>
        <translation>Wykonaj po zmianie menu startowego.</translation>
    </message>
    <message>
        <source>Run when the tool bar has changed.</source>
        <translation>Wykonaj po zmianie paska narzędzi.</translation>
    </message>
    <message>
        <source>Run when the desktop&apos;s entries have changed.</source>
        <translation>Wykonaj po zmianie wpisów pulpitu.</translation>
    </message>
    <message>
        <source>Run for every other line.</source>
        <translation>Wykonaj dla każdego innego wiersza.</translation>
    </message>
    <message>
        <source>Take the channel from the program that has it.</source>
        <translation>Przejmij kanał od programu, który go ma.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>nieoczekiwany argument: %1</translation>
    </message>
    <message>
        <source>cannot run the command for %1</source>
        <translation>nie można wykonać polecenia dla %1</translation>
    </message>
    <message>
        <source>another program has taken the channel</source>
        <translation>inny program przejął kanał</translation>
    </message>
    <message>
        <source>cannot take the channel: there is no display, or another program has it</source>
        <translation>nie można przejąć kanału: nie ma ekranu lub ma go inny program</translation>
    </message>
    <message>
        <source>unknown window manager: %1 (known are %2)</source>
        <translation>nieznany zarządca okien: %1 (znane: %2)</translation>
    </message>
    <message>
        <source>Do what this window manager needs to show the start menu as it is: %1.</source>
        <translation>Zrób to, czego ten zarządca okien potrzebuje, aby pokazać menu startowe takim, jakie jest: %1.</translation>
    </message>
</context>
</TS>

<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de" sourcelanguage="en">
<context>
    <name>DesktopEntryPages</name>
    <message>
        <source>&amp;Read-only</source>
        <translation>&amp;Schreibgeschützt</translation>
    </message>
    <message>
        <source>&amp;Button beside the address</source>
        <translation>&amp;Knopf neben der Adresse</translation>
    </message>
    <message>
        <source>Information requested for %1</source>
        <translation>Informationen zu %1 angefordert</translation>
    </message>
    <message>
        <source>Use the buttons beside the fields to edit commands, files, icons, lists and actions.</source>
        <translation>Befehle, Dateien, Symbole, Listen und Aktionen werden mit den Knöpfen neben ihren Feldern bearbeitet.</translation>
    </message>
    <message>
        <source>Properties form</source>
        <translation>Eigenschaftenformular</translation>
    </message>
    <message>
        <source>Desktop entries</source>
        <translation>Desktop-Einträge</translation>
    </message>
    <message>
        <source>Paths, icons, lists and actions</source>
        <translation>Pfade, Symbole, Listen und Aktionen</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Unterstützung</translation>
    </message>
</context>
<context>
    <name>EditorCommands</name>
    <message>
        <source>Open</source>
        <translation>Öffnen</translation>
    </message>
    <message>
        <source>Cannot read %1.</source>
        <translation>%1 kann nicht gelesen werden.</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <source>Cannot write %1.</source>
        <translation>%1 kann nicht geschrieben werden.</translation>
    </message>
    <message>
        <source>Go to line</source>
        <translation>Gehe zu Zeile</translation>
    </message>
    <message>
        <source>Line:</source>
        <translation>Zeile:</translation>
    </message>
    <message>
        <source>File</source>
        <translation>Datei</translation>
    </message>
    <message>
        <source>&amp;New</source>
        <translation>&amp;Neu</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>Ö&amp;ffnen...</translation>
    </message>
    <message>
        <source>&amp;Save...</source>
        <translation>&amp;Speichern...</translation>
    </message>
    <message>
        <source>Insert &amp;date</source>
        <translation>&amp;Datum einfügen</translation>
    </message>
    <message>
        <source>Insert &amp;time</source>
        <translation>&amp;Uhrzeit einfügen</translation>
    </message>
    <message>
        <source>Insert &amp;rule</source>
        <translation>T&amp;rennlinie einfügen</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Bearbeiten</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Rückgängig</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>Wieder&amp;herstellen</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>&amp;Ausschneiden</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Kopieren</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>E&amp;infügen</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>A&amp;lles auswählen</translation>
    </message>
    <message>
        <source>Select word</source>
        <translation>Wort auswählen</translation>
    </message>
    <message>
        <source>Select line</source>
        <translation>Zeile auswählen</translation>
    </message>
    <message>
        <source>Select paragraph</source>
        <translation>Absatz auswählen</translation>
    </message>
    <message>
        <source>Find selected a&amp;gain</source>
        <translation>Auswahl &amp;weitersuchen</translation>
    </message>
    <message>
        <source>Find selected backward</source>
        <translation>Auswahl rückwärts suchen</translation>
    </message>
    <message>
        <source>Find selected word</source>
        <translation>Ausgewähltes Wort suchen</translation>
    </message>
    <message>
        <source>Find selected, matching case</source>
        <translation>Auswahl mit Groß- und Kleinschreibung suchen</translation>
    </message>
    <message>
        <source>Go to &amp;line...</source>
        <translation>&amp;Gehe zu Zeile...</translation>
    </message>
    <message>
        <source>Go to start</source>
        <translation>Zum Anfang</translation>
    </message>
    <message>
        <source>Go to end</source>
        <translation>Zum Ende</translation>
    </message>
    <message>
        <source>Go to next paragraph</source>
        <translation>Zum nächsten Absatz</translation>
    </message>
    <message>
        <source>Go to previous paragraph</source>
        <translation>Zum vorherigen Absatz</translation>
    </message>
    <message>
        <source>Delete word to the left</source>
        <translation>Wort links löschen</translation>
    </message>
    <message>
        <source>Delete word to the right</source>
        <translation>Wort rechts löschen</translation>
    </message>
    <message>
        <source>Delete to start of line</source>
        <translation>Bis zum Zeilenanfang löschen</translation>
    </message>
    <message>
        <source>Delete to end of line</source>
        <translation>Bis zum Zeilenende löschen</translation>
    </message>
    <message>
        <source>To upper case</source>
        <translation>In Großbuchstaben</translation>
    </message>
    <message>
        <source>To lower case</source>
        <translation>In Kleinbuchstaben</translation>
    </message>
    <message>
        <source>Swap case</source>
        <translation>Groß- und Kleinbuchstaben tauschen</translation>
    </message>
    <message>
        <source>Capitalize</source>
        <translation>Erste Buchstaben groß</translation>
    </message>
    <message>
        <source>Move line up</source>
        <translation>Zeile nach oben verschieben</translation>
    </message>
    <message>
        <source>Move line down</source>
        <translation>Zeile nach unten verschieben</translation>
    </message>
    <message>
        <source>New line above</source>
        <translation>Neue Zeile darüber</translation>
    </message>
    <message>
        <source>New line below</source>
        <translation>Neue Zeile darunter</translation>
    </message>
    <message>
        <source>Duplicate lines</source>
        <translation>Zeilen verdoppeln</translation>
    </message>
    <message>
        <source>Join lines</source>
        <translation>Zeilen zusammenführen</translation>
    </message>
    <message>
        <source>Sort lines</source>
        <translation>Zeilen sortieren</translation>
    </message>
    <message>
        <source>Reverse lines</source>
        <translation>Zeilen umkehren</translation>
    </message>
    <message>
        <source>Remove duplicate lines</source>
        <translation>Doppelte Zeilen entfernen</translation>
    </message>
    <message>
        <source>Remove empty lines</source>
        <translation>Leere Zeilen entfernen</translation>
    </message>
    <message>
        <source>Trim lines</source>
        <translation>Leerzeichen am Zeilenrand entfernen</translation>
    </message>
    <message>
        <source>Indent lines</source>
        <translation>Zeilen einrücken</translation>
    </message>
    <message>
        <source>Unindent lines</source>
        <translation>Zeilen ausrücken</translation>
    </message>
    <message>
        <source>Comment lines</source>
        <translation>Zeilen auskommentieren</translation>
    </message>
    <message>
        <source>Uncomment lines</source>
        <translation>Kommentierung der Zeilen aufheben</translation>
    </message>
    <message>
        <source>Tabs to spaces</source>
        <translation>Tabulatoren in Leerzeichen umwandeln</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Ansicht</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>Ver&amp;größern</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>Ver&amp;kleinern</translation>
    </message>
    <message>
        <source>&amp;Wrap lines</source>
        <translation>&amp;Zeilenumbruch</translation>
    </message>
    <message>
        <source>&amp;Fixed-width font</source>
        <translation>&amp;Feste Zeichenbreite</translation>
    </message>
    <message>
        <source>&amp;Proportional font</source>
        <translation>&amp;Proportionale Zeichenbreite</translation>
    </message>
    <message>
        <source>O&amp;verwrite</source>
        <translation>&amp;Überschreiben</translation>
    </message>
    <message>
        <source>&amp;Read only</source>
        <translation>N&amp;ur lesen</translation>
    </message>
    <message>
        <source>Wide cur&amp;sor</source>
        <translation>&amp;Breiter Cursor</translation>
    </message>
    <message>
        <source>&amp;Center on cursor</source>
        <translation>Auf Cursor ze&amp;ntrieren</translation>
    </message>
    <message>
        <source>Scroll &amp;up</source>
        <translation>Nach &amp;oben blättern</translation>
    </message>
    <message>
        <source>Scroll &amp;down</source>
        <translation>Nach un&amp;ten blättern</translation>
    </message>
    <message>
        <source>Scroll to &amp;top</source>
        <translation>Zum &amp;Anfang blättern</translation>
    </message>
    <message>
        <source>Scroll to botto&amp;m</source>
        <translation>Zum &amp;Ende blättern</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Text</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Kurzbefehle</translation>
    </message>
    <message>
        <source>The file has %1 for %2, but %3 has it, too.</source>
        <translation>Die Datei hat %1 für %2, doch auch %3 hat ihn.</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Ersetzen</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>&amp;Auslassen</translation>
    </message>
    <message>
        <source>&amp;Export keys...</source>
        <translation>Kurzbefehle &amp;exportieren...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>Kurzbefehle &amp;importieren...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>Übersicht als &amp;HTML speichern...</translation>
    </message>
    <message>
        <source>Save cheat sheet as te&amp;xt...</source>
        <translation>Übersicht als Te&amp;xt speichern...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>Übersicht &amp;kopieren</translation>
    </message>
</context>
<context>
    <name>EntryWindow</name>
    <message>
        <source>Unsaved changes</source>
        <translation>Nicht gespeicherte Änderungen</translation>
    </message>
    <message>
        <source>The entry %1 was changed.
Save the changes?</source>
        <translation>Der Eintrag %1 wurde geändert.
Sollen die Änderungen gespeichert werden?</translation>
    </message>
</context>
<context>
    <name>FileIconsPage</name>
    <message>
        <source>File icons</source>
        <translation>Dateisymbole</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>Modelle</translation>
    </message>
</context>
<context>
    <name>GalleryWindow</name>
    <message>
        <source>Widget gallery</source>
        <translation>Widget-Galerie</translation>
    </message>
    <message>
        <source>Pages</source>
        <translation>Seiten</translation>
    </message>
    <message>
        <source>Code of this page</source>
        <translation>Quelltext dieser Seite</translation>
    </message>
</context>
<context>
    <name>KeyNamesPage</name>
    <message>
        <source>&amp;Press keys:</source>
        <translation>&amp;Tasten drücken:</translation>
    </message>
    <message>
        <source>In the window manager&apos;s notation:</source>
        <translation>In der Schreibweise der Fensterverwaltung:</translation>
    </message>
    <message>
        <source>Read back:</source>
        <translation>Zurückgelesen:</translation>
    </message>
    <message>
        <source>Global action with these keys:</source>
        <translation>Globale Aktion mit diesen Tasten:</translation>
    </message>
    <message>
        <source>Key names</source>
        <translation>Tastennamen</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Kurzbefehle</translation>
    </message>
</context>
<context>
    <name>MenuPages</name>
    <message>
        <source>&amp;Pick an entry...</source>
        <translation>Eintrag &amp;wählen...</translation>
    </message>
    <message>
        <source>Edit the &amp;menu...</source>
        <translation>&amp;Menü bearbeiten...</translation>
    </message>
    <message>
        <source>Edit an e&amp;ntry...</source>
        <translation>&amp;Eintrag bearbeiten...</translation>
    </message>
    <message>
        <source>Menu tree</source>
        <translation>Menübaum</translation>
    </message>
    <message>
        <source>Menus</source>
        <translation>Menüs</translation>
    </message>
    <message>
        <source>Menu and entry dialogs</source>
        <translation>Menü- und Eintragsdialoge</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Unterstützung</translation>
    </message>
</context>
<context>
    <name>RadioGroupBoxPage</name>
    <message>
        <source>&amp;Automatic configuration</source>
        <translation>&amp;Automatische Einrichtung</translation>
    </message>
    <message>
        <source>Script address:</source>
        <translation>Adresse des Skripts:</translation>
    </message>
    <message>
        <source>Ask again at every start</source>
        <translation>Bei jedem Start erneut fragen</translation>
    </message>
    <message>
        <source>&amp;Manual configuration</source>
        <translation>&amp;Manuelle Einrichtung</translation>
    </message>
    <message>
        <source>Host:</source>
        <translation>Rechner:</translation>
    </message>
    <message>
        <source>Port:</source>
        <translation>Port:</translation>
    </message>
    <message>
        <source>Protocol:</source>
        <translation>Protokoll:</translation>
    </message>
    <message>
        <source>&amp;Direct connection</source>
        <translation>&amp;Direkte Verbindung</translation>
    </message>
    <message>
        <source>There is nothing to set.</source>
        <translation>Es muss nichts eingestellt werden.</translation>
    </message>
    <message>
        <source>Radio group boxes</source>
        <translation>Gruppenfelder mit Auswahlknopf</translation>
    </message>
    <message>
        <source>Widgets</source>
        <translation>Bedienelemente</translation>
    </message>
</context>
<context>
    <name>SettingsPage</name>
    <message>
        <source>Settings file</source>
        <translation>Einstellungsdatei</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>F&amp;lat buttons</source>
        <translation>&amp;Flache Knöpfe</translation>
    </message>
    <message>
        <source>S&amp;ection:</source>
        <translation>A&amp;bschnitt:</translation>
    </message>
    <message>
        <source>&amp;Font:</source>
        <translation>&amp;Schriftart:</translation>
    </message>
    <message>
        <source>&amp;Size:</source>
        <translation>&amp;Größe:</translation>
    </message>
    <message>
        <source>Contents of the file on disk</source>
        <translation>Inhalt der Datei auf der Festplatte</translation>
    </message>
    <message>
        <source>Name a settings file on the command line to edit it here.</source>
        <translation>Geben Sie auf der Befehlszeile eine Einstellungsdatei an, um sie hier zu bearbeiten.</translation>
    </message>
    <message>
        <source>%1 cannot be opened.</source>
        <translation>%1 kann nicht geöffnet werden.</translation>
    </message>
</context>
<context>
    <name>ShortcutsPage</name>
    <message>
        <source>Delete the whole line</source>
        <translation>Ganze Zeile löschen</translation>
    </message>
    <message>
        <source>Last command: %1</source>
        <translation>Letzter Befehl: %1</translation>
    </message>
    <message>
        <source>one line
another line
and a third one
</source>
        <translation>eine Zeile
noch eine Zeile
und eine dritte
</translation>
    </message>
    <message>
        <source>Go to the editor</source>
        <translation>Zum Editor wechseln</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Ansicht</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>Configure shortcuts...</source>
        <translation>Kurzbefehle einrichten...</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Kurzbefehle</translation>
    </message>
    <message>
        <source>Configure shortcuts in the plain dialog...</source>
        <translation>Kurzbefehle im einfachen Dialog einrichten...</translation>
    </message>
</context>
<context>
    <name>vel-entryedit</name>
    <message>
        <source>Edits a desktop entry.</source>
        <translation>Bearbeitet einen Desktop-Eintrag.</translation>
    </message>
    <message>
        <source>Make a new entry when there is no such file.</source>
        <translation>Einen neuen Eintrag anlegen, wenn die Datei nicht existiert.</translation>
    </message>
    <message>
        <source>Begin with the values of the entry &lt;file&gt;.</source>
        <translation>Mit den Werten des Eintrags &lt;file&gt; beginnen.</translation>
    </message>
    <message>
        <source>Show the entry only.</source>
        <translation>Den Eintrag nur anzeigen.</translation>
    </message>
    <message>
        <source>The entry to edit.</source>
        <translation>Der zu bearbeitende Eintrag.</translation>
    </message>
    <message>
        <source>one file has to be named</source>
        <translation>es muss genau eine Datei angegeben werden</translation>
    </message>
    <message>
        <source>cannot open %1</source>
        <translation>%1 kann nicht geöffnet werden</translation>
    </message>
    <message>
        <source>cannot open %1: there is no such file, --create makes a new entry</source>
        <translation>%1 kann nicht geöffnet werden: Die Datei gibt es nicht, --create legt einen neuen Eintrag an</translation>
    </message>
    <message>
        <source>cannot open %1: it is no regular file</source>
        <translation>%1 kann nicht geöffnet werden: Es ist keine normale Datei</translation>
    </message>
    <message>
        <source>cannot open %1: %2</source>
        <translation>%1 kann nicht geöffnet werden: %2</translation>
    </message>
</context>
<context>
    <name>vel-gallery</name>
    <message>
        <source>the page %1 did not finish loading</source>
        <translation>die Seite %1 wurde nicht fertig</translation>
    </message>
    <message>
        <source>cannot write %1</source>
        <translation>%1 kann nicht geschrieben werden</translation>
    </message>
    <message>
        <source>cannot make the folder %1</source>
        <translation>der Ordner %1 kann nicht angelegt werden</translation>
    </message>
    <message>
        <source>Shows the library&apos;s widgets, dialogs and models in action.</source>
        <translation>Zeigt die Bedienelemente, Dialoge und Modelle der Bibliothek bei der Arbeit.</translation>
    </message>
    <message>
        <source>Start with the page &lt;name&gt;.</source>
        <translation>Mit der Seite &lt;name&gt; beginnen.</translation>
    </message>
    <message>
        <source>Write screenshots of every page, or of the page given with --page, to &lt;dir&gt; and exit.</source>
        <translation>Bilder aller Seiten oder der mit --page angegebenen Seite nach &lt;dir&gt; schreiben und beenden.</translation>
    </message>
    <message>
        <source>The settings file that the settings page edits.</source>
        <translation>Die Einstellungsdatei, die auf der Einstellungsseite bearbeitet wird.</translation>
    </message>
    <message>
        <source>Widget gallery</source>
        <translation>Widget-Galerie</translation>
    </message>
    <message>
        <source>there is no page %1</source>
        <translation>es gibt keine Seite %1</translation>
    </message>
</context>
<context>
    <name>vel-menuedit</name>
    <message>
        <source>cannot create the start menu %1</source>
        <translation>das Startmenü %1 kann nicht angelegt werden</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>kein solcher Ordner: %1</translation>
    </message>
    <message>
        <source>not a directory: %1</source>
        <translation>kein Ordner: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>der Ordner %1 kann nicht gelesen werden</translation>
    </message>
    <message>
        <source>Edits the start menu, or picks an entry of it.</source>
        <translation>Bearbeitet das Startmenü oder wählt einen Eintrag daraus.</translation>
    </message>
    <message>
        <source>Show the menu directory &lt;dir&gt; instead of the start menu.</source>
        <translation>Den Menüordner &lt;dir&gt; statt des Startmenüs anzeigen.</translation>
    </message>
    <message>
        <source>Show the desktop folder.</source>
        <translation>Den Arbeitsflächen-Ordner anzeigen.</translation>
    </message>
    <message>
        <source>Show the tool bar.</source>
        <translation>Die Werkzeugleiste anzeigen.</translation>
    </message>
    <message>
        <source>Look only, change nothing.</source>
        <translation>Nur ansehen, nichts ändern.</translation>
    </message>
    <message>
        <source>Show icons of &lt;pixels&gt; pixels.</source>
        <translation>Symbole mit &lt;pixels&gt; Pixeln anzeigen.</translation>
    </message>
    <message>
        <source>Pick an entry and print its path and its command line.</source>
        <translation>Einen Eintrag wählen und seinen Pfad und seine Befehlszeile ausgeben.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>unerwartetes Argument: %1</translation>
    </message>
    <message>
        <source>only one of --dir, --desktop and --toolbar can be given</source>
        <translation>nur eine der Optionen --dir, --desktop und --toolbar kann angegeben werden</translation>
    </message>
    <message>
        <source>--icon-size needs a number of pixels from 1 to 512, not &quot;%1&quot;</source>
        <translation>--icon-size erwartet eine Anzahl von Pixeln von 1 bis 512, nicht „%1“</translation>
    </message>
</context>
<context>
    <name>vel-menuprint</name>
    <message>
        <source>Prints a menu directory in its order.</source>
        <translation>Gibt einen Menüordner in seiner Reihenfolge aus.</translation>
    </message>
    <message>
        <source>The menu directory; the start menu when none is given.</source>
        <translation>Der Menüordner; das Startmenü, wenn keiner angegeben ist.</translation>
    </message>
    <message>
        <source>unknown format: %1</source>
        <translation>unbekanntes Format: %1</translation>
    </message>
    <message>
        <source>more than one directory</source>
        <translation>mehr als ein Ordner angegeben</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>kein solcher Ordner: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>der Ordner %1 kann nicht gelesen werden</translation>
    </message>
    <message>
        <source>The menu has more than %1 items or %2 levels, and the rest of it is left out. Look for links that lead into the same folders again.</source>
        <translation>Das Menü hat mehr als %1 Einträge oder %2 Ebenen; der Rest wurde ausgelassen. Suchen Sie nach Verknüpfungen, die immer wieder in dieselben Ordner führen.</translation>
    </message>
    <message>
        <source>What to print: %1. The default is text.</source>
        <translation>Was ausgegeben wird: %1. Die Voreinstellung ist text.</translation>
    </message>
    <message>
        <source>The icon theme to take the files of icons from; the user&apos;s own when none is given.</source>
        <translation>Das Symbolthema, aus dem die Dateien der Symbole genommen werden; ohne Angabe das des Benutzers.</translation>
    </message>
    <message>
        <source>The edge of the icons in pixels, 24 by default.</source>
        <translation>Die Kantenlänge der Symbole in Pixeln, voreingestellt 24.</translation>
    </message>
    <message>
        <source>Reads one of the lines that rofi or dmenu was given from standard input and starts its entry.</source>
        <translation>Liest eine der Zeilen, die rofi oder dmenu bekommen hat, von der Standardeingabe und startet ihren Eintrag.</translation>
    </message>
    <message>
        <source>the size of icons is not between 1 and %1</source>
        <translation>die Größe der Symbole liegt nicht zwischen 1 und %1</translation>
    </message>
    <message>
        <source>The start menu is empty: no application is installed.</source>
        <translation>Das Startmenü ist leer: Keine Anwendung ist installiert.</translation>
    </message>
    <message>
        <source>The start menu %1 cannot be made: %2</source>
        <translation>Das Startmenü %1 kann nicht angelegt werden: %2</translation>
    </message>
    <message>
        <source>%1 is left out, as the line end in its name cannot be written in this format. Rename it.</source>
        <translation>%1 wird weggelassen, weil das Zeilenende in seinem Namen in diesem Format nicht geschrieben werden kann. Benennen Sie es um.</translation>
    </message>
    <message>
        <source>The start menu is empty: nothing in %1 is shown.</source>
        <translation>Das Startmenü ist leer: Nichts in %1 wird angezeigt.</translation>
    </message>
    <message>
        <source>cannot run vel-open: %1</source>
        <translation>vel-open kann nicht ausgeführt werden: %1</translation>
    </message>
    <message>
        <source>There is no &quot;%1&quot; in the menu.</source>
        <translation>„%1“ gibt es im Menü nicht.</translation>
    </message>
</context>
<context>
    <name>vel-wmbridge</name>
    <message>
        <source>Owns the window manager&apos;s command channel on a desktop that has none, and runs a command of the shell for each kind of update. The variable VEL_COMMAND holds the line that came.</source>
        <translation>Betreibt den Befehlskanal der Fensterverwaltung auf einer Arbeitsumgebung, die keinen hat, und führt für jede Art von Aktualisierung einen Shell-Befehl aus. Die Variable VEL_COMMAND enthält die empfangene Zeile.</translation>
    </message>
    <message>
        <source>Run when the start menu has changed.</source>
        <translation>Ausführen, wenn sich das Startmenü geändert hat.</translation>
    </message>
    <message>
        <source>Run when the tool bar has changed.</source>
        <translation>Ausführen, wenn sich die Werkzeugleiste geändert hat.</translation>
    </message>
    <message>
        <source>Run when the desktop&apos;s entries have changed.</source>
        <translation>Ausführen, wenn sich die Einträge der Arbeitsfläche geändert haben.</translation>
    </message>
    <message>
        <source>Run for every other line.</source>
        <translation>Für jede andere Zeile ausführen.</translation>
    </message>
    <message>
        <source>Take the channel from the program that has it.</source>
        <translation>Den Kanal dem Programm abnehmen, das ihn hat.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>unerwartetes Argument: %1</translation>
    </message>
    <message>
        <source>cannot run the command for %1</source>
        <translation>der Befehl für %1 kann nicht ausgeführt werden</translation>
    </message>
    <message>
        <source>another program has taken the channel</source>
        <translation>ein anderes Programm hat den Kanal übernommen</translation>
    </message>
    <message>
        <source>cannot take the channel: there is no display, or another program has it</source>
        <translation>der Kanal kann nicht übernommen werden: es gibt keine Anzeige, oder ein anderes Programm hat ihn</translation>
    </message>
    <message>
        <source>unknown window manager: %1 (known are %2)</source>
        <translation>unbekannter Fenstermanager: %1 (bekannt sind %2)</translation>
    </message>
    <message>
        <source>Do what this window manager needs to show the start menu as it is: %1.</source>
        <translation>Tut, was dieser Fenstermanager braucht, um das Startmenü zu zeigen, wie es ist: %1.</translation>
    </message>
</context>
</TS>

<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de" sourcelanguage="en">
<context>
    <name>ActionListEdit</name>
    <message>
        <source>Form</source>
        <translation>Formular</translation>
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
        <translation>Gehe zu</translation>
    </message>
    <message>
        <source>Go to action &apos;%1&apos;</source>
        <translation>Gehe zur Aktion „%1“</translation>
    </message>
    <message>
        <source>Take over</source>
        <translation>Übernehmen</translation>
    </message>
    <message>
        <source>Take over &apos;%1&apos; from action &apos;%2&apos;</source>
        <translation>„%1“ von der Aktion „%2“ übernehmen</translation>
    </message>
    <message>
        <source>Further clashes: %1</source>
        <translation>Weitere Konflikte: %1</translation>
    </message>
</context>
<context>
    <name>EditActionsDialog</name>
    <message>
        <source>Actions</source>
        <translation>Aktionen</translation>
    </message>
</context>
<context>
    <name>EditActionsWidget</name>
    <message>
        <source>Form</source>
        <translation>Formular</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Hinzufügen...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Bearbeiten...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Nach oben</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Nach unten</translation>
    </message>
</context>
<context>
    <name>EditShortcutsAssistance</name>
    <message>
        <source>Schemes</source>
        <translation>Schemata</translation>
    </message>
    <message>
        <source>No action matches the filter.</source>
        <translation>Keine Aktion passt zum Filter.</translation>
    </message>
    <message>
        <source>No action has the shortcut %1.</source>
        <translation>Keine Aktion hat den Kurzbefehl %1.</translation>
    </message>
</context>
<context>
    <name>EditShortcutsDialog</name>
    <message>
        <source>None</source>
        <translation>Keine</translation>
    </message>
    <message>
        <source>Configure shortcuts</source>
        <translation>Kurzbefehle einrichten</translation>
    </message>
    <message>
        <source>Choose a key for selected action</source>
        <translation>Taste für die ausgewählte Aktion wählen</translation>
    </message>
    <message>
        <source>Default key:</source>
        <translation>Standardtaste:</translation>
    </message>
    <message>
        <source>Assign key:</source>
        <translation>Taste zuweisen:</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>Der Kurzbefehl „%1“ wird bereits für die globale Aktion „%2“ verwendet.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;. Please try another.</source>
        <translation>Der Kurzbefehl „%1“ wird bereits für die Aktion „%2“ verwendet. Bitte versuchen Sie einen anderen.</translation>
    </message>
    <message>
        <source>Shortcuts conflict</source>
        <translation>Kurzbefehlkonflikt</translation>
    </message>
    <message>
        <source>Apply changes</source>
        <translation>Änderungen anwenden</translation>
    </message>
    <message>
        <source>Some shortcuts have been changed. Do you want to apply changes?</source>
        <translation>Einige Kurzbefehle wurden geändert. Möchten Sie die Änderungen anwenden?</translation>
    </message>
</context>
<context>
    <name>EditStringsDialog</name>
    <message>
        <source>Strings</source>
        <translation>Zeichenketten</translation>
    </message>
</context>
<context>
    <name>EditableListWidget</name>
    <message>
        <source>Form</source>
        <translation>Formular</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Hinzufügen...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Bearbeiten...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Nach oben</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Nach unten</translation>
    </message>
</context>
<context>
    <name>EntryCheck</name>
    <message>
        <source>The condition &apos;%1&apos; needs a file.</source>
        <translation>Die Bedingung „%1“ braucht eine Datei.</translation>
    </message>
    <message>
        <source>The file of the condition &apos;%1&apos; is one in the folder of settings, without &apos;/&apos; before it.</source>
        <translation>Die Datei der Bedingung „%1“ liegt im Einstellungsordner und hat kein „/“ davor.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a key.</source>
        <translation>Die Bedingung „%1“ braucht einen Schlüssel.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs &apos;if-session&apos; or &apos;unless-session&apos; and a session.</source>
        <translation>Die Bedingung „%1“ braucht „if-session“ oder „unless-session“ und eine Sitzung.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a schema and a key.</source>
        <translation>Die Bedingung „%1“ braucht ein Schema und einen Schlüssel.</translation>
    </message>
    <message>
        <source>There is no condition &apos;%1&apos;.</source>
        <translation>Eine Bedingung „%1“ gibt es nicht.</translation>
    </message>
    <message>
        <source>A category is empty.</source>
        <translation>Eine Kategorie ist leer.</translation>
    </message>
    <message>
        <source>There is no registered category &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Eine registrierte Kategorie „%1“ gibt es nicht; eine eigene muss mit „X-“ beginnen.</translation>
    </message>
    <message>
        <source>Change it to &apos;%1&apos;</source>
        <translation>In „%1“ ändern</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; also needs: %2.</source>
        <translation>Zur Kategorie „%1“ gehört auch: %2.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; goes with one of these: %2.</source>
        <translation>Zur Kategorie „%1“ gehört eine von diesen: %2.</translation>
    </message>
    <message>
        <source>Add &apos;%1&apos;</source>
        <translation>„%1“ hinzufügen</translation>
    </message>
    <message>
        <source>Remove it</source>
        <translation>Entfernen</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is out of use.</source>
        <translation>Die Kategorie „%1“ wird nicht mehr verwendet.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is only for entries that list desktops in &apos;Only show in&apos;.</source>
        <translation>Die Kategorie „%1“ ist nur für Einträge, die unter „Nur anzeigen in“ Arbeitsumgebungen nennen.</translation>
    </message>
    <message>
        <source>No main category is among them, so menus may not know where to show the entry.</source>
        <translation>Keine davon ist eine Hauptkategorie; Menüs wissen dann vielleicht nicht, wo sie den Eintrag zeigen sollen.</translation>
    </message>
    <message>
        <source>Several main categories are among them, so the entry may be shown more than once.</source>
        <translation>Mehrere davon sind Hauptkategorien; der Eintrag kann dann mehrmals erscheinen.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; stands more than once.</source>
        <translation>„%1“ steht mehr als einmal da.</translation>
    </message>
    <message>
        <source>Keep the first</source>
        <translation>Das erste behalten</translation>
    </message>
    <message>
        <source>The application has no command.</source>
        <translation>Die Anwendung hat keinen Befehl.</translation>
    </message>
    <message>
        <source>The link leads nowhere.</source>
        <translation>Die Verknüpfung führt nirgendwohin.</translation>
    </message>
    <message>
        <source>A quote is not closed.</source>
        <translation>Ein Anführungszeichen ist nicht geschlossen.</translation>
    </message>
    <message>
        <source>In quotes, a backslash has to stand before &apos;%1&apos;.</source>
        <translation>In Anführungszeichen muss vor „%1“ ein umgekehrter Schrägstrich stehen.</translation>
    </message>
    <message>
        <source>The command ends in a single backslash, which stands for nothing.</source>
        <translation>Der Befehl endet mit einem einzelnen umgekehrten Schrägstrich, der für nichts steht.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to stand in double quotes.</source>
        <translation>„%1“ muss in doppelten Anführungszeichen stehen.</translation>
    </message>
    <message>
        <source>Close the quote</source>
        <translation>Anführungszeichen schließen</translation>
    </message>
    <message>
        <source>Put it in quotes</source>
        <translation>In Anführungszeichen setzen</translation>
    </message>
    <message>
        <source>Have a shell run it</source>
        <translation>Von einer Shell ausführen lassen</translation>
    </message>
    <message>
        <source>Write &apos;%&apos; as &apos;%%&apos;</source>
        <translation>„%“ als „%%“ schreiben</translation>
    </message>
    <message>
        <source>A field code is not complete: &apos;%&apos; ends the command.</source>
        <translation>Ein Feldcode ist unvollständig: „%“ beendet den Befehl.</translation>
    </message>
    <message>
        <source>There is no field code &apos;%%1&apos;.</source>
        <translation>Einen Feldcode „%%1“ gibt es nicht.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; is out of use; nothing is put in its place.</source>
        <translation>Der Feldcode „%%1“ wird nicht mehr verwendet; an seine Stelle tritt nichts.</translation>
    </message>
    <message>
        <source>Only one of &apos;%f&apos;, &apos;%F&apos;, &apos;%u&apos; and &apos;%U&apos; may stand in a command, and once.</source>
        <translation>In einem Befehl darf nur einer von „%f“, „%F“, „%u“ und „%U“ stehen, und der einmal.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; stands more than once.</source>
        <translation>Der Feldcode „%%1“ steht mehr als einmal da.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; has to be an argument of its own, not in quotes.</source>
        <translation>Der Feldcode „%%1“ muss ein eigenes Argument sein, nicht in Anführungszeichen.</translation>
    </message>
    <message>
        <source>The path of the program has a blank: it has to stand in quotes.</source>
        <translation>Der Pfad des Programms enthält ein Leerzeichen: Er muss in Anführungszeichen stehen.</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;.</source>
        <translation>Ein Programm „%1“ gibt es nicht.</translation>
    </message>
    <message>
        <source>The command has to begin with a program.</source>
        <translation>Der Befehl muss mit einem Programm beginnen.</translation>
    </message>
    <message>
        <source>&apos;Try exec&apos; takes the program alone, without quotes and arguments.</source>
        <translation>„Prüfbefehl“ nimmt nur das Programm, ohne Anführungszeichen und Argumente.</translation>
    </message>
    <message>
        <source>Keep the program</source>
        <translation>Das Programm behalten</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;, so the entry is not shown.</source>
        <translation>Ein Programm „%1“ gibt es nicht, deshalb wird der Eintrag nicht angezeigt.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is missing.</source>
        <translation>„%1“ fehlt.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has translations only, and nothing for all other languages.</source>
        <translation>„%1“ hat nur Übersetzungen und nichts für alle anderen Sprachen.</translation>
    </message>
    <message>
        <source>Take &apos;%1&apos;</source>
        <translation>„%1“ übernehmen</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is only for entries of the type &apos;%2&apos;.</source>
        <translation>„%1“ ist nur für Einträge der Art „%2“.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here.</source>
        <translation>„%1“ wird hier nicht mehr verwendet.</translation>
    </message>
    <message>
        <source>No key can be called &apos;%1&apos;.</source>
        <translation>Kein Schlüssel kann „%1“ heißen.</translation>
    </message>
    <message>
        <source>There is no key &apos;%1&apos; here; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Einen Schlüssel „%1“ gibt es hier nicht; ein eigener muss mit „X-“ beginnen.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; cannot be translated.</source>
        <translation>„%1“ kann nicht übersetzt werden.</translation>
    </message>
    <message>
        <source>&apos;Only show in&apos; and &apos;Not show in&apos; exclude each other.</source>
        <translation>„Nur anzeigen in“ und „Nicht anzeigen in“ schließen einander aus.</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>Die Datei ist leer.</translation>
    </message>
    <message>
        <source>The first group of the file is not &apos;[Desktop Entry]&apos;.</source>
        <translation>Die erste Gruppe der Datei ist nicht „[Desktop Entry]“.</translation>
    </message>
    <message>
        <source>The name of the file has to end in &apos;.%1&apos;.</source>
        <translation>Der Name der Datei muss mit „.%1“ enden.</translation>
    </message>
    <message>
        <source>Lines of the file end in a carriage return.</source>
        <translation>Zeilen der Datei enden mit einem Wagenrücklauf.</translation>
    </message>
    <message>
        <source>A line of the file says nothing: %1</source>
        <translation>Eine Zeile der Datei sagt nichts: %1</translation>
    </message>
    <message>
        <source>A line of the file stands before all groups: %1</source>
        <translation>Eine Zeile der Datei steht vor allen Gruppen: %1</translation>
    </message>
    <message>
        <source>A line of the file begins with a blank: %1</source>
        <translation>Eine Zeile der Datei beginnt mit einem Leerzeichen: %1</translation>
    </message>
    <message>
        <source>A blank stands behind a group: %1</source>
        <translation>Hinter einer Gruppe steht ein Leerzeichen: %1</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; stands more than once.</source>
        <translation>Die Gruppe „%1“ steht mehr als einmal da.</translation>
    </message>
    <message>
        <source>No group can be called &apos;%1&apos;.</source>
        <translation>Keine Gruppe kann „%1“ heißen.</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; is out of use.</source>
        <translation>Die Gruppe „%1“ wird nicht mehr verwendet.</translation>
    </message>
    <message>
        <source>There is no group &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Eine Gruppe „%1“ gibt es nicht; eine eigene muss mit „X-“ beginnen.</translation>
    </message>
    <message>
        <source>The id &apos;%1&apos; of an action may only have letters A to Z, digits and &apos;-&apos;.</source>
        <translation>Die Kennung „%1“ einer Aktion darf nur Buchstaben von A bis Z, Ziffern und „-“ enthalten.</translation>
    </message>
    <message>
        <source>The action &apos;%1&apos; is described, but &apos;Actions&apos; does not name it.</source>
        <translation>Die Aktion „%1“ ist beschrieben, aber „Actions“ nennt sie nicht.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has no &apos;/&apos;.</source>
        <translation>„%1“ ist kein MIME-Typ: Es fehlt der „/“.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: nothing stands behind the &apos;/&apos;.</source>
        <translation>„%1“ ist kein MIME-Typ: Hinter dem „/“ steht nichts.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: there is no kind &apos;%2&apos;.</source>
        <translation>„%1“ ist kein MIME-Typ: Eine Art „%2“ gibt es nicht.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has a character that none has.</source>
        <translation>„%1“ ist kein MIME-Typ: Es hat ein Zeichen, das keiner hat.</translation>
    </message>
    <message>
        <source>MIME types like &apos;%1&apos; are not used for files.</source>
        <translation>MIME-Typen wie „%1“ werden für Dateien nicht verwendet.</translation>
    </message>
    <message>
        <source>This computer does not know the MIME type &apos;%1&apos;.</source>
        <translation>Dieser Rechner kennt den MIME-Typ „%1“ nicht.</translation>
    </message>
    <message>
        <source>An action has no id.</source>
        <translation>Eine Aktion hat keine Kennung.</translation>
    </message>
    <message>
        <source>Nothing says what the action &apos;%1&apos; is.</source>
        <translation>Nichts sagt, was die Aktion „%1“ ist.</translation>
    </message>
    <message>
        <source>There is no registered desktop &apos;%1&apos;; others have to begin with &apos;X-&apos;.</source>
        <translation>Eine registrierte Arbeitsumgebung „%1“ gibt es nicht; andere müssen mit „X-“ beginnen.</translation>
    </message>
    <message>
        <source>In your language the entry is shown as &apos;%1&apos;.</source>
        <translation>In Ihrer Sprache wird der Eintrag als „%1“ angezeigt.</translation>
    </message>
    <message>
        <source>The comment says no more than the name.</source>
        <translation>Der Kommentar sagt nicht mehr als der Name.</translation>
    </message>
    <message>
        <source>The comment says no more than the generic name.</source>
        <translation>Der Kommentar sagt nicht mehr als der allgemeine Name.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here; it has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>„%1“ wird hier nicht mehr verwendet; es muss „true“ oder „false“ heißen.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>„%1“ muss „true“ oder „false“ sein.</translation>
    </message>
    <message>
        <source>Change it to &apos;true&apos;</source>
        <translation>In „true“ ändern</translation>
    </message>
    <message>
        <source>The name of an icon has no suffix like &apos;%1&apos;.</source>
        <translation>Der Name eines Symbols hat keine Endung wie „%1“.</translation>
    </message>
    <message>
        <source>Remove the suffix</source>
        <translation>Die Endung entfernen</translation>
    </message>
    <message>
        <source>No icon theme has an icon &apos;%1&apos;.</source>
        <translation>Kein Symbolthema hat ein Symbol „%1“.</translation>
    </message>
    <message>
        <source>Write the folder in full</source>
        <translation>Den Ordner ausschreiben</translation>
    </message>
    <message>
        <source>The address does not say how to reach it, as &apos;https:&apos; and &apos;file:&apos; do.</source>
        <translation>Die Adresse sagt nicht, wie sie zu erreichen ist, wie es „https:“ und „file:“ tun.</translation>
    </message>
    <message>
        <source>The text is not encoded in UTF-8.</source>
        <translation>Der Text ist nicht in UTF-8 kodiert.</translation>
    </message>
    <message>
        <source>A control character or tab may not stand here.</source>
        <translation>Ein Steuerzeichen oder Tabulator darf hier nicht stehen.</translation>
    </message>
    <message>
        <source>The type has to be &apos;Application&apos;, &apos;Link&apos; or &apos;Directory&apos;, not &apos;%1&apos;.</source>
        <translation>Die Art muss „Application“, „Link“ oder „Directory“ sein, nicht „%1“.</translation>
    </message>
    <message>
        <source>There is no version &apos;%1&apos; of the standard.</source>
        <translation>Eine Version „%1“ des Standards gibt es nicht.</translation>
    </message>
    <message>
        <source>There is no encoding &apos;%1&apos;.</source>
        <translation>Eine Kodierung „%1“ gibt es nicht.</translation>
    </message>
    <message>
        <source>There is no picture &apos;%1&apos;.</source>
        <translation>Ein Bild „%1“ gibt es nicht.</translation>
    </message>
    <message>
        <source>An icon has a name or a path that begins with &apos;/&apos;.</source>
        <translation>Ein Symbol hat einen Namen oder einen Pfad, der mit „/“ beginnt.</translation>
    </message>
    <message>
        <source>The path of a folder begins with &apos;/&apos;.</source>
        <translation>Der Pfad eines Ordners beginnt mit „/“.</translation>
    </message>
    <message>
        <source>There is no folder &apos;%1&apos;.</source>
        <translation>Einen Ordner „%1“ gibt es nicht.</translation>
    </message>
    <message>
        <source>There is no file &apos;%1&apos;.</source>
        <translation>Eine Datei „%1“ gibt es nicht.</translation>
    </message>
    <message>
        <source>D-Bus cannot start &apos;%1&apos;: a file of a name like &apos;org.example.Program.desktop&apos; is needed.</source>
        <translation>D-Bus kann „%1“ nicht starten: Nötig ist eine Datei mit einem Namen wie „org.example.Program.desktop“.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no name of an interface; such names are like &apos;org.example.Viewer&apos;.</source>
        <translation>„%1“ ist kein Name einer Schnittstelle; solche Namen sehen aus wie „org.example.Viewer“.</translation>
    </message>
</context>
<context>
    <name>EntryTrial</name>
    <message>
        <source>The entry could not be written to a temporary file.</source>
        <translation>Der Eintrag konnte nicht in eine vorübergehende Datei geschrieben werden.</translation>
    </message>
</context>
<context>
    <name>KeyAssistance</name>
    <message>
        <source>Press the keys of the shortcut. Tab leaves the field.</source>
        <translation>Drücken Sie die Tasten des Kurzbefehls. Tab verlässt das Feld.</translation>
    </message>
    <message>
        <source>Key for action &apos;%1&apos;</source>
        <translation>Taste für die Aktion „%1“</translation>
    </message>
    <message>
        <source>None: no key for action &apos;%1&apos;</source>
        <translation>Keine: kein Kurzbefehl für die Aktion „%1“</translation>
    </message>
    <message>
        <source>What speaks against the key for action &apos;%1&apos;</source>
        <translation>Was gegen den Kurzbefehl der Aktion „%1“ spricht</translation>
    </message>
</context>
<context>
    <name>KeyDescription</name>
    <message>
        <source>Whether the entry starts a program, opens an address or describes a folder of the menu.</source>
        <translation>Ob der Eintrag ein Programm startet, eine Adresse öffnet oder einen Ordner des Menüs beschreibt.</translation>
    </message>
    <message>
        <source>The name that menus show.</source>
        <translation>Der Name, den Menüs zeigen.</translation>
    </message>
    <message>
        <source>The icon that menus show: a name from the icon theme, or the full path of a picture.</source>
        <translation>Das Symbol, das Menüs zeigen: ein Name aus dem Symbolthema oder der volle Pfad eines Bildes.</translation>
    </message>
    <message>
        <source>The command that starts the program, with codes such as %f for the files that it opens.</source>
        <translation>Der Befehl, der das Programm startet, mit Codes wie %f für die Dateien, die es öffnet.</translation>
    </message>
    <message>
        <source>Whether the program needs a terminal window.</source>
        <translation>Ob das Programm ein Terminalfenster braucht.</translation>
    </message>
    <message>
        <source>The folder in which the program starts.</source>
        <translation>Der Ordner, in dem das Programm startet.</translation>
    </message>
    <message>
        <source>A program that has to be installed; without it menus leave the entry out.</source>
        <translation>Ein Programm, das installiert sein muss; ohne es lassen Menüs den Eintrag weg.</translation>
    </message>
    <message>
        <source>The address that the entry opens.</source>
        <translation>Die Adresse, die der Eintrag öffnet.</translation>
    </message>
    <message>
        <source>What kind of program it is, such as: Web browser.</source>
        <translation>Welcher Art das Programm ist, zum Beispiel: Webbrowser.</translation>
    </message>
    <message>
        <source>A sentence about the program, which menus show as a tip.</source>
        <translation>Ein Satz über das Programm, den Menüs als Hinweis zeigen.</translation>
    </message>
    <message>
        <source>Whether menus leave the entry out although the program can be used.</source>
        <translation>Ob Menüs den Eintrag weglassen, obwohl das Programm benutzt werden kann.</translation>
    </message>
    <message>
        <source>Whether the entry counts as deleted.</source>
        <translation>Ob der Eintrag als gelöscht gilt.</translation>
    </message>
    <message>
        <source>The desktop environments that alone show the entry; none means all.</source>
        <translation>Die Arbeitsumgebungen, die den Eintrag als einzige zeigen; keine bedeutet alle.</translation>
    </message>
    <message>
        <source>The desktop environments that do not show the entry.</source>
        <translation>Die Arbeitsumgebungen, die den Eintrag nicht zeigen.</translation>
    </message>
    <message>
        <source>The types of files that the program opens.</source>
        <translation>Die Arten von Dateien, die das Programm öffnet.</translation>
    </message>
    <message>
        <source>The groups of the menu that the program belongs to.</source>
        <translation>Die Gruppen des Menüs, zu denen das Programm gehört.</translation>
    </message>
    <message>
        <source>Words by which a search finds the program beside its name.</source>
        <translation>Wörter, unter denen eine Suche das Programm neben seinem Namen findet.</translation>
    </message>
    <message>
        <source>Whether the program tells when it has started, so that the pointer shows it until then.</source>
        <translation>Ob das Programm meldet, wenn es gestartet ist, so dass der Zeiger es bis dahin anzeigt.</translation>
    </message>
    <message>
        <source>The class of the window by which the desktop knows that the program has started.</source>
        <translation>Die Klasse des Fensters, an der die Arbeitsumgebung erkennt, dass das Programm gestartet ist.</translation>
    </message>
    <message>
        <source>Further things that the program can be started for, such as: New window.</source>
        <translation>Weiteres, wofür das Programm gestartet werden kann, zum Beispiel: Neues Fenster.</translation>
    </message>
    <message>
        <source>The version of the standard for entries that this one follows.</source>
        <translation>Die Version des Standards für Einträge, der dieser folgt.</translation>
    </message>
    <message>
        <source>%1 Only for users of one language.</source>
        <comment>%1 is a sentence about a key</comment>
        <translation>%1 Nur für Benutzer einer Sprache.</translation>
    </message>
</context>
<context>
    <name>LanguageNote</name>
    <message>
        <source>Users of %1 see these texts.</source>
        <translation>Benutzer von %1 sehen diese Texte.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those of %2 where one is missing.</source>
        <translation>Benutzer von %1 sehen diese Texte und, wo einer fehlt, die von %2.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those without a language where one is missing.</source>
        <translation>Benutzer von %1 sehen diese Texte und, wo einer fehlt, die ohne Sprache.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts of %2.</source>
        <translation>Benutzer von %1 sehen die Texte von %2.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts without a language.</source>
        <translation>Benutzer von %1 sehen die Texte ohne Sprache.</translation>
    </message>
    <message>
        <source>%1 Texts of their own have: %2.</source>
        <comment>%1 is a sentence, %2 a list of languages</comment>
        <translation>%1 Eigene Texte haben: %2.</translation>
    </message>
</context>
<context>
    <name>MenuDeletion</name>
    <message>
        <source>There is no trash for %1. It would be deleted for good: this cannot be undone. Delete it?</source>
        <translation>Für %1 gibt es keinen Papierkorb. Es würde endgültig gelöscht: Das lässt sich nicht rückgängig machen. Soll es gelöscht werden?</translation>
    </message>
    <message numerus="yes">
        <source>There is no trash for %n of these items. They would be deleted for good: this cannot be undone. Delete them?</source>
        <translation>
            <numerusform>Für %n dieser Objekte gibt es keinen Papierkorb. Es würde endgültig gelöscht: Das lässt sich nicht rückgängig machen. Soll es gelöscht werden?</numerusform>
            <numerusform>Für %n dieser Objekte gibt es keinen Papierkorb. Sie würden endgültig gelöscht: Das lässt sich nicht rückgängig machen. Sollen sie gelöscht werden?</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 cannot be deleted: %2</source>
        <translation>%1 kann nicht gelöscht werden: %2</translation>
    </message>
    <message numerus="yes">
        <source>The deletion was canceled. %n items are still there, in whole or in part.</source>
        <translation>
            <numerusform>Das Löschen wurde abgebrochen. %n Objekt ist ganz oder teilweise noch da.</numerusform>
            <numerusform>Das Löschen wurde abgebrochen. %n Objekte sind ganz oder teilweise noch da.</numerusform>
        </translation>
    </message>
    <message>
        <source>The deletion was canceled. Still there, in whole or in part: %1.</source>
        <translation>Das Löschen wurde abgebrochen. Ganz oder teilweise noch da: %1.</translation>
    </message>
</context>
<context>
    <name>MenuDrop</name>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;. Keep both gives the new one another file name, Replace puts the old one into the trash, Skip leaves the new one where it is; Cancel leaves everything as it is.</source>
        <translation>Der Ordner „%1“ enthält „%2“ schon. „Beide behalten“ gibt dem neuen einen anderen Dateinamen, „Ersetzen“ legt das alte in den Papierkorb, „Überspringen“ lässt das neue, wo es ist; „Abbrechen“ lässt alles, wie es ist.</translation>
    </message>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;, which the new one comes from. Keep both gives the new one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>Der Ordner „%1“ enthält „%2“ schon, und das neue stammt davon. „Beide behalten“ gibt dem neuen einen anderen Dateinamen, „Überspringen“ lässt es, wo es ist; „Abbrechen“ lässt alles, wie es ist.</translation>
    </message>
    <message>
        <source>Another one that comes to the folder &apos;%1&apos; has the same file name as &apos;%2&apos;. Keep both gives this one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>Ein anderes, das in den Ordner „%1“ kommt, hat denselben Dateinamen wie „%2“. „Beide behalten“ gibt diesem einen anderen Dateinamen, „Überspringen“ lässt es, wo es ist; „Abbrechen“ lässt alles, wie es ist.</translation>
    </message>
    <message>
        <source>Name already taken</source>
        <translation>Name schon vergeben</translation>
    </message>
    <message>
        <source>&amp;Keep both</source>
        <translation>&amp;Beide behalten</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Ersetzen</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>Über&amp;springen</translation>
    </message>
    <message>
        <source>&amp;Do the same with all further ones</source>
        <translation>Mit allen &amp;weiteren ebenso verfahren</translation>
    </message>
</context>
<context>
    <name>MenuHistory</name>
    <message>
        <source>Undo</source>
        <translation>Rückgängig</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Wiederherstellen</translation>
    </message>
    <message>
        <source>Done: %1</source>
        <translation>Erledigt: %1</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Dateien werden verschoben...</translation>
    </message>
    <message>
        <source>Nothing was undone: %1</source>
        <translation>Nichts wurde rückgängig gemacht: %1</translation>
    </message>
    <message>
        <source>Nothing was done again: %1</source>
        <translation>Nichts wurde wiederhergestellt: %1</translation>
    </message>
    <message>
        <source>%1 is not there any more.</source>
        <translation>%1 ist nicht mehr da.</translation>
    </message>
    <message>
        <source>There is another %1 by now.</source>
        <translation>Inzwischen gibt es ein anderes Objekt %1.</translation>
    </message>
    <message>
        <source>%1 was changed by another program.</source>
        <translation>%1 wurde von einem anderen Programm geändert.</translation>
    </message>
    <message>
        <source>%1 is not in the trash any more.</source>
        <translation>%1 ist nicht mehr im Papierkorb.</translation>
    </message>
    <message>
        <source>%1 cannot be put into the trash.</source>
        <translation>%1 kann nicht in den Papierkorb verschoben werden.</translation>
    </message>
    <message>
        <source>It was canceled.</source>
        <translation>Es wurde abgebrochen.</translation>
    </message>
    <message>
        <source>%1 cannot be changed: %2</source>
        <translation>%1 kann nicht geändert werden: %2</translation>
    </message>
    <message>
        <source>Undo creation of %1</source>
        <translation>Anlegen von %1 rückgängig machen</translation>
    </message>
    <message>
        <source>Redo creation of %1</source>
        <translation>Anlegen von %1 wiederherstellen</translation>
    </message>
    <message>
        <source>%1 was created.</source>
        <translation>%1 wurde angelegt.</translation>
    </message>
    <message>
        <source>Undo change of %1</source>
        <translation>Änderung von %1 rückgängig machen</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Änderung von %1 wiederherstellen</translation>
    </message>
    <message>
        <source>%1 was changed.</source>
        <translation>%1 wurde geändert.</translation>
    </message>
    <message>
        <source>Undo deletion of %1</source>
        <translation>Löschen von %1 rückgängig machen</translation>
    </message>
    <message>
        <source>Redo deletion of %1</source>
        <translation>Löschen von %1 wiederherstellen</translation>
    </message>
    <message>
        <source>%1 was deleted.</source>
        <translation>%1 wurde gelöscht.</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Löschen des Ordners %1 (%n Eintrag) rückgängig machen</numerusform>
            <numerusform>Löschen des Ordners %1 (%n Einträge) rückgängig machen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Löschen des Ordners %1 (%n Eintrag) wiederherstellen</numerusform>
            <numerusform>Löschen des Ordners %1 (%n Einträge) wiederherstellen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The folder %1 was deleted (%n entries).</source>
        <translation>
            <numerusform>Der Ordner %1 wurde gelöscht (%n Eintrag).</numerusform>
            <numerusform>Der Ordner %1 wurde gelöscht (%n Einträge).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %n items</source>
        <translation>
            <numerusform>Löschen von %n Objekt rückgängig machen</numerusform>
            <numerusform>Löschen von %n Objekten rückgängig machen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %n items</source>
        <translation>
            <numerusform>Löschen von %n Objekt wiederherstellen</numerusform>
            <numerusform>Löschen von %n Objekten wiederherstellen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were deleted.</source>
        <translation>
            <numerusform>%n Objekt wurde gelöscht.</numerusform>
            <numerusform>%n Objekte wurden gelöscht.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo moving of %1 to %2</source>
        <translation>Verschieben von %1 nach %2 rückgängig machen</translation>
    </message>
    <message>
        <source>Redo moving of %1 to %2</source>
        <translation>Verschieben von %1 nach %2 wiederherstellen</translation>
    </message>
    <message>
        <source>%1 was moved to %2.</source>
        <translation>%1 wurde nach %2 verschoben.</translation>
    </message>
    <message numerus="yes">
        <source>Undo moving of %n items to %2</source>
        <translation>
            <numerusform>Verschieben von %n Objekt nach %2 rückgängig machen</numerusform>
            <numerusform>Verschieben von %n Objekten nach %2 rückgängig machen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo moving of %n items to %2</source>
        <translation>
            <numerusform>Verschieben von %n Objekt nach %2 wiederherstellen</numerusform>
            <numerusform>Verschieben von %n Objekten nach %2 wiederherstellen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were moved to %2.</source>
        <translation>
            <numerusform>%n Objekt wurde nach %2 verschoben.</numerusform>
            <numerusform>%n Objekte wurden nach %2 verschoben.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo copying of %1 to %2</source>
        <translation>Kopieren von %1 nach %2 rückgängig machen</translation>
    </message>
    <message>
        <source>Redo copying of %1 to %2</source>
        <translation>Kopieren von %1 nach %2 wiederherstellen</translation>
    </message>
    <message>
        <source>%1 was copied to %2.</source>
        <translation>%1 wurde nach %2 kopiert.</translation>
    </message>
    <message numerus="yes">
        <source>Undo copying of %n items to %2</source>
        <translation>
            <numerusform>Kopieren von %n Objekt nach %2 rückgängig machen</numerusform>
            <numerusform>Kopieren von %n Objekten nach %2 rückgängig machen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo copying of %n items to %2</source>
        <translation>
            <numerusform>Kopieren von %n Objekt nach %2 wiederherstellen</numerusform>
            <numerusform>Kopieren von %n Objekten nach %2 wiederherstellen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were copied to %2.</source>
        <translation>
            <numerusform>%n Objekt wurde nach %2 kopiert.</numerusform>
            <numerusform>%n Objekte wurden nach %2 kopiert.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo reordering of %1</source>
        <translation>Umordnen von %1 rückgängig machen</translation>
    </message>
    <message>
        <source>Redo reordering of %1</source>
        <translation>Umordnen von %1 wiederherstellen</translation>
    </message>
    <message>
        <source>%1 has another place.</source>
        <translation>%1 hat einen anderen Platz.</translation>
    </message>
    <message>
        <source>Undo default menu</source>
        <translation>Standardmenü rückgängig machen</translation>
    </message>
    <message>
        <source>Redo default menu</source>
        <translation>Standardmenü wiederherstellen</translation>
    </message>
    <message>
        <source>The default menu was built.</source>
        <translation>Das Standardmenü wurde angelegt.</translation>
    </message>
    <message>
        <source>Undo hiding of %1</source>
        <translation>Ausblenden von %1 rückgängig machen</translation>
    </message>
    <message>
        <source>Redo hiding of %1</source>
        <translation>Ausblenden von %1 wiederherstellen</translation>
    </message>
    <message>
        <source>%1 is hidden: the menu no longer shows it.</source>
        <translation>%1 ist ausgeblendet: Das Menü zeigt es nicht mehr.</translation>
    </message>
    <message>
        <source>Undo showing %1 again</source>
        <translation>Wiedereinblenden von %1 rückgängig machen</translation>
    </message>
    <message>
        <source>Redo showing %1 again</source>
        <translation>Wiedereinblenden von %1 wiederherstellen</translation>
    </message>
    <message>
        <source>The menu shows %1 again.</source>
        <translation>Das Menü zeigt %1 wieder.</translation>
    </message>
    <message>
        <source>Undo deletion of folder %1 (1 entry)</source>
        <translation>Löschen des Ordners %1 (1 Eintrag) rückgängig machen</translation>
    </message>
    <message>
        <source>Redo deletion of folder %1 (1 entry)</source>
        <translation>Löschen des Ordners %1 (1 Eintrag) wiederherstellen</translation>
    </message>
    <message>
        <source>The folder %1 was deleted (1 entry).</source>
        <translation>Der Ordner %1 wurde gelöscht (1 Eintrag).</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Löschen von %1 Objekten (%n Eintrag) rückgängig machen</numerusform>
            <numerusform>Löschen von %1 Objekten (%n Einträge) rückgängig machen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Löschen von %1 Objekten (%n Eintrag) wiederherstellen</numerusform>
            <numerusform>Löschen von %1 Objekten (%n Einträge) wiederherstellen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 items were deleted (%n entries).</source>
        <translation>
            <numerusform>%1 Objekte wurden gelöscht (%n Eintrag).</numerusform>
            <numerusform>%1 Objekte wurden gelöscht (%n Einträge).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo reordering of %n items</source>
        <translation>
            <numerusform>Umordnen von %n Objekt rückgängig machen</numerusform>
            <numerusform>Umordnen von %n Objekten rückgängig machen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo reordering of %n items</source>
        <translation>
            <numerusform>Umordnen von %n Objekt wiederherstellen</numerusform>
            <numerusform>Umordnen von %n Objekten wiederherstellen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items have other places.</source>
        <translation>
            <numerusform>%n Objekt steht an anderer Stelle.</numerusform>
            <numerusform>%n Objekte stehen an anderen Stellen.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo hiding of %n items</source>
        <translation>
            <numerusform>Ausblenden von %n Objekt rückgängig machen</numerusform>
            <numerusform>Ausblenden von %n Objekten rückgängig machen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo hiding of %n items</source>
        <translation>
            <numerusform>Ausblenden von %n Objekt wiederherstellen</numerusform>
            <numerusform>Ausblenden von %n Objekten wiederherstellen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items are hidden: the menu no longer shows them.</source>
        <translation>
            <numerusform>%n Objekt ist ausgeblendet: Das Menü zeigt es nicht mehr.</numerusform>
            <numerusform>%n Objekte sind ausgeblendet: Das Menü zeigt sie nicht mehr.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo showing %n items again</source>
        <translation>
            <numerusform>Wiederanzeigen von %n Objekt rückgängig machen</numerusform>
            <numerusform>Wiederanzeigen von %n Objekten rückgängig machen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo showing %n items again</source>
        <translation>
            <numerusform>Wiederanzeigen von %n Objekt wiederherstellen</numerusform>
            <numerusform>Wiederanzeigen von %n Objekten wiederherstellen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The menu shows %n items again.</source>
        <translation>
            <numerusform>Das Menü zeigt %n Objekt wieder.</numerusform>
            <numerusform>Das Menü zeigt %n Objekte wieder.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo sorting of folder %1</source>
        <translation>Sortieren des Ordners %1 rückgängig machen</translation>
    </message>
    <message>
        <source>Redo sorting of folder %1</source>
        <translation>Sortieren des Ordners %1 wiederherstellen</translation>
    </message>
    <message>
        <source>The folder %1 was sorted by name.</source>
        <translation>Der Ordner %1 wurde nach Namen sortiert.</translation>
    </message>
    <message>
        <source>Undo duplication of %1</source>
        <translation>Duplizieren von %1 rückgängig machen</translation>
    </message>
    <message>
        <source>Redo duplication of %1</source>
        <translation>Duplizieren von %1 wiederherstellen</translation>
    </message>
    <message>
        <source>%1 was duplicated. The copy is selected.</source>
        <translation>%1 wurde dupliziert. Die Kopie ist ausgewählt.</translation>
    </message>
    <message numerus="yes">
        <source>Undo duplication of %n items</source>
        <translation>
            <numerusform>Duplizieren von %n Objekt rückgängig machen</numerusform>
            <numerusform>Duplizieren von %n Objekten rückgängig machen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo duplication of %n items</source>
        <translation>
            <numerusform>Duplizieren von %n Objekt wiederherstellen</numerusform>
            <numerusform>Duplizieren von %n Objekten wiederherstellen</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were duplicated. The copies are selected.</source>
        <translation>
            <numerusform>%n Objekt wurde dupliziert. Die Kopie ist ausgewählt.</numerusform>
            <numerusform>%n Objekte wurden dupliziert. Die Kopien sind ausgewählt.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo deletion of %1 items (1 entry)</source>
        <translation>Löschen von %1 Objekten (1 Eintrag) rückgängig machen</translation>
    </message>
    <message>
        <source>Redo deletion of %1 items (1 entry)</source>
        <translation>Löschen von %1 Objekten (1 Eintrag) wiederherstellen</translation>
    </message>
    <message>
        <source>%1 items were deleted (1 entry).</source>
        <translation>%1 Objekte wurden gelöscht (1 Eintrag).</translation>
    </message>
</context>
<context>
    <name>QFileSystemModel</name>
    <message>
        <source>%1 does not exist.</source>
        <translation>%1 existiert nicht.</translation>
    </message>
    <message>
        <source>%1 exists and was left as it is.</source>
        <translation>%1 existiert und wurde unverändert gelassen.</translation>
    </message>
    <message>
        <source>%1 cannot be put into itself.</source>
        <translation>%1 kann nicht in sich selbst abgelegt werden.</translation>
    </message>
    <message>
        <source>%1 cannot be written.</source>
        <translation>%1 kann nicht geschrieben werden.</translation>
    </message>
    <message>
        <source>Can&apos;t move %1: %2</source>
        <translation>%1 kann nicht verschoben werden: %2</translation>
    </message>
    <message>
        <source>Can&apos;t copy %1: %2</source>
        <translation>%1 kann nicht kopiert werden: %2</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Achtung</translation>
    </message>
    <message>
        <source>%1 already exists. Overwrite?</source>
        <translation>%1 existiert bereits. Überschreiben?</translation>
    </message>
    <message>
        <source>Can&apos;t link %1: %2</source>
        <translation>%1 kann nicht verknüpft werden: %2</translation>
    </message>
</context>
<context>
    <name>SchemeMenu</name>
    <message>
        <source>This is not a regular file.</source>
        <translation>Das ist keine gewöhnliche Datei.</translation>
    </message>
    <message>
        <source>Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <translation>Übernommene Kurzbefehle: %1, ausgelassene: %2. OK setzt sie in Kraft, Zurücksetzen nimmt sie zurück.</translation>
    </message>
    <message>
        <source>%3
Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <comment>%3: a sentence about lines that were skipped</comment>
        <translation>%3
Übernommene Kurzbefehle: %1, ausgelassene: %2. OK setzt sie in Kraft, Zurücksetzen nimmt sie zurück.</translation>
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
        <source>Save cheat sheet as &amp;text...</source>
        <translation>Übersicht als &amp;Text speichern...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>Übersicht &amp;kopieren</translation>
    </message>
    <message>
        <source>Export keys</source>
        <translation>Kurzbefehle exportieren</translation>
    </message>
    <message>
        <source>Keys (*.ini);;All files (*)</source>
        <translation>Kurzbefehle (*.ini);;Alle Dateien (*)</translation>
    </message>
    <message>
        <source>%1
Choose another folder or another name, and try again.</source>
        <translation>%1
Wählen Sie einen anderen Ordner oder Namen und versuchen Sie es noch einmal.</translation>
    </message>
    <message>
        <source>Import keys</source>
        <translation>Kurzbefehle importieren</translation>
    </message>
    <message>
        <source>%1
Choose a file that was written with &apos;Export keys...&apos;.</source>
        <translation>%1
Wählen Sie eine Datei, die mit „Kurzbefehle exportieren...“ geschrieben wurde.</translation>
    </message>
    <message>
        <source>HTML documents (*.html);;All files (*)</source>
        <translation>HTML-Dokumente (*.html);;Alle Dateien (*)</translation>
    </message>
    <message>
        <source>Plain text (*.txt);;All files (*)</source>
        <translation>Reiner Text (*.txt);;Alle Dateien (*)</translation>
    </message>
    <message>
        <source>Save cheat sheet</source>
        <translation>Übersicht speichern</translation>
    </message>
    <message>
        <source>The cheat sheet could not be saved to %1: %2
Choose another folder or another name, and try again.</source>
        <comment>%2: what the system says</comment>
        <translation>Die Übersicht konnte nicht in %1 gespeichert werden: %2
Wählen Sie einen anderen Ordner oder Namen und versuchen Sie es noch einmal.</translation>
    </message>
</context>
<context>
    <name>SchemeQuestion</name>
    <message>
        <source>Import keys</source>
        <translation>Kurzbefehle importieren</translation>
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
        <source>&amp;Do the same with all further ones</source>
        <translation>&amp;Mit allen weiteren ebenso verfahren</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but the global action &apos;%3&apos; has it. Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>Die Datei enthält den Kurzbefehl „%1“ für die Aktion „%2“, doch die globale Aktion „%3“ hat ihn. Auslassen lässt die Aktion „%2“, wie sie ist; Abbrechen übernimmt nichts.</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but action &apos;%3&apos; has it, too. Replace takes it away from action &apos;%3&apos;, Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>Die Datei enthält den Kurzbefehl „%1“ für die Aktion „%2“, doch auch die Aktion „%3“ hat ihn. Ersetzen nimmt ihn der Aktion „%3“ weg, Auslassen lässt die Aktion „%2“, wie sie ist; Abbrechen übernimmt nichts.</translation>
    </message>
</context>
<context>
    <name>ShortcutClash</name>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;.</source>
        <translation>Der Kurzbefehl „%1“ wird bereits für die Aktion „%2“ verwendet.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; of action &apos;%3&apos; begins with &apos;%1&apos;.</source>
        <translation>Der Kurzbefehl „%2“ der Aktion „%3“ beginnt mit „%1“.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; begins with &apos;%1&apos;, the shortcut of action &apos;%3&apos;.</source>
        <translation>Der Kurzbefehl „%2“ beginnt mit „%1“, dem Kurzbefehl der Aktion „%3“.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; opens the menu &apos;%2&apos;.</source>
        <translation>Der Kurzbefehl „%1“ öffnet das Menü „%2“.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; leads to &apos;%2&apos; in the window.</source>
        <translation>Der Kurzbefehl „%1“ führt im Fenster zu „%2“.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is the standard shortcut for &apos;%2&apos;.</source>
        <translation>Der Kurzbefehl „%1“ ist der Standardkurzbefehl für „%2“.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>Der Kurzbefehl „%1“ wird bereits für die globale Aktion „%2“ verwendet.</translation>
    </message>
    <message>
        <source>With &apos;%1&apos; as a shortcut this key cannot be typed into texts.</source>
        <translation>Mit „%1“ als Kurzbefehl lässt sich diese Taste nicht mehr in Texte eingeben.</translation>
    </message>
    <message>
        <source>The current keyboard layout cannot produce &apos;%1&apos;.</source>
        <translation>Die aktuelle Tastaturbelegung kann „%1“ nicht erzeugen.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is a further shortcut of action &apos;%2&apos;.</source>
        <translation>Der Kurzbefehl „%1“ ist ein weiterer der Aktion „%2“.</translation>
    </message>
</context>
<context>
    <name>ShortcutDelegate</name>
    <message>
        <source>Back to no shortcut</source>
        <translation>Zurück zu keinem Kurzbefehl</translation>
    </message>
    <message>
        <source>Back to %1</source>
        <translation>Zurück zu %1</translation>
    </message>
</context>
<context>
    <name>ShortcutFilterBar</name>
    <message>
        <source>Press keys</source>
        <translation>Tasten drücken</translation>
    </message>
    <message>
        <source>Changed only</source>
        <translation>Nur geänderte</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filter</translation>
    </message>
    <message>
        <source>Shows who has the keys that you press; Escape ends it.</source>
        <translation>Zeigt, wer die Tasten hat, die Sie drücken; Escape beendet es.</translation>
    </message>
    <message>
        <source>Shows the actions alone whose shortcut is not the default one, or was edited.</source>
        <translation>Zeigt nur die Aktionen, deren Kurzbefehl nicht der voreingestellte ist oder bearbeitet wurde.</translation>
    </message>
    <message>
        <source>Press the keys to look for</source>
        <translation>Drücken Sie die gesuchten Tasten</translation>
    </message>
    <message>
        <source>Filter by name, group or shortcut</source>
        <translation>Nach Name, Gruppe oder Kurzbefehl filtern</translation>
    </message>
</context>
<context>
    <name>ShortcutScheme</name>
    <message>
        <source>The shortcuts could not be saved to %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Die Kurzbefehle konnten nicht in %1 gespeichert werden: %2</translation>
    </message>
    <message>
        <source>The shortcuts could not be read from %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Die Kurzbefehle konnten nicht aus %1 gelesen werden: %2</translation>
    </message>
    <message>
        <source>%1 is not a regular file.</source>
        <translation>%1 ist keine normale Datei.</translation>
    </message>
    <message>
        <source>%1 is too large for a file of shortcuts.</source>
        <translation>%1 ist zu groß für eine Datei mit Kurzbefehlen.</translation>
    </message>
    <message>
        <source>%1 holds no shortcuts.</source>
        <translation>%1 enthält keine Kurzbefehle.</translation>
    </message>
    <message>
        <source>Unreadable shortcuts in %1 were skipped: %2</source>
        <comment>%2: their number</comment>
        <translation>Unlesbare Kurzbefehle in %1 wurden übersprungen: %2</translation>
    </message>
</context>
<context>
    <name>ShortcutSheet</name>
    <message>
        <source>Keyboard shortcuts</source>
        <comment>title of a printed sheet</comment>
        <translation>Kurzbefehle</translation>
    </message>
</context>
<context>
    <name>ShortcutsModel</name>
    <message>
        <source>Action</source>
        <translation>Aktion</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Kurzbefehl</translation>
    </message>
    <message>
        <source>%1, changed</source>
        <comment>%1: an action or a key</comment>
        <translation>%1, geändert</translation>
    </message>
    <message>
        <source>No shortcut</source>
        <translation>Kein Kurzbefehl</translation>
    </message>
    <message>
        <source>There is no default shortcut.</source>
        <translation>Es gibt keinen voreingestellten Kurzbefehl.</translation>
    </message>
    <message>
        <source>The default shortcut is %1.</source>
        <translation>Der voreingestellte Kurzbefehl ist %1.</translation>
    </message>
</context>
<context>
    <name>StandardKeyNames</name>
    <message>
        <source>Help</source>
        <translation>Hilfe</translation>
    </message>
    <message>
        <source>What&apos;s this?</source>
        <translation>Was ist das?</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Öffnen</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>Speichern unter</translation>
    </message>
    <message>
        <source>New</source>
        <translation>Neu</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Ausschneiden</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Kopieren</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Einfügen</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Rückgängig</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Wiederherstellen</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Vorwärts</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Aktualisieren</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Vergrößern</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Verkleinern</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Drucken</translation>
    </message>
    <message>
        <source>New tab</source>
        <translation>Neues Unterfenster</translation>
    </message>
    <message>
        <source>Next tab</source>
        <translation>Nächstes Unterfenster</translation>
    </message>
    <message>
        <source>Previous tab</source>
        <translation>Vorheriges Unterfenster</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Weitersuchen</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Rückwärts weitersuchen</translation>
    </message>
    <message>
        <source>Replace</source>
        <translation>Ersetzen</translation>
    </message>
    <message>
        <source>Select all</source>
        <translation>Alles auswählen</translation>
    </message>
    <message>
        <source>Deselect</source>
        <translation>Auswahl aufheben</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Vollbild</translation>
    </message>
    <message>
        <source>Preferences</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>Quit</source>
        <translation>Beenden</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Fett</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Kursiv</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Unterstrichen</translation>
    </message>
    <message>
        <source>Move the cursor</source>
        <translation>Textmarke bewegen</translation>
    </message>
    <message>
        <source>Select text</source>
        <translation>Text auswählen</translation>
    </message>
    <message>
        <source>Edit text</source>
        <translation>Text bearbeiten</translation>
    </message>
</context>
<context>
    <name>StringListEdit</name>
    <message>
        <source>Form</source>
        <translation>Formular</translation>
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
        <translation>Diesen Kurzbefehl &amp;zurücksetzen</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryEditDialog</name>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>no executable</source>
        <translation>kein Programm angegeben</translation>
    </message>
    <message>
        <source>can&apos;t find executable</source>
        <translation>das Programm kann nicht gefunden werden</translation>
    </message>
    <message>
        <source>can&apos;t find try executable</source>
        <translation>das Programm zur Prüfung kann nicht gefunden werden</translation>
    </message>
    <message>
        <source>can&apos;t find URL</source>
        <translation>die Adresse (URL) kann nicht gefunden werden</translation>
    </message>
    <message>
        <source>wrong/incomplete desktop entry</source>
        <translation>fehlerhafter oder unvollständiger Desktop-Eintrag</translation>
    </message>
    <message>
        <source>Can&apos;t save position on desktop for %1</source>
        <translation>Die Position von %1 auf der Arbeitsfläche kann nicht gespeichert werden</translation>
    </message>
    <message>
        <source>Copy from...</source>
        <translation>Kopieren von...</translation>
    </message>
    <message>
        <source>Can&apos;t load file %1</source>
        <translation>Die Datei %1 kann nicht geladen werden</translation>
    </message>
    <message>
        <source>Desktop Entry Editor</source>
        <translation>Editor für Desktop-Einträge</translation>
    </message>
    <message>
        <source>You create hidden desktop entry</source>
        <translation>Sie erstellen einen ausgeblendeten Desktop-Eintrag</translation>
    </message>
    <message>
        <source>Can&apos;t save file %1</source>
        <translation>Die Datei %1 kann nicht gespeichert werden</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Hilfe</translation>
    </message>
    <message>
        <source>&lt;b&gt;Desktop entry&lt;/b&gt; is a multipurpose info file for installed apps, devices, etc. It can be used to build menu entries, shortcuts, etc. This dialog implements the &apos;Desktop Entry Standard&apos; of &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Desktop entry file is a text ini-like file with one main section [Desktop Entry] and possible additional sections for each action defined in the main section field &apos;Actions&apos;. All fields are text string pairs: key=value. Value can also be a semicolon separated string list.</source>
        <translation>&lt;b&gt;Desktop-Einträge&lt;/b&gt; sind vielseitige Informationsdateien für installierte Programme, Geräte usw. Mit ihnen lassen sich Menüeinträge, Verknüpfungen usw. aufbauen. Dieser Dialog setzt den „Desktop Entry Standard“ von &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt; um.&lt;br&gt;&lt;br&gt;Die Datei eines Desktop-Eintrags ist eine Textdatei ähnlich einer INI-Datei mit einem Hauptabschnitt [Desktop Entry] und möglichen weiteren Abschnitten für jede Aktion, die im Feld „Actions“ des Hauptabschnitts definiert ist. Alle Felder sind Paare aus Zeichenketten: Schlüssel=Wert. Der Wert kann auch eine durch Semikolons getrennte Liste von Zeichenketten sein.</translation>
    </message>
    <message>
        <source>The file %1 is not a desktop entry: it has no group [Desktop Entry].</source>
        <translation>Die Datei %1 ist kein Desktop-Eintrag: Sie hat keine Gruppe [Desktop Entry].</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryPropsWidgetPrivate</name>
    <message>
        <source>Information about the URL</source>
        <translation>Informationen über die Adresse (URL)</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Nur anzeigen in</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Nicht anzeigen in</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Arbeitsumgebung hinzufügen:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Arbeitsumgebung bearbeiten:</translation>
    </message>
    <message>
        <source>MIME type or file name extension:</source>
        <translation>MIME-Typ oder Dateinamenerweiterung:</translation>
    </message>
    <message>
        <source>MIME type</source>
        <translation>MIME-Typ</translation>
    </message>
    <message>
        <source>Add MIME type</source>
        <translation>MIME-Typ hinzufügen</translation>
    </message>
    <message>
        <source>Edit MIME type</source>
        <translation>MIME-Typ bearbeiten</translation>
    </message>
    <message>
        <source>Categories</source>
        <translation>Kategorien</translation>
    </message>
    <message>
        <source>Add category</source>
        <translation>Kategorie hinzufügen</translation>
    </message>
    <message>
        <source>Category:</source>
        <translation>Kategorie:</translation>
    </message>
    <message>
        <source>Edit category</source>
        <translation>Kategorie bearbeiten</translation>
    </message>
    <message>
        <source>Keywords</source>
        <translation>Stichwörter</translation>
    </message>
    <message>
        <source>Add keyword</source>
        <translation>Stichwort hinzufügen</translation>
    </message>
    <message>
        <source>Keyword:</source>
        <translation>Stichwort:</translation>
    </message>
    <message>
        <source>Edit keyword</source>
        <translation>Stichwort bearbeiten</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Aktionen</translation>
    </message>
    <message>
        <source>Add action</source>
        <translation>Aktion hinzufügen</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Aktion bearbeiten</translation>
    </message>
    <message>
        <source>Application</source>
        <translation>Programm</translation>
    </message>
    <message>
        <source>Link</source>
        <translation>Verknüpfung</translation>
    </message>
    <message>
        <source>Directory</source>
        <translation>Ordner</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Achtung</translation>
    </message>
    <message>
        <source>Desktop entry type was changed.
Some field values may be lost...
Continue?</source>
        <translation>Der Typ des Desktop-Eintrags wurde geändert.
Einige Feldwerte können verloren gehen...
Fortfahren?</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>Typ</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Symbol</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Befehl</translation>
    </message>
    <message>
        <source>Terminal</source>
        <translation>Terminal</translation>
    </message>
    <message>
        <source>Path</source>
        <translation>Arbeitsordner</translation>
    </message>
    <message>
        <source>Try exec</source>
        <translation>Prüfbefehl</translation>
    </message>
    <message>
        <source>Url</source>
        <translation>Adresse (URL)</translation>
    </message>
    <message>
        <source>Generic name</source>
        <translation>Allgemeiner Name</translation>
    </message>
    <message>
        <source>Comment</source>
        <translation>Kommentar</translation>
    </message>
    <message>
        <source>No display</source>
        <translation>Nicht anzeigen</translation>
    </message>
    <message>
        <source>Hidden</source>
        <translation>Ausgeblendet</translation>
    </message>
    <message>
        <source>Startup notify</source>
        <translation>Startrückmeldung</translation>
    </message>
    <message>
        <source>Startup WM class</source>
        <translation>Fensterklasse beim Start</translation>
    </message>
    <message>
        <source>Version</source>
        <translation>Version</translation>
    </message>
</context>
<context>
    <name>VelMenuDialog</name>
    <message>
        <source>Edit</source>
        <translation>Bearbeiten</translation>
    </message>
    <message>
        <source>Send command to vel-wm to update
 edited menu, toolbar, etc.</source>
        <translation>Befehl an vel-wm senden, damit Menü,
 Werkzeugleiste usw. nach der Bearbeitung aktualisiert werden</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>Can&apos;t send command to vel-wm</source>
        <translation>Der Befehl kann nicht an vel-wm gesendet werden</translation>
    </message>
    <message>
        <source>This menu cannot be changed: the folder %1 does not exist.</source>
        <translation>Dieses Menü kann nicht geändert werden: Den Ordner %1 gibt es nicht.</translation>
    </message>
    <message>
        <source>This menu cannot be changed: you may not write to the folder %1.</source>
        <translation>Dieses Menü kann nicht geändert werden: Sie dürfen nicht in den Ordner %1 schreiben.</translation>
    </message>
    <message>
        <source>Show hidden</source>
        <translation>Verborgene anzeigen</translation>
    </message>
    <message>
        <source>Filter by name, command or keyword</source>
        <translation>Nach Name, Befehl oder Stichwort filtern</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filter</translation>
    </message>
    <message>
        <source>Also show the entries that the menu leaves out</source>
        <translation>Auch die Einträge zeigen, die das Menü auslässt</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Rückgängig</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>Start menu</source>
        <translation>Startmenü</translation>
    </message>
</context>
<context>
    <name>VelMenuView</name>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>Can&apos;t start:
%1 %2</source>
        <translation>Starten nicht möglich:
%1 %2</translation>
    </message>
    <message>
        <source>All previous shortcuts
will be lost. Are you sure?</source>
        <translation>Alle bisherigen Verknüpfungen
gehen verloren. Sind Sie sicher?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Bearbeiten</translation>
    </message>
    <message>
        <source>New folder</source>
        <translation>Neuer Ordner</translation>
    </message>
    <message>
        <source>New entry</source>
        <translation>Neuer Eintrag</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Execute</source>
        <translation>Ausführen</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Find Next</source>
        <translation>Weitersuchen</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Ausschneiden</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Kopieren</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Einfügen</translation>
    </message>
    <message>
        <source>Default menu...</source>
        <translation>Standardmenü...</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Nach oben</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Nach unten</translation>
    </message>
    <message>
        <source>Move</source>
        <translation>Verschieben</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Gruppe</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Verknüpfung</translation>
    </message>
    <message>
        <source>Can&apos;t edit non desktop file</source>
        <translation>Nur Desktop-Dateien können bearbeitet werden</translation>
    </message>
    <message>
        <source>Desktop Entry %1</source>
        <translation>Desktop-Eintrag %1</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Achtung</translation>
    </message>
    <message>
        <source>Are you sure to delete it?</source>
        <translation>Möchten Sie das wirklich löschen?</translation>
    </message>
    <message>
        <source>Find string:</source>
        <translation>Zeichenkette suchen:</translation>
    </message>
    <message>
        <source>&apos;%1&apos; not found .</source>
        <translation>„%1“ wurde nicht gefunden.</translation>
    </message>
    <message>
        <source>Not in the menu: it is not meant for this desktop.</source>
        <translation>Nicht im Menü: Der Eintrag ist nicht für diese Arbeitsumgebung gedacht.</translation>
    </message>
    <message>
        <source>Not in the menu: it is meant for other desktops only (%1).</source>
        <translation>Nicht im Menü: Der Eintrag ist nur für andere Arbeitsumgebungen gedacht (%1).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked as deleted (Hidden).</source>
        <translation>Nicht im Menü: Der Eintrag ist als gelöscht gekennzeichnet (Hidden).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked not to be displayed (NoDisplay).</source>
        <translation>Nicht im Menü: Der Eintrag soll nicht angezeigt werden (NoDisplay).</translation>
    </message>
    <message>
        <source>Not in the menu: the program %1 is not installed (TryExec).</source>
        <translation>Nicht im Menü: Das Programm %1 ist nicht installiert (TryExec).</translation>
    </message>
    <message>
        <source>This file is not a desktop entry, whatever its name says.</source>
        <translation>Diese Datei ist kein Desktop-Eintrag, auch wenn sie so heißt.</translation>
    </message>
    <message>
        <source>This file cannot be read.</source>
        <translation>Diese Datei kann nicht gelesen werden.</translation>
    </message>
    <message>
        <source>This entry has no name. The name of its file is shown.</source>
        <translation>Dieser Eintrag hat keinen Namen. Gezeigt wird der Name seiner Datei.</translation>
    </message>
    <message>
        <source>Taking back what was done...</source>
        <translation>Änderungen werden zurückgenommen...</translation>
    </message>
    <message>
        <source>The program that holds the clipboard does not answer. Nothing was pasted.</source>
        <translation>Das Programm, dem die Zwischenablage gehört, antwortet nicht. Nichts wurde eingefügt.</translation>
    </message>
    <message>
        <source>Nothing can be created in %1, because there is no such folder.</source>
        <translation>In %1 kann nichts angelegt werden, denn es gibt diesen Ordner nicht.</translation>
    </message>
    <message>
        <source>%1 could not be saved. Make sure that the folder %2 may be written and that the disk is not full, then try again.</source>
        <translation>%1 konnte nicht gespeichert werden. Sorgen Sie dafür, dass in den Ordner %2 geschrieben werden darf und der Datenträger nicht voll ist, und versuchen Sie es noch einmal.</translation>
    </message>
    <message>
        <source>%1 could not be deleted: %2. Make sure that the folder that holds it may be written, then try again.</source>
        <translation>%1 konnte nicht gelöscht werden: %2. Sorgen Sie dafür, dass in den übergeordneten Ordner geschrieben werden darf, und versuchen Sie es noch einmal.</translation>
    </message>
    <message>
        <source>%1 was deleted in part only, because %2 could not be deleted: %3. Make sure that its folder may be written, then delete the rest.</source>
        <translation>%1 wurde nur zum Teil gelöscht, denn %2 konnte nicht gelöscht werden: %3. Sorgen Sie dafür, dass in dessen Ordner geschrieben werden darf, und löschen Sie dann den Rest.</translation>
    </message>
    <message>
        <source>Nothing in this menu matches &apos;%1&apos;.</source>
        <translation>Nichts in diesem Menü passt zu „%1“.</translation>
    </message>
    <message>
        <source>Searching the menu for &apos;%1&apos;...</source>
        <translation>Das Menü wird nach „%1“ durchsucht...</translation>
    </message>
    <message>
        <source>The menu is too large to be searched as a whole. Only a part of it was searched.</source>
        <translation>Das Menü ist zu groß, um es ganz zu durchsuchen. Nur ein Teil wurde durchsucht.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; was not changed: the file %2 cannot be written.</source>
        <translation>„%1“ wurde nicht geändert: In die Datei %2 kann nicht geschrieben werden.</translation>
    </message>
    <message>
        <source>The order of the folder %1 could not be saved. Make sure that the folder may be written and that the disk is not full, then try again.</source>
        <translation>Die Reihenfolge des Ordners %1 konnte nicht gespeichert werden. Sorgen Sie dafür, dass in den Ordner geschrieben werden darf und der Datenträger nicht voll ist, und versuchen Sie es noch einmal.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1. The menu was left as it is.</source>
        <translation>Das Standardmenü konnte in %1 nicht angelegt werden. Das Menü blieb, wie es war.</translation>
    </message>
    <message>
        <source>Menu</source>
        <comment>the tree</comment>
        <translation>Menü</translation>
    </message>
    <message>
        <source>%1 cannot be edited, because the folder %2 may not be written.</source>
        <translation>%1 kann nicht bearbeitet werden, denn in den Ordner %2 darf nicht geschrieben werden.</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Dateien werden verschoben...</translation>
    </message>
    <message>
        <source>Copying files...</source>
        <translation>Dateien werden kopiert...</translation>
    </message>
    <message>
        <source>Deleting files...</source>
        <translation>Dateien werden gelöscht...</translation>
    </message>
    <message>
        <source>The deletion of %1 was canceled. What was not yet deleted is still there.</source>
        <translation>Das Löschen von %1 wurde abgebrochen. Was noch nicht gelöscht war, ist noch da.</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Dieses Menü ist leer. Drücken Sie %1 für einen neuen Eintrag oder klicken Sie hier mit der rechten Maustaste, um anderes hinzuzufügen.</translation>
    </message>
    <message>
        <source>the program %1 ended with an error</source>
        <translation>das Programm %1 endete mit einem Fehler</translation>
    </message>
    <message>
        <source>the program %1 cannot be run</source>
        <translation>das Programm %1 kann nicht ausgeführt werden</translation>
    </message>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>Und %n weiteres.</numerusform>
            <numerusform>Und %n weitere.</numerusform>
        </translation>
    </message>
    <message>
        <source>Open containin&amp;g folder</source>
        <translation>Ordner im Da&amp;teimanager öffnen</translation>
    </message>
    <message>
        <source>The folder %1 was not opened: %2.</source>
        <translation>Der Ordner %1 wurde nicht geöffnet: %2.</translation>
    </message>
    <message>
        <source>New &amp;folder</source>
        <translation>Neuer O&amp;rdner</translation>
    </message>
    <message>
        <source>New entr&amp;y</source>
        <translation>Neuer Eintra&amp;g</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Bearbeiten</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>Lösc&amp;hen</translation>
    </message>
    <message>
        <source>E&amp;xecute</source>
        <translation>Aus&amp;führen</translation>
    </message>
    <message>
        <source>F&amp;ind</source>
        <translation>&amp;Suchen</translation>
    </message>
    <message>
        <source>Find &amp;Next</source>
        <translation>&amp;Weitersuchen</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Auss&amp;chneiden</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Kopieren</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>&amp;Einfügen</translation>
    </message>
    <message>
        <source>Default &amp;menu...</source>
        <translation>Standard&amp;menü...</translation>
    </message>
    <message>
        <source>&amp;Up</source>
        <translation>Nach &amp;oben</translation>
    </message>
    <message>
        <source>D&amp;own</source>
        <translation>Nach &amp;unten</translation>
    </message>
    <message>
        <source>Dup&amp;licate</source>
        <translation>&amp;Duplizieren</translation>
    </message>
    <message>
        <source>&amp;Hide</source>
        <translation>Ausb&amp;lenden</translation>
    </message>
    <message>
        <source>Sho&amp;w again</source>
        <translation>W&amp;ieder anzeigen</translation>
    </message>
    <message>
        <source>&amp;Reload</source>
        <translation>&amp;Neu laden</translation>
    </message>
    <message>
        <source>&amp;Sort by name</source>
        <translation>Nach N&amp;amen sortieren</translation>
    </message>
    <message>
        <source>The folder %1 is sorted by name already.</source>
        <translation>Der Ordner %1 ist schon nach Namen sortiert.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1, because no application is installed. The menu was left as it is.</source>
        <translation>Das Standardmenü konnte in %1 nicht erstellt werden, weil keine Anwendung installiert ist. Das Menü blieb, wie es war.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1: %2. The menu was left as it is.</source>
        <translation>Das Standardmenü konnte in %1 nicht erstellt werden: %2. Das Menü blieb, wie es war.</translation>
    </message>
    <message>
        <source>%1 is no file on this computer. Nothing was moved or copied.</source>
        <translation>%1 ist keine Datei auf diesem Rechner. Nichts wurde verschoben oder kopiert.</translation>
    </message>
    <message>
        <source>%1 was not started: %2.</source>
        <translation>%1 wurde nicht gestartet: %2.</translation>
    </message>
    <message>
        <source>This menu is empty. Right-click here and choose &apos;%2&apos; to fill it with the applications that are installed, or press %1 for a new entry.</source>
        <translation>Dieses Menü ist leer. Klicken Sie hier mit der rechten Maustaste und wählen Sie „%2“, um es mit den installierten Anwendungen zu füllen, oder drücken Sie %1 für einen neuen Eintrag.</translation>
    </message>
    <message>
        <source>This menu is empty, because no application was found that is installed. Once there is one, right-click here and choose &apos;%2&apos;. Until then, press %1 for an entry of your own.</source>
        <translation>Dieses Menü ist leer, weil keine installierte Anwendung gefunden wurde. Sobald es eine gibt, klicken Sie hier mit der rechten Maustaste und wählen Sie „%2“. Bis dahin drücken Sie %1 für einen eigenen Eintrag.</translation>
    </message>
</context>
<context>
    <name>VelUI::ActionPropsDialog</name>
    <message>
        <source>Id</source>
        <translation>Kennung</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Symbol</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Befehl</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Nur anzeigen in</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Arbeitsumgebung hinzufügen:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Arbeitsumgebung bearbeiten:</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Nicht anzeigen in</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryChooser</name>
    <message>
        <source>Main category</source>
        <translation>Hauptkategorie</translation>
    </message>
    <message>
        <source>Goes with %1</source>
        <translation>Gehört zu %1</translation>
    </message>
    <message>
        <source>Only beside &quot;Only show in&quot;</source>
        <translation>Nur neben „Nur anzeigen in“</translation>
    </message>
    <message>
        <source>Deprecated</source>
        <translation>Veraltet</translation>
    </message>
    <message>
        <source>Extension</source>
        <comment>a category of somebody&apos;s own, X-...</comment>
        <translation>Erweiterung</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Nicht registriert</translation>
    </message>
    <message>
        <source>Choose categories</source>
        <translation>Kategorien wählen</translation>
    </message>
    <message>
        <source>Name</source>
        <comment>title of a column</comment>
        <translation>Name</translation>
    </message>
    <message>
        <source>Category</source>
        <comment>title of a column</comment>
        <translation>Kategorie</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Bemerkung</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryNames</name>
    <message>
        <source>Audio and video</source>
        <translation>Audio und Video</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>Audio</translation>
    </message>
    <message>
        <source>Video</source>
        <translation>Video</translation>
    </message>
    <message>
        <source>Software development</source>
        <translation>Softwareentwicklung</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>Bildung</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>Spiele</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>Grafik</translation>
    </message>
    <message>
        <source>Internet and network</source>
        <translation>Internet und Netzwerk</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>Büro</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>Wissenschaft</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>System tools</source>
        <translation>Systemwerkzeuge</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Zubehör</translation>
    </message>
    <message>
        <source>Build tools</source>
        <translation>Werkzeuge zum Übersetzen von Programmen</translation>
    </message>
    <message>
        <source>Debuggers</source>
        <translation>Debugger</translation>
    </message>
    <message>
        <source>Development environments</source>
        <translation>Entwicklungsumgebungen</translation>
    </message>
    <message>
        <source>Designers of user interfaces</source>
        <translation>Entwurf von Benutzeroberflächen</translation>
    </message>
    <message>
        <source>Profilers</source>
        <translation>Profiler</translation>
    </message>
    <message>
        <source>Revision control</source>
        <translation>Versionsverwaltung</translation>
    </message>
    <message>
        <source>Translation tools</source>
        <translation>Übersetzungswerkzeuge</translation>
    </message>
    <message>
        <source>Calendars</source>
        <translation>Kalender</translation>
    </message>
    <message>
        <source>Address books</source>
        <translation>Adressbücher</translation>
    </message>
    <message>
        <source>Databases</source>
        <translation>Datenbanken</translation>
    </message>
    <message>
        <source>Dictionaries</source>
        <translation>Wörterbücher</translation>
    </message>
    <message>
        <source>Charts</source>
        <translation>Diagramme</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>E-Mail</translation>
    </message>
    <message>
        <source>Finances</source>
        <translation>Finanzen</translation>
    </message>
    <message>
        <source>Flow charts</source>
        <translation>Flussdiagramme</translation>
    </message>
    <message>
        <source>Handheld devices</source>
        <translation>Handgeräte</translation>
    </message>
    <message>
        <source>Project management</source>
        <translation>Projektverwaltung</translation>
    </message>
    <message>
        <source>Presentations</source>
        <translation>Präsentationen</translation>
    </message>
    <message>
        <source>Spreadsheets</source>
        <translation>Tabellenkalkulationen</translation>
    </message>
    <message>
        <source>Word processors</source>
        <translation>Textverarbeitungen</translation>
    </message>
    <message>
        <source>Two-dimensional graphics</source>
        <translation>Zweidimensionale Grafik</translation>
    </message>
    <message>
        <source>Vector graphics</source>
        <translation>Vektorgrafik</translation>
    </message>
    <message>
        <source>Raster graphics</source>
        <translation>Rastergrafik</translation>
    </message>
    <message>
        <source>Three-dimensional graphics</source>
        <translation>Dreidimensionale Grafik</translation>
    </message>
    <message>
        <source>Scanning</source>
        <translation>Scannen</translation>
    </message>
    <message>
        <source>Text recognition</source>
        <translation>Texterkennung</translation>
    </message>
    <message>
        <source>Photography</source>
        <translation>Fotografie</translation>
    </message>
    <message>
        <source>Desktop publishing</source>
        <translation>Desktop-Publishing</translation>
    </message>
    <message>
        <source>Viewers</source>
        <translation>Betrachter</translation>
    </message>
    <message>
        <source>Text tools</source>
        <translation>Textwerkzeuge</translation>
    </message>
    <message>
        <source>Desktop settings</source>
        <translation>Einstellungen der Arbeitsumgebung</translation>
    </message>
    <message>
        <source>Hardware settings</source>
        <translation>Hardware-Einstellungen</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>Drucken</translation>
    </message>
    <message>
        <source>Package managers</source>
        <translation>Paketverwaltungen</translation>
    </message>
    <message>
        <source>Dial-up connections</source>
        <translation>Einwahlverbindungen</translation>
    </message>
    <message>
        <source>Instant messaging</source>
        <translation>Sofortnachrichten</translation>
    </message>
    <message>
        <source>Chat</source>
        <translation>Chat</translation>
    </message>
    <message>
        <source>IRC</source>
        <translation>IRC</translation>
    </message>
    <message>
        <source>News feeds</source>
        <translation>Nachrichten-Feeds</translation>
    </message>
    <message>
        <source>File transfer</source>
        <translation>Dateiübertragung</translation>
    </message>
    <message>
        <source>Amateur radio</source>
        <translation>Amateurfunk</translation>
    </message>
    <message>
        <source>Newsgroups</source>
        <translation>Newsgroups</translation>
    </message>
    <message>
        <source>File sharing</source>
        <translation>Tauschbörsen</translation>
    </message>
    <message>
        <source>Remote access</source>
        <translation>Fernzugriff</translation>
    </message>
    <message>
        <source>Telephony</source>
        <translation>Telefonie</translation>
    </message>
    <message>
        <source>Telephony tools</source>
        <translation>Telefonie-Werkzeuge</translation>
    </message>
    <message>
        <source>Video conferences</source>
        <translation>Videokonferenzen</translation>
    </message>
    <message>
        <source>Web browsers</source>
        <translation>Webbrowser</translation>
    </message>
    <message>
        <source>Web development</source>
        <translation>Webentwicklung</translation>
    </message>
    <message>
        <source>MIDI</source>
        <translation>MIDI</translation>
    </message>
    <message>
        <source>Mixers</source>
        <translation>Mischpulte</translation>
    </message>
    <message>
        <source>Sequencers</source>
        <translation>Sequenzer</translation>
    </message>
    <message>
        <source>Tuners</source>
        <translation>Stimmgeräte</translation>
    </message>
    <message>
        <source>Television</source>
        <translation>Fernsehen</translation>
    </message>
    <message>
        <source>Audio and video editing</source>
        <translation>Audio- und Videobearbeitung</translation>
    </message>
    <message>
        <source>Players</source>
        <translation>Abspielprogramme</translation>
    </message>
    <message>
        <source>Recorders</source>
        <translation>Aufnahmeprogramme</translation>
    </message>
    <message>
        <source>Disc burning</source>
        <translation>Brennprogramme</translation>
    </message>
    <message>
        <source>Action games</source>
        <translation>Actionspiele</translation>
    </message>
    <message>
        <source>Adventure games</source>
        <translation>Abenteuerspiele</translation>
    </message>
    <message>
        <source>Arcade games</source>
        <translation>Arcade-Spiele</translation>
    </message>
    <message>
        <source>Board games</source>
        <translation>Brettspiele</translation>
    </message>
    <message>
        <source>Falling blocks games</source>
        <translation>Spiele mit fallenden Blöcken</translation>
    </message>
    <message>
        <source>Card games</source>
        <translation>Kartenspiele</translation>
    </message>
    <message>
        <source>Games for children</source>
        <translation>Kinderspiele</translation>
    </message>
    <message>
        <source>Logic games</source>
        <translation>Denkspiele</translation>
    </message>
    <message>
        <source>Role-playing games</source>
        <translation>Rollenspiele</translation>
    </message>
    <message>
        <source>Shooters</source>
        <translation>Schießspiele</translation>
    </message>
    <message>
        <source>Simulations</source>
        <translation>Simulationen</translation>
    </message>
    <message>
        <source>Sports games</source>
        <translation>Sportspiele</translation>
    </message>
    <message>
        <source>Strategy games</source>
        <translation>Strategiespiele</translation>
    </message>
    <message>
        <source>Art</source>
        <translation>Kunst</translation>
    </message>
    <message>
        <source>Construction</source>
        <translation>Bauwesen</translation>
    </message>
    <message>
        <source>Music</source>
        <translation>Musik</translation>
    </message>
    <message>
        <source>Languages</source>
        <translation>Sprachen</translation>
    </message>
    <message>
        <source>Artificial intelligence</source>
        <translation>Künstliche Intelligenz</translation>
    </message>
    <message>
        <source>Astronomy</source>
        <translation>Astronomie</translation>
    </message>
    <message>
        <source>Biology</source>
        <translation>Biologie</translation>
    </message>
    <message>
        <source>Chemistry</source>
        <translation>Chemie</translation>
    </message>
    <message>
        <source>Computer science</source>
        <translation>Informatik</translation>
    </message>
    <message>
        <source>Data visualization</source>
        <translation>Datenvisualisierung</translation>
    </message>
    <message>
        <source>Economics</source>
        <translation>Wirtschaft</translation>
    </message>
    <message>
        <source>Electricity</source>
        <translation>Elektrizität</translation>
    </message>
    <message>
        <source>Geography</source>
        <translation>Geografie</translation>
    </message>
    <message>
        <source>Geology</source>
        <translation>Geologie</translation>
    </message>
    <message>
        <source>Earth sciences</source>
        <translation>Geowissenschaften</translation>
    </message>
    <message>
        <source>History</source>
        <translation>Geschichte</translation>
    </message>
    <message>
        <source>Humanities</source>
        <translation>Geisteswissenschaften</translation>
    </message>
    <message>
        <source>Image processing</source>
        <translation>Bildverarbeitung</translation>
    </message>
    <message>
        <source>Literature</source>
        <translation>Literatur</translation>
    </message>
    <message>
        <source>Maps</source>
        <translation>Karten</translation>
    </message>
    <message>
        <source>Mathematics</source>
        <translation>Mathematik</translation>
    </message>
    <message>
        <source>Numerical analysis</source>
        <translation>Numerische Analyse</translation>
    </message>
    <message>
        <source>Medicine</source>
        <translation>Medizin</translation>
    </message>
    <message>
        <source>Physics</source>
        <translation>Physik</translation>
    </message>
    <message>
        <source>Robotics</source>
        <translation>Robotik</translation>
    </message>
    <message>
        <source>Spirituality</source>
        <translation>Spiritualität</translation>
    </message>
    <message>
        <source>Sports</source>
        <translation>Sport</translation>
    </message>
    <message>
        <source>Parallel computing</source>
        <translation>Paralleles Rechnen</translation>
    </message>
    <message>
        <source>Amusement</source>
        <translation>Unterhaltung</translation>
    </message>
    <message>
        <source>Archiving</source>
        <translation>Archivierung</translation>
    </message>
    <message>
        <source>Compression</source>
        <translation>Kompression</translation>
    </message>
    <message>
        <source>Electronics</source>
        <translation>Elektronik</translation>
    </message>
    <message>
        <source>Emulators</source>
        <translation>Emulatoren</translation>
    </message>
    <message>
        <source>Engineering</source>
        <translation>Ingenieurwesen</translation>
    </message>
    <message>
        <source>File tools</source>
        <translation>Dateiwerkzeuge</translation>
    </message>
    <message>
        <source>File managers</source>
        <translation>Dateimanager</translation>
    </message>
    <message>
        <source>Terminals</source>
        <translation>Terminals</translation>
    </message>
    <message>
        <source>File systems</source>
        <translation>Dateisysteme</translation>
    </message>
    <message>
        <source>Monitors</source>
        <translation>Systemüberwachung</translation>
    </message>
    <message>
        <source>Security</source>
        <translation>Sicherheit</translation>
    </message>
    <message>
        <source>Accessibility</source>
        <translation>Barrierefreiheit</translation>
    </message>
    <message>
        <source>Calculators</source>
        <translation>Taschenrechner</translation>
    </message>
    <message>
        <source>Clocks</source>
        <translation>Uhren</translation>
    </message>
    <message>
        <source>Text editors</source>
        <translation>Texteditoren</translation>
    </message>
    <message>
        <source>Documentation</source>
        <translation>Dokumentation</translation>
    </message>
    <message>
        <source>For adults</source>
        <translation>Für Erwachsene</translation>
    </message>
    <message>
        <source>Core of the desktop</source>
        <translation>Kern der Arbeitsumgebung</translation>
    </message>
    <message>
        <source>Made with KDE</source>
        <translation>Mit KDE gemacht</translation>
    </message>
    <message>
        <source>Made with GNOME</source>
        <translation>Mit GNOME gemacht</translation>
    </message>
    <message>
        <source>Made with Xfce</source>
        <translation>Mit Xfce gemacht</translation>
    </message>
    <message>
        <source>Made with GTK</source>
        <translation>Mit GTK gemacht</translation>
    </message>
    <message>
        <source>Made with Qt</source>
        <translation>Mit Qt gemacht</translation>
    </message>
    <message>
        <source>Made with Motif</source>
        <translation>Mit Motif gemacht</translation>
    </message>
    <message>
        <source>Made with Java</source>
        <translation>Mit Java gemacht</translation>
    </message>
    <message>
        <source>For the console</source>
        <translation>Für die Konsole</translation>
    </message>
    <message>
        <source>Screen savers</source>
        <translation>Bildschirmschoner</translation>
    </message>
    <message>
        <source>Icons of the system tray</source>
        <translation>Symbole der Kontrollleiste</translation>
    </message>
    <message>
        <source>Applets of a panel</source>
        <translation>Miniprogramme einer Leiste</translation>
    </message>
    <message>
        <source>Desktop shells</source>
        <translation>Shells der Arbeitsumgebung</translation>
    </message>
    <message>
        <source>Applications</source>
        <translation>Anwendungen</translation>
    </message>
</context>
<context>
    <name>VelUI::ChoiceDialog</name>
    <message>
        <source>Filter</source>
        <translation>Filter</translation>
    </message>
    <message>
        <source>Type to filter</source>
        <translation>Zum Filtern tippen</translation>
    </message>
    <message>
        <source>Reading...</source>
        <translation>Wird gelesen...</translation>
    </message>
    <message>
        <source>No match</source>
        <translation>Kein Treffer</translation>
    </message>
    <message numerus="yes">
        <source>%n chosen</source>
        <translation>
            <numerusform>%n gewählt</numerusform>
            <numerusform>%n gewählt</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::DesktopChooser</name>
    <message>
        <source>Desktop environment</source>
        <translation>Arbeitsumgebung</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Bemerkung</translation>
    </message>
    <message>
        <source>This session</source>
        <translation>Diese Sitzung</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Nicht registriert</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsDialog</name>
    <message>
        <source>An action has no id. It can have &quot;%1&quot;.</source>
        <translation>Eine Aktion hat keine Kennung. Sie kann „%1“ bekommen.</translation>
    </message>
    <message>
        <source>Two actions have the id &quot;%1&quot;. The second one can have &quot;%2&quot;.</source>
        <translation>Zwei Aktionen haben die Kennung „%1“. Die zweite kann „%2“ bekommen.</translation>
    </message>
    <message>
        <source>No entry can hold the id &quot;%1&quot;. It can be &quot;%2&quot;.</source>
        <translation>Kein Eintrag kann die Kennung „%1“ enthalten. Möglich ist „%2“.</translation>
    </message>
    <message>
        <source>The id &quot;%1&quot; should have only A to Z, a to z, 0 to 9 and &quot;-&quot; in it, as &quot;%2&quot; has.</source>
        <translation>Die Kennung „%1“ sollte nur A bis Z, a bis z, 0 bis 9 und „-“ enthalten, wie „%2“.</translation>
    </message>
    <message numerus="yes">
        <source>%n more id(s) should be changed.</source>
        <translation>
            <numerusform>%n weitere Kennung sollte geändert werden.</numerusform>
            <numerusform>%n weitere Kennungen sollten geändert werden.</numerusform>
        </translation>
    </message>
    <message>
        <source>Use &quot;%1&quot;</source>
        <translation>„%1“ verwenden</translation>
    </message>
    <message>
        <source>Use the proposed ids</source>
        <translation>Die vorgeschlagenen Kennungen verwenden</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsWidget</name>
    <message>
        <source>Add action</source>
        <translation>Aktion hinzufügen</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Aktion bearbeiten</translation>
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
        <translation>Das „;“ in „%1“ trennt keine Elemente, es wird Teil eines Elements.</translation>
    </message>
    <message numerus="yes">
        <source>Make %n item(s) of it</source>
        <translation>
            <numerusform>%n Element daraus machen</numerusform>
            <numerusform>%n Elemente daraus machen</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::EditableListWidget</name>
    <message>
        <source>Add string</source>
        <translation>Zeichenkette hinzufügen</translation>
    </message>
    <message>
        <source>String:</source>
        <translation>Zeichenkette:</translation>
    </message>
    <message>
        <source>Edit string</source>
        <translation>Zeichenkette bearbeiten</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryFormAssistance</name>
    <message>
        <source>Te&amp;xt</source>
        <comment>button: shows the file of the entry</comment>
        <translation>Te&amp;xt</translation>
    </message>
    <message>
        <source>Shows the file as it would be saved</source>
        <translation>Zeigt die Datei, wie sie gespeichert würde</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryTextDialog</name>
    <message>
        <source>Text of the entry</source>
        <translation>Text des Eintrags</translation>
    </message>
    <message>
        <source>The file as it would be saved</source>
        <translation>Die Datei, wie sie gespeichert würde</translation>
    </message>
    <message>
        <source>Nothing is changed.</source>
        <translation>Nichts ist geändert.</translation>
    </message>
    <message>
        <source>≠ changed lines: %1, + new lines: %2, removed lines: %3</source>
        <translation>≠ geänderte Zeilen: %1, + neue Zeilen: %2, entfernte Zeilen: %3</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldChoosers</name>
    <message>
        <source>Choose %1</source>
        <comment>name of a &quot;Choose...&quot; button</comment>
        <translation>%1 wählen</translation>
    </message>
    <message>
        <source>Choose...</source>
        <translation>Wählen...</translation>
    </message>
    <message>
        <source>Chooses from all that are known (Alt+Down)</source>
        <translation>Wählt aus allen, die bekannt sind (Alt+Unten)</translation>
    </message>
    <message>
        <source>Chooses an installed program (Alt+Down)</source>
        <translation>Wählt ein installiertes Programm (Alt+Unten)</translation>
    </message>
    <message>
        <source>Insert</source>
        <comment>button: a field code</comment>
        <translation>Einfügen</translation>
    </message>
    <message>
        <source>Insert a field code</source>
        <translation>Einen Feldcode einfügen</translation>
    </message>
    <message>
        <source>Inserts a code that stands for the files to open, or for a part of this entry</source>
        <translation>Fügt einen Code ein, der für die zu öffnenden Dateien oder einen Teil dieses Eintrags steht</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldCodes</name>
    <message>
        <source>%f: one file; for several files the program is started several times</source>
        <translation>%f: eine Datei; für mehrere Dateien wird das Programm mehrmals gestartet</translation>
    </message>
    <message>
        <source>%F: all files, each as a word of its own</source>
        <translation>%F: alle Dateien, jede als eigenes Wort</translation>
    </message>
    <message>
        <source>%u: one address (URL) or file; for several the program is started several times</source>
        <translation>%u: eine Adresse (URL) oder Datei; für mehrere wird das Programm mehrmals gestartet</translation>
    </message>
    <message>
        <source>%U: all addresses (URLs) or files, each as a word of its own</source>
        <translation>%U: alle Adressen (URLs) oder Dateien, jede als eigenes Wort</translation>
    </message>
    <message>
        <source>%i: --icon and the icon of this entry, if it has one</source>
        <translation>%i: --icon und das Symbol dieses Eintrags, wenn er eines hat</translation>
    </message>
    <message>
        <source>%c: the name of this entry, translated</source>
        <translation>%c: der Name dieses Eintrags, übersetzt</translation>
    </message>
    <message>
        <source>%k: where the file of this entry lies</source>
        <translation>%k: wo die Datei dieses Eintrags liegt</translation>
    </message>
    <message>
        <source>%%: a percent sign</source>
        <translation>%%: ein Prozentzeichen</translation>
    </message>
</context>
<context>
    <name>VelUI::FindingLine</name>
    <message>
        <source>Fix</source>
        <translation>Beheben</translation>
    </message>
    <message>
        <source>Fix: %1</source>
        <comment>on a button; %1 is what it does</comment>
        <translation>Beheben: %1</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>how bad something is, and what it is</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>Hint</source>
        <translation>Hinweis</translation>
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
        <translation>Änderung von %1 rückgängig machen</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Rückgängig</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Änderung von %1 wiederherstellen</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Wiederherstellen</translation>
    </message>
</context>
<context>
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>%1 bearbeiten</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageBar</name>
    <message>
        <source>&amp;Language:</source>
        <translation>&amp;Sprache:</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Sprache</translation>
    </message>
    <message>
        <source>Another language...</source>
        <translation>Andere Sprache...</translation>
    </message>
    <message>
        <source>Another language</source>
        <translation>Andere Sprache</translation>
    </message>
    <message>
        <source>Unknown language</source>
        <translation>Unbekannte Sprache</translation>
    </message>
    <message>
        <source>%1 (%2), yours: %3 of %4 texts</source>
        <translation>%1 (%2), Ihre: %3 von %4 Texten</translation>
    </message>
    <message>
        <source>%1 (%2), yours: no text yet</source>
        <translation>%1 (%2), Ihre: noch kein Text</translation>
    </message>
    <message>
        <source>%1 (%2): %3 of %4 texts</source>
        <translation>%1 (%2): %3 von %4 Texten</translation>
    </message>
    <message>
        <source>%1 (%2): no text yet</source>
        <translation>%1 (%2): noch kein Text</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageDialog</name>
    <message>
        <source>Another language</source>
        <translation>Andere Sprache</translation>
    </message>
    <message>
        <source>&amp;Language or its code, such as pt_BR:</source>
        <translation>&amp;Sprache oder ihr Code, zum Beispiel pt_BR:</translation>
    </message>
    <message>
        <source>Language or its code</source>
        <translation>Sprache oder ihr Code</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>a language and its code</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>No language has such a code: it is like de, pt_BR or sr@latin.</source>
        <translation>Keine Sprache hat einen solchen Code: Er sieht aus wie de, pt_BR oder sr@latin.</translation>
    </message>
    <message>
        <source>The code %1 is well-formed, but no language of this name is known.</source>
        <translation>Der Code %1 ist richtig gebildet, aber eine Sprache dieses Namens ist nicht bekannt.</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeChooser</name>
    <message>
        <source>Choose MIME types</source>
        <translation>MIME-Typen wählen</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeSource</name>
    <message>
        <source>MIME type</source>
        <translation>MIME-Typ</translation>
    </message>
    <message>
        <source>Description</source>
        <translation>Beschreibung</translation>
    </message>
    <message>
        <source>File names</source>
        <translation>Dateinamen</translation>
    </message>
    <message>
        <source>Not in the database</source>
        <translation>Nicht in der Datenbank</translation>
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
        <translation>Pfad des Programms auswählen</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramChooser</name>
    <message>
        <source>Choose a program</source>
        <translation>Ein Programm wählen</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramSource</name>
    <message>
        <source>Program</source>
        <comment>title of a column</comment>
        <translation>Programm</translation>
    </message>
    <message>
        <source>Folder</source>
        <comment>title of a column</comment>
        <translation>Ordner</translation>
    </message>
</context>
<context>
    <name>VelUI::RowFindings</name>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>Und %n weiteres.</numerusform>
            <numerusform>Und %n weitere.</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::TrialLine</name>
    <message>
        <source>Stop</source>
        <comment>button: ends the trial of an entry</comment>
        <translation>Anhalten</translation>
    </message>
    <message>
        <source>T&amp;ry</source>
        <comment>button: runs the entry</comment>
        <translation>Ausp&amp;robieren</translation>
    </message>
    <message>
        <source>Stops the trial</source>
        <translation>Hält den Versuch an</translation>
    </message>
    <message>
        <source>Runs the entry as it is now, without saving it</source>
        <translation>Führt den Eintrag aus, wie er jetzt ist, ohne ihn zu speichern</translation>
    </message>
    <message>
        <source>The program vel-open, which runs entries, could not be started: %1</source>
        <translation>Das Programm vel-open, das Einträge ausführt, konnte nicht gestartet werden: %1</translation>
    </message>
    <message>
        <source>The trial was stopped.</source>
        <translation>Der Versuch wurde angehalten.</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0).</source>
        <translation>Der Eintrag wurde gestartet (Exit-Status 0).</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0): %1</source>
        <translation>Der Eintrag wurde gestartet (Exit-Status 0): %1</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1).</source>
        <translation>Der Eintrag konnte nicht gestartet werden (Exit-Status %1).</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1): %2</source>
        <translation>Der Eintrag konnte nicht gestartet werden (Exit-Status %1): %2</translation>
    </message>
</context>
</TS>

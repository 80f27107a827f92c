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
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>%1 bearbeiten</translation>
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
</TS>

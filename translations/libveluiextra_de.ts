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
        <source>Hide</source>
        <translation>Ausblenden</translation>
    </message>
    <message>
        <source>Show again</source>
        <translation>Wieder anzeigen</translation>
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
        <source>Reload</source>
        <translation>Neu laden</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Dieses Menü ist leer. Drücken Sie %1 für einen neuen Eintrag oder klicken Sie hier mit der rechten Maustaste, um anderes hinzuzufügen.</translation>
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

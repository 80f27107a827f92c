<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="it" sourcelanguage="en">
<context>
    <name>ActionListEdit</name>
    <message>
        <source>Form</source>
        <translation>Modulo</translation>
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
        <translation>Vai a</translation>
    </message>
    <message>
        <source>Go to action &apos;%1&apos;</source>
        <translation>Vai all&apos;azione «%1»</translation>
    </message>
    <message>
        <source>Take over</source>
        <translation>Prendi</translation>
    </message>
    <message>
        <source>Take over &apos;%1&apos; from action &apos;%2&apos;</source>
        <translation>Prendi «%1» dall&apos;azione «%2»</translation>
    </message>
    <message>
        <source>Further clashes: %1</source>
        <translation>Altri conflitti: %1</translation>
    </message>
</context>
<context>
    <name>EditActionsDialog</name>
    <message>
        <source>Actions</source>
        <translation>Azioni</translation>
    </message>
</context>
<context>
    <name>EditActionsWidget</name>
    <message>
        <source>Form</source>
        <translation>Modulo</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Aggiungi...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Modifica...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Elimina</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Su</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Giù</translation>
    </message>
</context>
<context>
    <name>EditShortcutsAssistance</name>
    <message>
        <source>Schemes</source>
        <translation>Schemi</translation>
    </message>
    <message>
        <source>No action matches the filter.</source>
        <translation>Nessuna azione corrisponde al filtro.</translation>
    </message>
    <message>
        <source>No action has the shortcut %1.</source>
        <translation>Nessuna azione ha la scorciatoia %1.</translation>
    </message>
</context>
<context>
    <name>EditShortcutsDialog</name>
    <message>
        <source>None</source>
        <translation>Nessuna</translation>
    </message>
    <message>
        <source>Configure shortcuts</source>
        <translation>Configura le scorciatoie</translation>
    </message>
    <message>
        <source>Choose a key for selected action</source>
        <translation>Scegli un tasto per l&apos;azione selezionata</translation>
    </message>
    <message>
        <source>Default key:</source>
        <translation>Tasto predefinito:</translation>
    </message>
    <message>
        <source>Assign key:</source>
        <translation>Assegna tasto:</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>La scorciatoia «%1» è già usata per l&apos;azione globale «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;. Please try another.</source>
        <translation>La scorciatoia «%1» è già usata per l&apos;azione «%2». Provane un&apos;altra.</translation>
    </message>
    <message>
        <source>Shortcuts conflict</source>
        <translation>Conflitto tra scorciatoie</translation>
    </message>
    <message>
        <source>Apply changes</source>
        <translation>Applica le modifiche</translation>
    </message>
    <message>
        <source>Some shortcuts have been changed. Do you want to apply changes?</source>
        <translation>Alcune scorciatoie sono state modificate. Vuoi applicare le modifiche?</translation>
    </message>
</context>
<context>
    <name>EditStringsDialog</name>
    <message>
        <source>Strings</source>
        <translation>Stringhe</translation>
    </message>
</context>
<context>
    <name>EditableListWidget</name>
    <message>
        <source>Form</source>
        <translation>Modulo</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Aggiungi...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Modifica...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Elimina</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Su</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Giù</translation>
    </message>
</context>
<context>
    <name>KeyAssistance</name>
    <message>
        <source>Press the keys of the shortcut. Tab leaves the field.</source>
        <translation>Premi i tasti della scorciatoia. Tab lascia il campo.</translation>
    </message>
    <message>
        <source>Key for action &apos;%1&apos;</source>
        <translation>Tasto per l&apos;azione «%1»</translation>
    </message>
    <message>
        <source>None: no key for action &apos;%1&apos;</source>
        <translation>Nessuna: nessuna scorciatoia per l&apos;azione «%1»</translation>
    </message>
    <message>
        <source>What speaks against the key for action &apos;%1&apos;</source>
        <translation>Che cosa si oppone alla scorciatoia dell&apos;azione «%1»</translation>
    </message>
</context>
<context>
    <name>MenuDeletion</name>
    <message>
        <source>There is no trash for %1. It would be deleted for good: this cannot be undone. Delete it?</source>
        <translation>Non c&apos;è un cestino per %1. Sarebbe eliminato definitivamente: non si può annullare. Eliminarlo?</translation>
    </message>
    <message numerus="yes">
        <source>There is no trash for %n of these items. They would be deleted for good: this cannot be undone. Delete them?</source>
        <translation>
            <numerusform>Non c&apos;è un cestino per %n di questi elementi. Sarebbe eliminato definitivamente: non si può annullare. Eliminarlo?</numerusform>
            <numerusform>Non c&apos;è un cestino per %n di questi elementi. Sarebbero eliminati definitivamente: non si può annullare. Eliminarli?</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 cannot be deleted: %2</source>
        <translation>Impossibile eliminare %1: %2</translation>
    </message>
</context>
<context>
    <name>MenuHistory</name>
    <message>
        <source>Undo</source>
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Rifai</translation>
    </message>
    <message>
        <source>Done: %1</source>
        <translation>Fatto: %1</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Spostamento dei file...</translation>
    </message>
    <message>
        <source>Nothing was undone: %1</source>
        <translation>Non è stato annullato nulla: %1</translation>
    </message>
    <message>
        <source>Nothing was done again: %1</source>
        <translation>Non è stato rifatto nulla: %1</translation>
    </message>
    <message>
        <source>%1 is not there any more.</source>
        <translation>%1 non c&apos;è più.</translation>
    </message>
    <message>
        <source>There is another %1 by now.</source>
        <translation>Ora c&apos;è un altro %1.</translation>
    </message>
    <message>
        <source>%1 was changed by another program.</source>
        <translation>%1 è stato modificato da un altro programma.</translation>
    </message>
    <message>
        <source>%1 is not in the trash any more.</source>
        <translation>%1 non è più nel cestino.</translation>
    </message>
    <message>
        <source>%1 cannot be put into the trash.</source>
        <translation>%1 non può essere messo nel cestino.</translation>
    </message>
    <message>
        <source>It was canceled.</source>
        <translation>È stato interrotto.</translation>
    </message>
    <message>
        <source>%1 cannot be changed: %2</source>
        <translation>Impossibile modificare %1: %2</translation>
    </message>
    <message>
        <source>Undo creation of %1</source>
        <translation>Annulla la creazione di %1</translation>
    </message>
    <message>
        <source>Redo creation of %1</source>
        <translation>Rifai la creazione di %1</translation>
    </message>
    <message>
        <source>%1 was created.</source>
        <translation>%1 è stato creato.</translation>
    </message>
    <message>
        <source>Undo change of %1</source>
        <translation>Annulla la modifica di %1</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Rifai la modifica di %1</translation>
    </message>
    <message>
        <source>%1 was changed.</source>
        <translation>%1 è stato modificato.</translation>
    </message>
    <message>
        <source>Undo deletion of %1</source>
        <translation>Annulla l&apos;eliminazione di %1</translation>
    </message>
    <message>
        <source>Redo deletion of %1</source>
        <translation>Rifai l&apos;eliminazione di %1</translation>
    </message>
    <message>
        <source>%1 was deleted.</source>
        <translation>%1 è stato eliminato.</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Annulla l&apos;eliminazione della cartella %1 (%n voce)</numerusform>
            <numerusform>Annulla l&apos;eliminazione della cartella %1 (%n voci)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Rifai l&apos;eliminazione della cartella %1 (%n voce)</numerusform>
            <numerusform>Rifai l&apos;eliminazione della cartella %1 (%n voci)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The folder %1 was deleted (%n entries).</source>
        <translation>
            <numerusform>La cartella %1 è stata eliminata (%n voce).</numerusform>
            <numerusform>La cartella %1 è stata eliminata (%n voci).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %n items</source>
        <translation>
            <numerusform>Annulla l&apos;eliminazione di %n elemento</numerusform>
            <numerusform>Annulla l&apos;eliminazione di %n elementi</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %n items</source>
        <translation>
            <numerusform>Rifai l&apos;eliminazione di %n elemento</numerusform>
            <numerusform>Rifai l&apos;eliminazione di %n elementi</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were deleted.</source>
        <translation>
            <numerusform>%n elemento è stato eliminato.</numerusform>
            <numerusform>%n elementi sono stati eliminati.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo moving of %1 to %2</source>
        <translation>Annulla lo spostamento di %1 in %2</translation>
    </message>
    <message>
        <source>Redo moving of %1 to %2</source>
        <translation>Rifai lo spostamento di %1 in %2</translation>
    </message>
    <message>
        <source>%1 was moved to %2.</source>
        <translation>%1 è stato spostato in %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo moving of %n items to %2</source>
        <translation>
            <numerusform>Annulla lo spostamento di %n elemento in %2</numerusform>
            <numerusform>Annulla lo spostamento di %n elementi in %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo moving of %n items to %2</source>
        <translation>
            <numerusform>Rifai lo spostamento di %n elemento in %2</numerusform>
            <numerusform>Rifai lo spostamento di %n elementi in %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were moved to %2.</source>
        <translation>
            <numerusform>%n elemento è stato spostato in %2.</numerusform>
            <numerusform>%n elementi sono stati spostati in %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo copying of %1 to %2</source>
        <translation>Annulla la copia di %1 in %2</translation>
    </message>
    <message>
        <source>Redo copying of %1 to %2</source>
        <translation>Rifai la copia di %1 in %2</translation>
    </message>
    <message>
        <source>%1 was copied to %2.</source>
        <translation>%1 è stato copiato in %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo copying of %n items to %2</source>
        <translation>
            <numerusform>Annulla la copia di %n elemento in %2</numerusform>
            <numerusform>Annulla la copia di %n elementi in %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo copying of %n items to %2</source>
        <translation>
            <numerusform>Rifai la copia di %n elemento in %2</numerusform>
            <numerusform>Rifai la copia di %n elementi in %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were copied to %2.</source>
        <translation>
            <numerusform>%n elemento è stato copiato in %2.</numerusform>
            <numerusform>%n elementi sono stati copiati in %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo reordering of %1</source>
        <translation>Annulla il riordino di %1</translation>
    </message>
    <message>
        <source>Redo reordering of %1</source>
        <translation>Rifai il riordino di %1</translation>
    </message>
    <message>
        <source>%1 has another place.</source>
        <translation>%1 ha un altro posto.</translation>
    </message>
    <message>
        <source>Undo default menu</source>
        <translation>Annulla il menu predefinito</translation>
    </message>
    <message>
        <source>Redo default menu</source>
        <translation>Rifai il menu predefinito</translation>
    </message>
    <message>
        <source>The default menu was built.</source>
        <translation>Il menu predefinito è stato creato.</translation>
    </message>
    <message>
        <source>Undo hiding of %1</source>
        <translation>Annulla l&apos;occultamento di %1</translation>
    </message>
    <message>
        <source>Redo hiding of %1</source>
        <translation>Rifai l&apos;occultamento di %1</translation>
    </message>
    <message>
        <source>%1 is hidden: the menu no longer shows it.</source>
        <translation>%1 è nascosto: il menu non lo mostra più.</translation>
    </message>
    <message>
        <source>Undo showing %1 again</source>
        <translation>Annulla la nuova visualizzazione di %1</translation>
    </message>
    <message>
        <source>Redo showing %1 again</source>
        <translation>Rifai la nuova visualizzazione di %1</translation>
    </message>
    <message>
        <source>The menu shows %1 again.</source>
        <translation>Il menu mostra di nuovo %1.</translation>
    </message>
    <message>
        <source>Undo deletion of folder %1 (1 entry)</source>
        <translation>Annulla l&apos;eliminazione della cartella %1 (1 voce)</translation>
    </message>
    <message>
        <source>Redo deletion of folder %1 (1 entry)</source>
        <translation>Rifai l&apos;eliminazione della cartella %1 (1 voce)</translation>
    </message>
    <message>
        <source>The folder %1 was deleted (1 entry).</source>
        <translation>La cartella %1 è stata eliminata (1 voce).</translation>
    </message>
</context>
<context>
    <name>QFileSystemModel</name>
    <message>
        <source>%1 does not exist.</source>
        <translation>%1 non esiste.</translation>
    </message>
    <message>
        <source>%1 exists and was left as it is.</source>
        <translation>%1 esiste già ed è rimasto invariato.</translation>
    </message>
    <message>
        <source>%1 cannot be put into itself.</source>
        <translation>%1 non può essere inserito in se stesso.</translation>
    </message>
    <message>
        <source>%1 cannot be written.</source>
        <translation>Impossibile scrivere %1.</translation>
    </message>
    <message>
        <source>Can&apos;t move %1: %2</source>
        <translation>Impossibile spostare %1: %2</translation>
    </message>
    <message>
        <source>Can&apos;t copy %1: %2</source>
        <translation>Impossibile copiare %1: %2</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Attenzione</translation>
    </message>
    <message>
        <source>%1 already exists. Overwrite?</source>
        <translation>%1 esiste già. Vuoi sovrascriverlo?</translation>
    </message>
</context>
<context>
    <name>SchemeMenu</name>
    <message>
        <source>This is not a regular file.</source>
        <translation>Non è un file normale.</translation>
    </message>
    <message>
        <source>Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <translation>Scorciatoie prese: %1, tralasciate: %2. OK le mette in vigore, Ripristina le ritira.</translation>
    </message>
    <message>
        <source>%3
Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <comment>%3: a sentence about lines that were skipped</comment>
        <translation>%3
Scorciatoie prese: %1, tralasciate: %2. OK le mette in vigore, Ripristina le ritira.</translation>
    </message>
    <message>
        <source>&amp;Export keys...</source>
        <translation>&amp;Esporta tasti...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>&amp;Importa tasti...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>Salva il promemoria come &amp;HTML...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;text...</source>
        <translation>Salva il promemoria come &amp;testo...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>&amp;Copia il promemoria</translation>
    </message>
    <message>
        <source>Export keys</source>
        <translation>Esporta tasti</translation>
    </message>
    <message>
        <source>Keys (*.ini);;All files (*)</source>
        <translation>Tasti (*.ini);;Tutti i file (*)</translation>
    </message>
    <message>
        <source>%1
Choose another folder or another name, and try again.</source>
        <translation>%1
Scegli un&apos;altra cartella o un altro nome e riprova.</translation>
    </message>
    <message>
        <source>Import keys</source>
        <translation>Importa tasti</translation>
    </message>
    <message>
        <source>%1
Choose a file that was written with &apos;Export keys...&apos;.</source>
        <translation>%1
Scegli un file scritto con «Esporta tasti...».</translation>
    </message>
    <message>
        <source>HTML documents (*.html);;All files (*)</source>
        <translation>Documenti HTML (*.html);;Tutti i file (*)</translation>
    </message>
    <message>
        <source>Plain text (*.txt);;All files (*)</source>
        <translation>Testo semplice (*.txt);;Tutti i file (*)</translation>
    </message>
    <message>
        <source>Save cheat sheet</source>
        <translation>Salva il promemoria</translation>
    </message>
    <message>
        <source>The cheat sheet could not be saved to %1: %2
Choose another folder or another name, and try again.</source>
        <comment>%2: what the system says</comment>
        <translation>Impossibile salvare il promemoria in %1: %2
Scegli un&apos;altra cartella o un altro nome e riprova.</translation>
    </message>
</context>
<context>
    <name>SchemeQuestion</name>
    <message>
        <source>Import keys</source>
        <translation>Importa tasti</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Sostituisci</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>&amp;Tralascia</translation>
    </message>
    <message>
        <source>&amp;Do the same with all further ones</source>
        <translation>&amp;Fai lo stesso con tutte le altre</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but the global action &apos;%3&apos; has it. Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>Il file ha la scorciatoia «%1» per l&apos;azione «%2», ma la usa l&apos;azione globale «%3». Tralascia lascia l&apos;azione «%2» com&apos;è; Annulla non prende nulla.</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but action &apos;%3&apos; has it, too. Replace takes it away from action &apos;%3&apos;, Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>Il file ha la scorciatoia «%1» per l&apos;azione «%2», ma la usa anche l&apos;azione «%3». Sostituisci la toglie all&apos;azione «%3», Tralascia lascia l&apos;azione «%2» com&apos;è; Annulla non prende nulla.</translation>
    </message>
</context>
<context>
    <name>ShortcutClash</name>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;.</source>
        <translation>La scorciatoia «%1» è già usata per l&apos;azione «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; of action &apos;%3&apos; begins with &apos;%1&apos;.</source>
        <translation>La scorciatoia «%2» dell&apos;azione «%3» inizia con «%1».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; begins with &apos;%1&apos;, the shortcut of action &apos;%3&apos;.</source>
        <translation>La scorciatoia «%2» inizia con «%1», la scorciatoia dell&apos;azione «%3».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; opens the menu &apos;%2&apos;.</source>
        <translation>La scorciatoia «%1» apre il menu «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; leads to &apos;%2&apos; in the window.</source>
        <translation>La scorciatoia «%1» porta a «%2» nella finestra.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is the standard shortcut for &apos;%2&apos;.</source>
        <translation>La scorciatoia «%1» è la scorciatoia standard per «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>La scorciatoia «%1» è già usata per l&apos;azione globale «%2».</translation>
    </message>
    <message>
        <source>With &apos;%1&apos; as a shortcut this key cannot be typed into texts.</source>
        <translation>Con «%1» come scorciatoia, questo tasto non può essere digitato nei testi.</translation>
    </message>
    <message>
        <source>The current keyboard layout cannot produce &apos;%1&apos;.</source>
        <translation>La disposizione di tastiera attuale non può produrre «%1».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is a further shortcut of action &apos;%2&apos;.</source>
        <translation>La scorciatoia «%1» è un&apos;altra scorciatoia dell&apos;azione «%2».</translation>
    </message>
</context>
<context>
    <name>ShortcutDelegate</name>
    <message>
        <source>Back to no shortcut</source>
        <translation>Torna a nessuna scorciatoia</translation>
    </message>
    <message>
        <source>Back to %1</source>
        <translation>Torna a %1</translation>
    </message>
</context>
<context>
    <name>ShortcutFilterBar</name>
    <message>
        <source>Press keys</source>
        <translation>Premi tasti</translation>
    </message>
    <message>
        <source>Changed only</source>
        <translation>Solo modificate</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtro</translation>
    </message>
    <message>
        <source>Shows who has the keys that you press; Escape ends it.</source>
        <translation>Mostra chi ha i tasti che premi; Esc lo termina.</translation>
    </message>
    <message>
        <source>Shows the actions alone whose shortcut is not the default one, or was edited.</source>
        <translation>Mostra solo le azioni la cui scorciatoia non è quella predefinita o è stata modificata.</translation>
    </message>
    <message>
        <source>Press the keys to look for</source>
        <translation>Premi i tasti da cercare</translation>
    </message>
    <message>
        <source>Filter by name, group or shortcut</source>
        <translation>Filtra per nome, gruppo o scorciatoia</translation>
    </message>
</context>
<context>
    <name>ShortcutScheme</name>
    <message>
        <source>The shortcuts could not be saved to %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Impossibile salvare le scorciatoie in %1: %2</translation>
    </message>
    <message>
        <source>The shortcuts could not be read from %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Impossibile leggere le scorciatoie da %1: %2</translation>
    </message>
    <message>
        <source>%1 is not a regular file.</source>
        <translation>%1 non è un file normale.</translation>
    </message>
    <message>
        <source>%1 is too large for a file of shortcuts.</source>
        <translation>%1 è troppo grande per un file di scorciatoie.</translation>
    </message>
    <message>
        <source>%1 holds no shortcuts.</source>
        <translation>%1 non contiene scorciatoie.</translation>
    </message>
    <message>
        <source>Unreadable shortcuts in %1 were skipped: %2</source>
        <comment>%2: their number</comment>
        <translation>Le scorciatoie illeggibili in %1 sono state saltate: %2</translation>
    </message>
</context>
<context>
    <name>ShortcutSheet</name>
    <message>
        <source>Keyboard shortcuts</source>
        <comment>title of a printed sheet</comment>
        <translation>Scorciatoie da tastiera</translation>
    </message>
</context>
<context>
    <name>ShortcutsModel</name>
    <message>
        <source>Action</source>
        <translation>Azione</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Scorciatoia</translation>
    </message>
    <message>
        <source>%1, changed</source>
        <comment>%1: an action or a key</comment>
        <translation>%1, modificato</translation>
    </message>
    <message>
        <source>No shortcut</source>
        <translation>Nessuna scorciatoia</translation>
    </message>
    <message>
        <source>There is no default shortcut.</source>
        <translation>Non c&apos;è una scorciatoia predefinita.</translation>
    </message>
    <message>
        <source>The default shortcut is %1.</source>
        <translation>La scorciatoia predefinita è %1.</translation>
    </message>
</context>
<context>
    <name>StandardKeyNames</name>
    <message>
        <source>Help</source>
        <translation>Aiuto</translation>
    </message>
    <message>
        <source>What&apos;s this?</source>
        <translation>Che cos&apos;è?</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Apri</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Chiudi</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Salva</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>Salva come</translation>
    </message>
    <message>
        <source>New</source>
        <translation>Nuovo</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Elimina</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Taglia</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copia</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Incolla</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Rifai</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Indietro</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Avanti</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Aggiorna</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Ingrandisci</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Rimpicciolisci</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Stampa</translation>
    </message>
    <message>
        <source>New tab</source>
        <translation>Nuova scheda</translation>
    </message>
    <message>
        <source>Next tab</source>
        <translation>Scheda successiva</translation>
    </message>
    <message>
        <source>Previous tab</source>
        <translation>Scheda precedente</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Trova</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Trova successivo</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Trova precedente</translation>
    </message>
    <message>
        <source>Replace</source>
        <translation>Sostituisci</translation>
    </message>
    <message>
        <source>Select all</source>
        <translation>Seleziona tutto</translation>
    </message>
    <message>
        <source>Deselect</source>
        <translation>Deseleziona</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Schermo intero</translation>
    </message>
    <message>
        <source>Preferences</source>
        <translation>Preferenze</translation>
    </message>
    <message>
        <source>Quit</source>
        <translation>Esci</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Grassetto</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Corsivo</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Sottolineato</translation>
    </message>
    <message>
        <source>Move the cursor</source>
        <translation>Sposta il cursore</translation>
    </message>
    <message>
        <source>Select text</source>
        <translation>Seleziona il testo</translation>
    </message>
    <message>
        <source>Edit text</source>
        <translation>Modifica il testo</translation>
    </message>
</context>
<context>
    <name>StringListEdit</name>
    <message>
        <source>Form</source>
        <translation>Modulo</translation>
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
        <translation>&amp;Ripristina questa scorciatoia</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryEditDialog</name>
    <message>
        <source>Warning</source>
        <translation>Avviso</translation>
    </message>
    <message>
        <source>no executable</source>
        <translation>nessun eseguibile</translation>
    </message>
    <message>
        <source>can&apos;t find executable</source>
        <translation>impossibile trovare l&apos;eseguibile</translation>
    </message>
    <message>
        <source>can&apos;t find try executable</source>
        <translation>impossibile trovare l&apos;eseguibile di verifica</translation>
    </message>
    <message>
        <source>can&apos;t find URL</source>
        <translation>impossibile trovare l&apos;URL</translation>
    </message>
    <message>
        <source>wrong/incomplete desktop entry</source>
        <translation>voce desktop errata o incompleta</translation>
    </message>
    <message>
        <source>Can&apos;t save position on desktop for %1</source>
        <translation>Impossibile salvare la posizione di %1 sul desktop</translation>
    </message>
    <message>
        <source>Copy from...</source>
        <translation>Copia da...</translation>
    </message>
    <message>
        <source>Can&apos;t load file %1</source>
        <translation>Impossibile caricare il file %1</translation>
    </message>
    <message>
        <source>Desktop Entry Editor</source>
        <translation>Editor di voci desktop</translation>
    </message>
    <message>
        <source>You create hidden desktop entry</source>
        <translation>Stai creando una voce desktop nascosta</translation>
    </message>
    <message>
        <source>Can&apos;t save file %1</source>
        <translation>Impossibile salvare il file %1</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Aiuto</translation>
    </message>
    <message>
        <source>&lt;b&gt;Desktop entry&lt;/b&gt; is a multipurpose info file for installed apps, devices, etc. It can be used to build menu entries, shortcuts, etc. This dialog implements the &apos;Desktop Entry Standard&apos; of &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Desktop entry file is a text ini-like file with one main section [Desktop Entry] and possible additional sections for each action defined in the main section field &apos;Actions&apos;. All fields are text string pairs: key=value. Value can also be a semicolon separated string list.</source>
        <translation>Una &lt;b&gt;voce desktop&lt;/b&gt; è un file di informazioni multiuso per applicazioni installate, dispositivi, ecc. Può essere usata per costruire voci di menu, collegamenti, ecc. Questa finestra implementa il «Desktop Entry Standard» di &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Il file di una voce desktop è un file di testo in stile INI con una sezione principale [Desktop Entry] ed eventuali sezioni aggiuntive per ogni azione definita nel campo «Actions» della sezione principale. Tutti i campi sono coppie di stringhe di testo: chiave=valore. Il valore può anche essere un elenco di stringhe separate da punto e virgola.</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryPropsWidgetPrivate</name>
    <message>
        <source>Information about the URL</source>
        <translation>Informazioni sull&apos;URL</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Mostra solo in</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Non mostrare in</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Aggiungi ambiente desktop:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Modifica ambiente desktop:</translation>
    </message>
    <message>
        <source>MIME type or file name extension:</source>
        <translation>Tipo MIME o estensione del nome del file:</translation>
    </message>
    <message>
        <source>MIME type</source>
        <translation>Tipo MIME</translation>
    </message>
    <message>
        <source>Add MIME type</source>
        <translation>Aggiungi tipo MIME</translation>
    </message>
    <message>
        <source>Edit MIME type</source>
        <translation>Modifica tipo MIME</translation>
    </message>
    <message>
        <source>Categories</source>
        <translation>Categorie</translation>
    </message>
    <message>
        <source>Add category</source>
        <translation>Aggiungi categoria</translation>
    </message>
    <message>
        <source>Category:</source>
        <translation>Categoria:</translation>
    </message>
    <message>
        <source>Edit category</source>
        <translation>Modifica categoria</translation>
    </message>
    <message>
        <source>Keywords</source>
        <translation>Parole chiave</translation>
    </message>
    <message>
        <source>Add keyword</source>
        <translation>Aggiungi parola chiave</translation>
    </message>
    <message>
        <source>Keyword:</source>
        <translation>Parola chiave:</translation>
    </message>
    <message>
        <source>Edit keyword</source>
        <translation>Modifica parola chiave</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Azioni</translation>
    </message>
    <message>
        <source>Add action</source>
        <translation>Aggiungi azione</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Modifica azione</translation>
    </message>
    <message>
        <source>Application</source>
        <translation>Applicazione</translation>
    </message>
    <message>
        <source>Link</source>
        <translation>Collegamento</translation>
    </message>
    <message>
        <source>Directory</source>
        <translation>Cartella</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Attenzione</translation>
    </message>
    <message>
        <source>Desktop entry type was changed.
Some field values may be lost...
Continue?</source>
        <translation>Il tipo della voce desktop è stato cambiato.
I valori di alcuni campi potrebbero andare persi...
Continuare?</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>Tipo</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nome</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Icona</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Comando</translation>
    </message>
    <message>
        <source>Terminal</source>
        <translation>Terminale</translation>
    </message>
    <message>
        <source>Path</source>
        <translation>Percorso di lavoro</translation>
    </message>
    <message>
        <source>Try exec</source>
        <translation>Comando di verifica</translation>
    </message>
    <message>
        <source>Url</source>
        <translation>URL</translation>
    </message>
    <message>
        <source>Generic name</source>
        <translation>Nome generico</translation>
    </message>
    <message>
        <source>Comment</source>
        <translation>Commento</translation>
    </message>
    <message>
        <source>No display</source>
        <translation>Non mostrare</translation>
    </message>
    <message>
        <source>Hidden</source>
        <translation>Nascosto</translation>
    </message>
    <message>
        <source>Startup notify</source>
        <translation>Notifica d&apos;avvio</translation>
    </message>
    <message>
        <source>Startup WM class</source>
        <translation>Classe della finestra all&apos;avvio</translation>
    </message>
    <message>
        <source>Version</source>
        <translation>Versione</translation>
    </message>
</context>
<context>
    <name>VelMenuDialog</name>
    <message>
        <source>Edit</source>
        <translation>Modifica</translation>
    </message>
    <message>
        <source>Send command to vel-wm to update
 edited menu, toolbar, etc.</source>
        <translation>Invia a vel-wm il comando per aggiornare
 il menu, la barra degli strumenti, ecc. modificati</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Avviso</translation>
    </message>
    <message>
        <source>Can&apos;t send command to vel-wm</source>
        <translation>Impossibile inviare il comando a vel-wm</translation>
    </message>
    <message>
        <source>This menu cannot be changed: the folder %1 does not exist.</source>
        <translation>Questo menu non può essere modificato: la cartella %1 non esiste.</translation>
    </message>
    <message>
        <source>This menu cannot be changed: you may not write to the folder %1.</source>
        <translation>Questo menu non può essere modificato: non puoi scrivere nella cartella %1.</translation>
    </message>
    <message>
        <source>Show hidden</source>
        <translation>Mostra nascosti</translation>
    </message>
    <message>
        <source>Filter by name, command or keyword</source>
        <translation>Filtra per nome, comando o parola chiave</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtro</translation>
    </message>
    <message>
        <source>Also show the entries that the menu leaves out</source>
        <translation>Mostra anche le voci che il menu tralascia</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Errore</translation>
    </message>
    <message>
        <source>Start menu</source>
        <translation>Menu di avvio</translation>
    </message>
</context>
<context>
    <name>VelMenuView</name>
    <message>
        <source>Warning</source>
        <translation>Avviso</translation>
    </message>
    <message>
        <source>Can&apos;t start:
%1 %2</source>
        <translation>Impossibile avviare:
%1 %2</translation>
    </message>
    <message>
        <source>All previous shortcuts
will be lost. Are you sure?</source>
        <translation>Tutti i collegamenti precedenti
andranno persi. Sei sicuro?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Modifica</translation>
    </message>
    <message>
        <source>New folder</source>
        <translation>Nuova cartella</translation>
    </message>
    <message>
        <source>New entry</source>
        <translation>Nuova voce</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Elimina</translation>
    </message>
    <message>
        <source>Execute</source>
        <translation>Esegui</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Trova</translation>
    </message>
    <message>
        <source>Find Next</source>
        <translation>Trova successivo</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Taglia</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copia</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Incolla</translation>
    </message>
    <message>
        <source>Default menu...</source>
        <translation>Menu predefinito...</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Su</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Giù</translation>
    </message>
    <message>
        <source>Move</source>
        <translation>Sposta</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Gruppo</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Collegamento</translation>
    </message>
    <message>
        <source>Can&apos;t edit non desktop file</source>
        <translation>Impossibile modificare un file che non è di tipo «desktop»</translation>
    </message>
    <message>
        <source>Desktop Entry %1</source>
        <translation>Voce desktop %1</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Attenzione</translation>
    </message>
    <message>
        <source>Are you sure to delete it?</source>
        <translation>Vuoi davvero eliminarlo?</translation>
    </message>
    <message>
        <source>Find string:</source>
        <translation>Trova stringa:</translation>
    </message>
    <message>
        <source>&apos;%1&apos; not found .</source>
        <translation>«%1» non trovato.</translation>
    </message>
    <message>
        <source>Not in the menu: it is not meant for this desktop.</source>
        <translation>Non nel menu: la voce non è destinata a questo desktop.</translation>
    </message>
    <message>
        <source>Not in the menu: it is meant for other desktops only (%1).</source>
        <translation>Non nel menu: la voce è destinata solo ad altri desktop (%1).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked as deleted (Hidden).</source>
        <translation>Non nel menu: la voce è contrassegnata come eliminata (Hidden).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked not to be displayed (NoDisplay).</source>
        <translation>Non nel menu: la voce è contrassegnata per non essere mostrata (NoDisplay).</translation>
    </message>
    <message>
        <source>Not in the menu: the program %1 is not installed (TryExec).</source>
        <translation>Non nel menu: il programma %1 non è installato (TryExec).</translation>
    </message>
    <message>
        <source>This file is not a desktop entry, whatever its name says.</source>
        <translation>Questo file non è una voce desktop, qualunque cosa dica il suo nome.</translation>
    </message>
    <message>
        <source>This file cannot be read.</source>
        <translation>Questo file non può essere letto.</translation>
    </message>
    <message>
        <source>This entry has no name. The name of its file is shown.</source>
        <translation>Questa voce non ha un nome. Viene mostrato il nome del suo file.</translation>
    </message>
    <message>
        <source>Taking back what was done...</source>
        <translation>Annullamento di ciò che è stato fatto...</translation>
    </message>
    <message>
        <source>The program that holds the clipboard does not answer. Nothing was pasted.</source>
        <translation>Il programma che detiene gli appunti non risponde. Non è stato incollato nulla.</translation>
    </message>
    <message>
        <source>Nothing can be created in %1, because there is no such folder.</source>
        <translation>Non si può creare nulla in %1, perché quella cartella non esiste.</translation>
    </message>
    <message>
        <source>%1 could not be saved. Make sure that the folder %2 may be written and that the disk is not full, then try again.</source>
        <translation>Impossibile salvare %1. Assicurati che si possa scrivere nella cartella %2 e che il disco non sia pieno, poi riprova.</translation>
    </message>
    <message>
        <source>%1 could not be deleted: %2. Make sure that the folder that holds it may be written, then try again.</source>
        <translation>Impossibile eliminare %1: %2. Assicurati che si possa scrivere nella cartella che lo contiene, poi riprova.</translation>
    </message>
    <message>
        <source>%1 was deleted in part only, because %2 could not be deleted: %3. Make sure that its folder may be written, then delete the rest.</source>
        <translation>%1 è stato eliminato solo in parte, perché non è stato possibile eliminare %2: %3. Assicurati che si possa scrivere nella sua cartella, poi elimina il resto.</translation>
    </message>
    <message>
        <source>Nothing in this menu matches &apos;%1&apos;.</source>
        <translation>Nulla in questo menu corrisponde a «%1».</translation>
    </message>
    <message>
        <source>Searching the menu for &apos;%1&apos;...</source>
        <translation>Ricerca di «%1» nel menu...</translation>
    </message>
    <message>
        <source>The menu is too large to be searched as a whole. Only a part of it was searched.</source>
        <translation>Il menu è troppo grande per essere cercato per intero. Ne è stata cercata solo una parte.</translation>
    </message>
    <message>
        <source>Hide</source>
        <translation>Nascondi</translation>
    </message>
    <message>
        <source>Show again</source>
        <translation>Mostra di nuovo</translation>
    </message>
    <message>
        <source>&apos;%1&apos; was not changed: the file %2 cannot be written.</source>
        <translation>«%1» non è stato modificato: impossibile scrivere nel file %2.</translation>
    </message>
    <message>
        <source>The order of the folder %1 could not be saved. Make sure that the folder may be written and that the disk is not full, then try again.</source>
        <translation>Impossibile salvare l&apos;ordine della cartella %1. Assicurati che si possa scrivere nella cartella e che il disco non sia pieno, poi riprova.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1. The menu was left as it is.</source>
        <translation>Impossibile creare il menu predefinito in %1. Il menu è rimasto com&apos;era.</translation>
    </message>
    <message>
        <source>Menu</source>
        <comment>the tree</comment>
        <translation>Menu</translation>
    </message>
    <message>
        <source>%1 cannot be edited, because the folder %2 may not be written.</source>
        <translation>%1 non può essere modificato, perché non si può scrivere nella cartella %2.</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Spostamento dei file...</translation>
    </message>
    <message>
        <source>Copying files...</source>
        <translation>Copia dei file...</translation>
    </message>
    <message>
        <source>Deleting files...</source>
        <translation>Eliminazione dei file...</translation>
    </message>
    <message>
        <source>The deletion of %1 was canceled. What was not yet deleted is still there.</source>
        <translation>L&apos;eliminazione di %1 è stata interrotta. Ciò che non era ancora eliminato c&apos;è ancora.</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Ricarica</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Questo menu è vuoto. Premi %1 per una nuova voce, o fai clic qui con il tasto destro per vedere che altro si può aggiungere.</translation>
    </message>
</context>
<context>
    <name>VelUI::ActionPropsDialog</name>
    <message>
        <source>Id</source>
        <translation>Identificativo</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nome</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Icona</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Comando</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Mostra solo in</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Aggiungi ambiente desktop:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Modifica ambiente desktop:</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Non mostrare in</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsWidget</name>
    <message>
        <source>Add action</source>
        <translation>Aggiungi azione</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Modifica azione</translation>
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
        <translation>Aggiungi stringa</translation>
    </message>
    <message>
        <source>String:</source>
        <translation>Stringa:</translation>
    </message>
    <message>
        <source>Edit string</source>
        <translation>Modifica stringa</translation>
    </message>
</context>
<context>
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>Modifica %1</translation>
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
        <translation>Scegli il percorso dell&apos;eseguibile dell&apos;applicazione</translation>
    </message>
</context>
</TS>

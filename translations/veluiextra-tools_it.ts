<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="it" sourcelanguage="en">
<context>
    <name>DesktopEntryPages</name>
    <message>
        <source>&amp;Read-only</source>
        <translation>&amp;Sola lettura</translation>
    </message>
    <message>
        <source>&amp;Button beside the address</source>
        <translation>&amp;Pulsante accanto all&apos;indirizzo</translation>
    </message>
    <message>
        <source>Information requested for %1</source>
        <translation>Chieste informazioni su %1</translation>
    </message>
    <message>
        <source>Use the buttons beside the fields to edit commands, files, icons, lists and actions.</source>
        <translation>Comandi e file, icone, elenchi e azioni si modificano con i pulsanti dei rispettivi campi.</translation>
    </message>
    <message>
        <source>Properties form</source>
        <translation>Modulo delle proprietà</translation>
    </message>
    <message>
        <source>Desktop entries</source>
        <translation>Voci desktop</translation>
    </message>
    <message>
        <source>Paths, icons, lists and actions</source>
        <translation>Percorsi, icone, elenchi e azioni</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Assistenza</translation>
    </message>
</context>
<context>
    <name>EditorCommands</name>
    <message>
        <source>Open</source>
        <translation>Apri</translation>
    </message>
    <message>
        <source>Cannot read %1.</source>
        <translation>Impossibile leggere %1.</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Salva</translation>
    </message>
    <message>
        <source>Cannot write %1.</source>
        <translation>Impossibile scrivere %1.</translation>
    </message>
    <message>
        <source>Go to line</source>
        <translation>Vai alla riga</translation>
    </message>
    <message>
        <source>Line:</source>
        <translation>Riga:</translation>
    </message>
    <message>
        <source>File</source>
        <translation>File</translation>
    </message>
    <message>
        <source>&amp;New</source>
        <translation>&amp;Nuovo</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>&amp;Apri...</translation>
    </message>
    <message>
        <source>&amp;Save...</source>
        <translation>&amp;Salva...</translation>
    </message>
    <message>
        <source>Insert &amp;date</source>
        <translation>Inserisci &amp;data</translation>
    </message>
    <message>
        <source>Insert &amp;time</source>
        <translation>Inserisci &amp;ora</translation>
    </message>
    <message>
        <source>Insert &amp;rule</source>
        <translation>Inserisci &amp;linea di separazione</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Modifica</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Annulla</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Rifai</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>&amp;Taglia</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Copia</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>&amp;Incolla</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>Seleziona t&amp;utto</translation>
    </message>
    <message>
        <source>Select word</source>
        <translation>Seleziona parola</translation>
    </message>
    <message>
        <source>Select line</source>
        <translation>Seleziona riga</translation>
    </message>
    <message>
        <source>Select paragraph</source>
        <translation>Seleziona paragrafo</translation>
    </message>
    <message>
        <source>Find selected a&amp;gain</source>
        <translation>Trova &amp;selezione successiva</translation>
    </message>
    <message>
        <source>Find selected backward</source>
        <translation>Trova selezione precedente</translation>
    </message>
    <message>
        <source>Find selected word</source>
        <translation>Trova la parola selezionata</translation>
    </message>
    <message>
        <source>Find selected, matching case</source>
        <translation>Trova selezione distinguendo maiuscole</translation>
    </message>
    <message>
        <source>Go to &amp;line...</source>
        <translation>Vai alla ri&amp;ga...</translation>
    </message>
    <message>
        <source>Go to start</source>
        <translation>Vai all&apos;inizio</translation>
    </message>
    <message>
        <source>Go to end</source>
        <translation>Vai alla fine</translation>
    </message>
    <message>
        <source>Go to next paragraph</source>
        <translation>Vai al paragrafo successivo</translation>
    </message>
    <message>
        <source>Go to previous paragraph</source>
        <translation>Vai al paragrafo precedente</translation>
    </message>
    <message>
        <source>Delete word to the left</source>
        <translation>Elimina parola a sinistra</translation>
    </message>
    <message>
        <source>Delete word to the right</source>
        <translation>Elimina parola a destra</translation>
    </message>
    <message>
        <source>Delete to start of line</source>
        <translation>Elimina fino all&apos;inizio della riga</translation>
    </message>
    <message>
        <source>Delete to end of line</source>
        <translation>Elimina fino alla fine della riga</translation>
    </message>
    <message>
        <source>To upper case</source>
        <translation>Converti in maiuscolo</translation>
    </message>
    <message>
        <source>To lower case</source>
        <translation>Converti in minuscolo</translation>
    </message>
    <message>
        <source>Swap case</source>
        <translation>Scambia maiuscole e minuscole</translation>
    </message>
    <message>
        <source>Capitalize</source>
        <translation>Iniziale maiuscola</translation>
    </message>
    <message>
        <source>Move line up</source>
        <translation>Sposta riga in su</translation>
    </message>
    <message>
        <source>Move line down</source>
        <translation>Sposta riga in giù</translation>
    </message>
    <message>
        <source>New line above</source>
        <translation>Nuova riga sopra</translation>
    </message>
    <message>
        <source>New line below</source>
        <translation>Nuova riga sotto</translation>
    </message>
    <message>
        <source>Duplicate lines</source>
        <translation>Duplica righe</translation>
    </message>
    <message>
        <source>Join lines</source>
        <translation>Unisci righe</translation>
    </message>
    <message>
        <source>Sort lines</source>
        <translation>Ordina righe</translation>
    </message>
    <message>
        <source>Reverse lines</source>
        <translation>Inverti righe</translation>
    </message>
    <message>
        <source>Remove duplicate lines</source>
        <translation>Rimuovi righe duplicate</translation>
    </message>
    <message>
        <source>Remove empty lines</source>
        <translation>Rimuovi righe vuote</translation>
    </message>
    <message>
        <source>Trim lines</source>
        <translation>Rifila righe</translation>
    </message>
    <message>
        <source>Indent lines</source>
        <translation>Fai rientrare righe</translation>
    </message>
    <message>
        <source>Unindent lines</source>
        <translation>Riduci rientro righe</translation>
    </message>
    <message>
        <source>Comment lines</source>
        <translation>Commenta righe</translation>
    </message>
    <message>
        <source>Uncomment lines</source>
        <translation>Decommenta righe</translation>
    </message>
    <message>
        <source>Tabs to spaces</source>
        <translation>Tabulazioni in spazi</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Visualizza</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>&amp;Ingrandisci</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>&amp;Rimpicciolisci</translation>
    </message>
    <message>
        <source>&amp;Wrap lines</source>
        <translation>A capo a&amp;utomatico</translation>
    </message>
    <message>
        <source>&amp;Fixed-width font</source>
        <translation>Larghezza &amp;fissa</translation>
    </message>
    <message>
        <source>&amp;Proportional font</source>
        <translation>Larghezza &amp;proporzionale</translation>
    </message>
    <message>
        <source>O&amp;verwrite</source>
        <translation>So&amp;vrascrivi</translation>
    </message>
    <message>
        <source>&amp;Read only</source>
        <translation>S&amp;ola lettura</translation>
    </message>
    <message>
        <source>Wide cur&amp;sor</source>
        <translation>Cursore &amp;largo</translation>
    </message>
    <message>
        <source>&amp;Center on cursor</source>
        <translation>&amp;Centra sul cursore</translation>
    </message>
    <message>
        <source>Scroll &amp;up</source>
        <translation>Scorri in &amp;su</translation>
    </message>
    <message>
        <source>Scroll &amp;down</source>
        <translation>Scorri in &amp;giù</translation>
    </message>
    <message>
        <source>Scroll to &amp;top</source>
        <translation>Scorri all&apos;ini&amp;zio</translation>
    </message>
    <message>
        <source>Scroll to botto&amp;m</source>
        <translation>Scorri alla fin&amp;e</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Testo</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Tasti</translation>
    </message>
    <message>
        <source>The file has %1 for %2, but %3 has it, too.</source>
        <translation>Il file ha %1 per %2, ma la usa anche %3.</translation>
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
        <source>Save cheat sheet as te&amp;xt...</source>
        <translation>Salva il &amp;promemoria come testo...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>&amp;Copia il promemoria</translation>
    </message>
</context>
<context>
    <name>EntryWindow</name>
    <message>
        <source>Unsaved changes</source>
        <translation>Modifiche non salvate</translation>
    </message>
    <message>
        <source>The entry %1 was changed.
Save the changes?</source>
        <translation>La voce %1 è stata modificata.
Vuoi salvare le modifiche?</translation>
    </message>
</context>
<context>
    <name>FileIconsPage</name>
    <message>
        <source>File icons</source>
        <translation>Icone dei file</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>Modelli</translation>
    </message>
</context>
<context>
    <name>GalleryWindow</name>
    <message>
        <source>Widget gallery</source>
        <translation>Galleria degli elementi grafici</translation>
    </message>
    <message>
        <source>Pages</source>
        <translation>Pagine</translation>
    </message>
    <message>
        <source>Code of this page</source>
        <translation>Codice di questa pagina</translation>
    </message>
</context>
<context>
    <name>KeyNamesPage</name>
    <message>
        <source>&amp;Press keys:</source>
        <translation>&amp;Premi i tasti:</translation>
    </message>
    <message>
        <source>In the window manager&apos;s notation:</source>
        <translation>Come li scrive il gestore delle finestre:</translation>
    </message>
    <message>
        <source>Read back:</source>
        <translation>Riletto:</translation>
    </message>
    <message>
        <source>Global action with these keys:</source>
        <translation>Azione globale con questi tasti:</translation>
    </message>
    <message>
        <source>Key names</source>
        <translation>Nomi dei tasti</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Scorciatoie</translation>
    </message>
</context>
<context>
    <name>MenuPages</name>
    <message>
        <source>&amp;Pick an entry...</source>
        <translation>&amp;Scegli una voce...</translation>
    </message>
    <message>
        <source>Edit the &amp;menu...</source>
        <translation>Modifica il &amp;menu...</translation>
    </message>
    <message>
        <source>Edit an e&amp;ntry...</source>
        <translation>Modifica una &amp;voce...</translation>
    </message>
    <message>
        <source>Menu tree</source>
        <translation>Albero del menu</translation>
    </message>
    <message>
        <source>Menus</source>
        <translation>Menu</translation>
    </message>
    <message>
        <source>Menu and entry dialogs</source>
        <translation>Finestre di menu e di voce</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Assistenza</translation>
    </message>
</context>
<context>
    <name>RadioGroupBoxPage</name>
    <message>
        <source>&amp;Automatic configuration</source>
        <translation>Configurazione &amp;automatica</translation>
    </message>
    <message>
        <source>Script address:</source>
        <translation>Indirizzo dello script:</translation>
    </message>
    <message>
        <source>Ask again at every start</source>
        <translation>Chiedi di nuovo a ogni avvio</translation>
    </message>
    <message>
        <source>&amp;Manual configuration</source>
        <translation>Configurazione &amp;manuale</translation>
    </message>
    <message>
        <source>Host:</source>
        <translation>Host:</translation>
    </message>
    <message>
        <source>Port:</source>
        <translation>Porta:</translation>
    </message>
    <message>
        <source>Protocol:</source>
        <translation>Protocollo:</translation>
    </message>
    <message>
        <source>&amp;Direct connection</source>
        <translation>Connessione &amp;diretta</translation>
    </message>
    <message>
        <source>There is nothing to set.</source>
        <translation>Non occorre impostare nulla.</translation>
    </message>
    <message>
        <source>Radio group boxes</source>
        <translation>Riquadri di gruppo con pulsante radio</translation>
    </message>
    <message>
        <source>Widgets</source>
        <translation>Elementi grafici</translation>
    </message>
</context>
<context>
    <name>SettingsPage</name>
    <message>
        <source>Settings file</source>
        <translation>File delle impostazioni</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Impostazioni</translation>
    </message>
    <message>
        <source>F&amp;lat buttons</source>
        <translation>Pulsanti &amp;piatti</translation>
    </message>
    <message>
        <source>S&amp;ection:</source>
        <translation>S&amp;ezione:</translation>
    </message>
    <message>
        <source>&amp;Font:</source>
        <translation>&amp;Carattere:</translation>
    </message>
    <message>
        <source>&amp;Size:</source>
        <translation>&amp;Dimensione:</translation>
    </message>
    <message>
        <source>Contents of the file on disk</source>
        <translation>Contenuto del file sul disco</translation>
    </message>
    <message>
        <source>Name a settings file on the command line to edit it here.</source>
        <translation>Indica un file di impostazioni sulla riga di comando per modificarlo qui.</translation>
    </message>
    <message>
        <source>%1 cannot be opened.</source>
        <translation>Impossibile aprire %1.</translation>
    </message>
</context>
<context>
    <name>ShortcutsPage</name>
    <message>
        <source>Delete the whole line</source>
        <translation>Elimina l&apos;intera riga</translation>
    </message>
    <message>
        <source>Last command: %1</source>
        <translation>Ultimo comando: %1</translation>
    </message>
    <message>
        <source>one line
another line
and a third one
</source>
        <translation>una riga
un&apos;altra riga
e una terza
</translation>
    </message>
    <message>
        <source>Go to the editor</source>
        <translation>Vai all&apos;editor</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Visualizza</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Impostazioni</translation>
    </message>
    <message>
        <source>Configure shortcuts...</source>
        <translation>Configura le scorciatoie...</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Scorciatoie</translation>
    </message>
    <message>
        <source>Configure shortcuts in the plain dialog...</source>
        <translation>Configura le scorciatoie nella finestra semplice...</translation>
    </message>
</context>
<context>
    <name>vel-entryedit</name>
    <message>
        <source>Edits a desktop entry.</source>
        <translation>Modifica una voce desktop.</translation>
    </message>
    <message>
        <source>Make a new entry when there is no such file.</source>
        <translation>Crea una nuova voce se il file non esiste.</translation>
    </message>
    <message>
        <source>Begin with the values of the entry &lt;file&gt;.</source>
        <translation>Inizia con i valori della voce &lt;file&gt;.</translation>
    </message>
    <message>
        <source>Show the entry only.</source>
        <translation>Mostra soltanto la voce.</translation>
    </message>
    <message>
        <source>The entry to edit.</source>
        <translation>La voce da modificare.</translation>
    </message>
    <message>
        <source>one file has to be named</source>
        <translation>occorre indicare un file</translation>
    </message>
    <message>
        <source>cannot open %1</source>
        <translation>impossibile aprire %1</translation>
    </message>
    <message>
        <source>cannot open %1: there is no such file, --create makes a new entry</source>
        <translation>impossibile aprire %1: il file non esiste, --create crea una nuova voce</translation>
    </message>
    <message>
        <source>cannot open %1: it is no regular file</source>
        <translation>impossibile aprire %1: non è un file normale</translation>
    </message>
    <message>
        <source>cannot open %1: %2</source>
        <translation>impossibile aprire %1: %2</translation>
    </message>
</context>
<context>
    <name>vel-gallery</name>
    <message>
        <source>the page %1 did not finish loading</source>
        <translation>la pagina %1 non è diventata pronta</translation>
    </message>
    <message>
        <source>cannot write %1</source>
        <translation>impossibile scrivere %1</translation>
    </message>
    <message>
        <source>cannot make the folder %1</source>
        <translation>impossibile creare la cartella %1</translation>
    </message>
    <message>
        <source>Shows the library&apos;s widgets, dialogs and models in action.</source>
        <translation>Mostra gli elementi grafici, le finestre e i modelli della libreria al lavoro.</translation>
    </message>
    <message>
        <source>Start with the page &lt;name&gt;.</source>
        <translation>Inizia dalla pagina &lt;name&gt;.</translation>
    </message>
    <message>
        <source>Write screenshots of every page, or of the page given with --page, to &lt;dir&gt; and exit.</source>
        <translation>Scrive in &lt;dir&gt; le immagini di tutte le pagine, o di quella indicata con --page, e termina.</translation>
    </message>
    <message>
        <source>The settings file that the settings page edits.</source>
        <translation>Il file di impostazioni modificato dalla pagina delle impostazioni.</translation>
    </message>
    <message>
        <source>Widget gallery</source>
        <translation>Galleria degli elementi grafici</translation>
    </message>
    <message>
        <source>there is no page %1</source>
        <translation>la pagina %1 non esiste</translation>
    </message>
</context>
<context>
    <name>vel-menuedit</name>
    <message>
        <source>cannot create the start menu %1</source>
        <translation>impossibile creare il menu di avvio %1</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>cartella inesistente: %1</translation>
    </message>
    <message>
        <source>not a directory: %1</source>
        <translation>non è una cartella: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>impossibile leggere la cartella %1</translation>
    </message>
    <message>
        <source>Edits the start menu, or picks an entry of it.</source>
        <translation>Modifica il menu di avvio o ne sceglie una voce.</translation>
    </message>
    <message>
        <source>Show the menu directory &lt;dir&gt; instead of the start menu.</source>
        <translation>Mostra la cartella di menu &lt;dir&gt; invece del menu di avvio.</translation>
    </message>
    <message>
        <source>Show the desktop folder.</source>
        <translation>Mostra la cartella del desktop.</translation>
    </message>
    <message>
        <source>Show the tool bar.</source>
        <translation>Mostra la barra degli strumenti.</translation>
    </message>
    <message>
        <source>Look only, change nothing.</source>
        <translation>Guarda soltanto, senza modificare nulla.</translation>
    </message>
    <message>
        <source>Show icons of &lt;pixels&gt; pixels.</source>
        <translation>Mostra icone di &lt;pixels&gt; pixel.</translation>
    </message>
    <message>
        <source>Pick an entry and print its path and its command line.</source>
        <translation>Sceglie una voce e ne stampa il percorso e la riga di comando.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>argomento inatteso: %1</translation>
    </message>
    <message>
        <source>only one of --dir, --desktop and --toolbar can be given</source>
        <translation>si può indicare una sola delle opzioni --dir, --desktop e --toolbar</translation>
    </message>
    <message>
        <source>--icon-size needs a number of pixels from 1 to 512, not &quot;%1&quot;</source>
        <translation>--icon-size richiede un numero di pixel da 1 a 512, non «%1»</translation>
    </message>
</context>
<context>
    <name>vel-menuprint</name>
    <message>
        <source>Prints a menu directory in its order.</source>
        <translation>Stampa una cartella di menu nel suo ordine.</translation>
    </message>
    <message>
        <source>The menu directory; the start menu when none is given.</source>
        <translation>La cartella di menu; il menu di avvio se non ne è indicata nessuna.</translation>
    </message>
    <message>
        <source>unknown format: %1</source>
        <translation>formato sconosciuto: %1</translation>
    </message>
    <message>
        <source>more than one directory</source>
        <translation>più di una cartella</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>cartella inesistente: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>impossibile leggere la cartella %1</translation>
    </message>
    <message>
        <source>The menu has more than %1 items or %2 levels, and the rest of it is left out. Look for links that lead into the same folders again.</source>
        <translation>Il menu ha più di %1 elementi o %2 livelli; il resto è stato omesso. Cercare collegamenti che portano più volte alle stesse cartelle.</translation>
    </message>
    <message>
        <source>What to print: %1. The default is text.</source>
        <translation>Che cosa stampare: %1. Il valore predefinito è text.</translation>
    </message>
    <message>
        <source>The icon theme to take the files of icons from; the user&apos;s own when none is given.</source>
        <translation>Il tema di icone da cui prendere i file delle icone; quello dell&apos;utente se non ne è indicato nessuno.</translation>
    </message>
    <message>
        <source>The edge of the icons in pixels, 24 by default.</source>
        <translation>Il lato delle icone in pixel, 24 se non indicato.</translation>
    </message>
    <message>
        <source>Reads one of the lines that rofi or dmenu was given from standard input and starts its entry.</source>
        <translation>Legge dallo standard input una delle righe date a rofi o dmenu e avvia la sua voce.</translation>
    </message>
    <message>
        <source>the size of icons is not between 1 and %1</source>
        <translation>la dimensione delle icone non è compresa tra 1 e %1</translation>
    </message>
    <message>
        <source>The start menu is empty: no application is installed.</source>
        <translation>Il menu di avvio è vuoto: nessuna applicazione è installata.</translation>
    </message>
    <message>
        <source>The start menu %1 cannot be made: %2</source>
        <translation>Impossibile creare il menu di avvio %1: %2</translation>
    </message>
    <message>
        <source>%1 is left out, as the line end in its name cannot be written in this format. Rename it.</source>
        <translation>%1 è tralasciato, perché la fine di riga nel suo nome non si può scrivere in questo formato. Rinominalo.</translation>
    </message>
    <message>
        <source>The start menu is empty: nothing in %1 is shown.</source>
        <translation>Il menu di avvio è vuoto: nulla in %1 viene mostrato.</translation>
    </message>
    <message>
        <source>cannot run vel-open: %1</source>
        <translation>impossibile eseguire vel-open: %1</translation>
    </message>
    <message>
        <source>There is no &quot;%1&quot; in the menu.</source>
        <translation>Nel menu non c&apos;è «%1».</translation>
    </message>
</context>
<context>
    <name>vel-wmbridge</name>
    <message>
        <source>Owns the window manager&apos;s command channel on a desktop that has none, and runs a command of the shell for each kind of update. The variable VEL_COMMAND holds the line that came.</source>
        <translation>Gestisce il canale dei comandi del gestore delle finestre su un desktop che non ne ha uno ed esegue un comando della shell per ogni tipo di aggiornamento. La variabile VEL_COMMAND contiene la riga ricevuta.</translation>
    </message>
    <message>
        <source>Run when the start menu has changed.</source>
        <translation>Esegui quando il menu di avvio è cambiato.</translation>
    </message>
    <message>
        <source>Run when the tool bar has changed.</source>
        <translation>Esegui quando la barra degli strumenti è cambiata.</translation>
    </message>
    <message>
        <source>Run when the desktop&apos;s entries have changed.</source>
        <translation>Esegui quando le voci del desktop sono cambiate.</translation>
    </message>
    <message>
        <source>Run for every other line.</source>
        <translation>Esegui per ogni altra riga.</translation>
    </message>
    <message>
        <source>Take the channel from the program that has it.</source>
        <translation>Togli il canale al programma che lo tiene.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>argomento inatteso: %1</translation>
    </message>
    <message>
        <source>cannot run the command for %1</source>
        <translation>impossibile eseguire il comando per %1</translation>
    </message>
    <message>
        <source>another program has taken the channel</source>
        <translation>un altro programma ha preso il canale</translation>
    </message>
    <message>
        <source>cannot take the channel: there is no display, or another program has it</source>
        <translation>impossibile prendere il canale: non c&apos;è un display o lo tiene un altro programma</translation>
    </message>
    <message>
        <source>unknown window manager: %1 (known are %2)</source>
        <translation>gestore delle finestre sconosciuto: %1 (quelli noti sono %2)</translation>
    </message>
    <message>
        <source>Do what this window manager needs to show the start menu as it is: %1.</source>
        <translation>Fa ciò che serve a questo gestore delle finestre per mostrare il menu di avvio com&apos;è: %1.</translation>
    </message>
</context>
</TS>

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
    <name>EntryCheck</name>
    <message>
        <source>The condition &apos;%1&apos; needs a file.</source>
        <translation>La condizione «%1» richiede un file.</translation>
    </message>
    <message>
        <source>The file of the condition &apos;%1&apos; is one in the folder of settings, without &apos;/&apos; before it.</source>
        <translation>Il file della condizione «%1» si trova nella cartella delle impostazioni e va scritto senza «/» davanti.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a key.</source>
        <translation>La condizione «%1» richiede una chiave.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs &apos;if-session&apos; or &apos;unless-session&apos; and a session.</source>
        <translation>La condizione «%1» richiede «if-session» o «unless-session» e una sessione.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a schema and a key.</source>
        <translation>La condizione «%1» richiede uno schema e una chiave.</translation>
    </message>
    <message>
        <source>There is no condition &apos;%1&apos;.</source>
        <translation>La condizione «%1» non esiste.</translation>
    </message>
    <message>
        <source>A category is empty.</source>
        <translation>Una categoria è vuota.</translation>
    </message>
    <message>
        <source>There is no registered category &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Non c&apos;è una categoria registrata «%1»; una propria deve iniziare con «X-».</translation>
    </message>
    <message>
        <source>Change it to &apos;%1&apos;</source>
        <translation>Cambia in «%1»</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; also needs: %2.</source>
        <translation>La categoria «%1» richiede anche: %2.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; goes with one of these: %2.</source>
        <translation>La categoria «%1» va insieme a una di queste: %2.</translation>
    </message>
    <message>
        <source>Add &apos;%1&apos;</source>
        <translation>Aggiungi «%1»</translation>
    </message>
    <message>
        <source>Remove it</source>
        <translation>Rimuovi</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is out of use.</source>
        <translation>La categoria «%1» non è più in uso.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is only for entries that list desktops in &apos;Only show in&apos;.</source>
        <translation>La categoria «%1» è solo per le voci che elencano ambienti desktop in «Mostra solo in».</translation>
    </message>
    <message>
        <source>No main category is among them, so menus may not know where to show the entry.</source>
        <translation>Nessuna di queste è una categoria principale: i menu potrebbero non sapere dove mostrare la voce.</translation>
    </message>
    <message>
        <source>Several main categories are among them, so the entry may be shown more than once.</source>
        <translation>Più di una di queste è una categoria principale: la voce potrebbe apparire più volte.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; stands more than once.</source>
        <translation>«%1» compare più di una volta.</translation>
    </message>
    <message>
        <source>Keep the first</source>
        <translation>Tieni il primo</translation>
    </message>
    <message>
        <source>The application has no command.</source>
        <translation>L&apos;applicazione non ha un comando.</translation>
    </message>
    <message>
        <source>The link leads nowhere.</source>
        <translation>Il collegamento non porta da nessuna parte.</translation>
    </message>
    <message>
        <source>A quote is not closed.</source>
        <translation>Le virgolette non sono chiuse.</translation>
    </message>
    <message>
        <source>In quotes, a backslash has to stand before &apos;%1&apos;.</source>
        <translation>Tra virgolette, prima di «%1» deve esserci una barra inversa.</translation>
    </message>
    <message>
        <source>The command ends in a single backslash, which stands for nothing.</source>
        <translation>Il comando termina con una sola barra inversa, che non rappresenta nulla.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to stand in double quotes.</source>
        <translation>«%1» deve stare tra virgolette doppie.</translation>
    </message>
    <message>
        <source>Close the quote</source>
        <translation>Chiudi le virgolette</translation>
    </message>
    <message>
        <source>Put it in quotes</source>
        <translation>Metti tra virgolette</translation>
    </message>
    <message>
        <source>Have a shell run it</source>
        <translation>Fai eseguire da una shell</translation>
    </message>
    <message>
        <source>Write &apos;%&apos; as &apos;%%&apos;</source>
        <translation>Scrivi «%» come «%%»</translation>
    </message>
    <message>
        <source>A field code is not complete: &apos;%&apos; ends the command.</source>
        <translation>Un codice di campo è incompleto: «%» termina il comando.</translation>
    </message>
    <message>
        <source>There is no field code &apos;%%1&apos;.</source>
        <translation>Il codice di campo «%%1» non esiste.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; is out of use; nothing is put in its place.</source>
        <translation>Il codice di campo «%%1» non è più in uso; al suo posto non viene messo nulla.</translation>
    </message>
    <message>
        <source>Only one of &apos;%f&apos;, &apos;%F&apos;, &apos;%u&apos; and &apos;%U&apos; may stand in a command, and once.</source>
        <translation>Un comando può contenere uno solo tra «%f», «%F», «%u» e «%U», e una volta sola.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; stands more than once.</source>
        <translation>Il codice di campo «%%1» compare più di una volta.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; has to be an argument of its own, not in quotes.</source>
        <translation>Il codice di campo «%%1» deve essere un argomento a sé, senza virgolette.</translation>
    </message>
    <message>
        <source>The path of the program has a blank: it has to stand in quotes.</source>
        <translation>Il percorso del programma contiene uno spazio: deve stare tra virgolette.</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;.</source>
        <translation>Il programma «%1» non esiste.</translation>
    </message>
    <message>
        <source>The command has to begin with a program.</source>
        <translation>Il comando deve iniziare con un programma.</translation>
    </message>
    <message>
        <source>&apos;Try exec&apos; takes the program alone, without quotes and arguments.</source>
        <translation>«Comando di verifica» accetta solo il programma, senza virgolette né argomenti.</translation>
    </message>
    <message>
        <source>Keep the program</source>
        <translation>Tieni il programma</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;, so the entry is not shown.</source>
        <translation>Il programma «%1» non esiste, quindi la voce non viene mostrata.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is missing.</source>
        <translation>«%1» manca.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has translations only, and nothing for all other languages.</source>
        <translation>«%1» ha solo traduzioni e nulla per tutte le altre lingue.</translation>
    </message>
    <message>
        <source>Take &apos;%1&apos;</source>
        <translation>Prendi «%1»</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is only for entries of the type &apos;%2&apos;.</source>
        <translation>«%1» è solo per le voci di tipo «%2».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here.</source>
        <translation>«%1» qui non è più in uso.</translation>
    </message>
    <message>
        <source>No key can be called &apos;%1&apos;.</source>
        <translation>Nessuna chiave può chiamarsi «%1».</translation>
    </message>
    <message>
        <source>There is no key &apos;%1&apos; here; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>La chiave «%1» qui non esiste; una propria deve iniziare con «X-».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; cannot be translated.</source>
        <translation>«%1» non può essere tradotto.</translation>
    </message>
    <message>
        <source>&apos;Only show in&apos; and &apos;Not show in&apos; exclude each other.</source>
        <translation>«Mostra solo in» e «Non mostrare in» si escludono a vicenda.</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>Il file è vuoto.</translation>
    </message>
    <message>
        <source>The first group of the file is not &apos;[Desktop Entry]&apos;.</source>
        <translation>Il primo gruppo del file non è «[Desktop Entry]».</translation>
    </message>
    <message>
        <source>The name of the file has to end in &apos;.%1&apos;.</source>
        <translation>Il nome del file deve terminare con «.%1».</translation>
    </message>
    <message>
        <source>Lines of the file end in a carriage return.</source>
        <translation>Alcune righe del file terminano con un ritorno a capo (CR).</translation>
    </message>
    <message>
        <source>A line of the file says nothing: %1</source>
        <translation>Una riga del file non dice nulla: %1</translation>
    </message>
    <message>
        <source>A line of the file stands before all groups: %1</source>
        <translation>Una riga del file sta prima di tutti i gruppi: %1</translation>
    </message>
    <message>
        <source>A line of the file begins with a blank: %1</source>
        <translation>Una riga del file inizia con uno spazio: %1</translation>
    </message>
    <message>
        <source>A blank stands behind a group: %1</source>
        <translation>C&apos;è uno spazio dopo un gruppo: %1</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; stands more than once.</source>
        <translation>Il gruppo «%1» compare più di una volta.</translation>
    </message>
    <message>
        <source>No group can be called &apos;%1&apos;.</source>
        <translation>Nessun gruppo può chiamarsi «%1».</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; is out of use.</source>
        <translation>Il gruppo «%1» non è più in uso.</translation>
    </message>
    <message>
        <source>There is no group &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Il gruppo «%1» non esiste; uno proprio deve iniziare con «X-».</translation>
    </message>
    <message>
        <source>The id &apos;%1&apos; of an action may only have letters A to Z, digits and &apos;-&apos;.</source>
        <translation>L&apos;identificativo «%1» di un&apos;azione può contenere solo lettere dalla A alla Z, cifre e «-».</translation>
    </message>
    <message>
        <source>The action &apos;%1&apos; is described, but &apos;Actions&apos; does not name it.</source>
        <translation>L&apos;azione «%1» è descritta, ma «Actions» non la nomina.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has no &apos;/&apos;.</source>
        <translation>«%1» non è un tipo MIME: manca «/».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: nothing stands behind the &apos;/&apos;.</source>
        <translation>«%1» non è un tipo MIME: dopo «/» non c&apos;è nulla.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: there is no kind &apos;%2&apos;.</source>
        <translation>«%1» non è un tipo MIME: la categoria «%2» non esiste.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has a character that none has.</source>
        <translation>«%1» non è un tipo MIME: contiene un carattere non ammesso.</translation>
    </message>
    <message>
        <source>MIME types like &apos;%1&apos; are not used for files.</source>
        <translation>I tipi MIME come «%1» non si usano per i file.</translation>
    </message>
    <message>
        <source>This computer does not know the MIME type &apos;%1&apos;.</source>
        <translation>Questo computer non conosce il tipo MIME «%1».</translation>
    </message>
    <message>
        <source>An action has no id.</source>
        <translation>Un&apos;azione non ha un identificativo.</translation>
    </message>
    <message>
        <source>Nothing says what the action &apos;%1&apos; is.</source>
        <translation>Nulla dice che cosa sia l&apos;azione «%1».</translation>
    </message>
    <message>
        <source>There is no registered desktop &apos;%1&apos;; others have to begin with &apos;X-&apos;.</source>
        <translation>Non c&apos;è un ambiente desktop registrato «%1»; gli altri devono iniziare con «X-».</translation>
    </message>
    <message>
        <source>In your language the entry is shown as &apos;%1&apos;.</source>
        <translation>Nella tua lingua la voce viene mostrata come «%1».</translation>
    </message>
    <message>
        <source>The comment says no more than the name.</source>
        <translation>Il commento non dice nulla più del nome.</translation>
    </message>
    <message>
        <source>The comment says no more than the generic name.</source>
        <translation>Il commento non dice nulla più del nome generico.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here; it has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>«%1» qui non è più in uso; deve essere «true» o «false».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>«%1» deve essere «true» o «false».</translation>
    </message>
    <message>
        <source>Change it to &apos;true&apos;</source>
        <translation>Cambia in «true»</translation>
    </message>
    <message>
        <source>The name of an icon has no suffix like &apos;%1&apos;.</source>
        <translation>Il nome di un&apos;icona non ha un&apos;estensione come «%1».</translation>
    </message>
    <message>
        <source>Remove the suffix</source>
        <translation>Rimuovi l&apos;estensione</translation>
    </message>
    <message>
        <source>No icon theme has an icon &apos;%1&apos;.</source>
        <translation>Nessun tema di icone ha un&apos;icona «%1».</translation>
    </message>
    <message>
        <source>Write the folder in full</source>
        <translation>Scrivi la cartella per intero</translation>
    </message>
    <message>
        <source>The address does not say how to reach it, as &apos;https:&apos; and &apos;file:&apos; do.</source>
        <translation>L&apos;indirizzo non dice come raggiungerlo, come fanno «https:» e «file:».</translation>
    </message>
    <message>
        <source>The text is not encoded in UTF-8.</source>
        <translation>Il testo non è codificato in UTF-8.</translation>
    </message>
    <message>
        <source>A control character or tab may not stand here.</source>
        <translation>Qui non può esserci un carattere di controllo o una tabulazione.</translation>
    </message>
    <message>
        <source>The type has to be &apos;Application&apos;, &apos;Link&apos; or &apos;Directory&apos;, not &apos;%1&apos;.</source>
        <translation>Il tipo deve essere «Application», «Link» o «Directory», non «%1».</translation>
    </message>
    <message>
        <source>There is no version &apos;%1&apos; of the standard.</source>
        <translation>La versione «%1» dello standard non esiste.</translation>
    </message>
    <message>
        <source>There is no encoding &apos;%1&apos;.</source>
        <translation>La codifica «%1» non esiste.</translation>
    </message>
    <message>
        <source>There is no picture &apos;%1&apos;.</source>
        <translation>L&apos;immagine «%1» non esiste.</translation>
    </message>
    <message>
        <source>An icon has a name or a path that begins with &apos;/&apos;.</source>
        <translation>Un&apos;icona ha un nome, o un percorso che inizia con «/».</translation>
    </message>
    <message>
        <source>The path of a folder begins with &apos;/&apos;.</source>
        <translation>Il percorso di una cartella inizia con «/».</translation>
    </message>
    <message>
        <source>There is no folder &apos;%1&apos;.</source>
        <translation>La cartella «%1» non esiste.</translation>
    </message>
    <message>
        <source>There is no file &apos;%1&apos;.</source>
        <translation>Il file «%1» non esiste.</translation>
    </message>
    <message>
        <source>D-Bus cannot start &apos;%1&apos;: a file of a name like &apos;org.example.Program.desktop&apos; is needed.</source>
        <translation>D-Bus non può avviare «%1»: serve un file con un nome come «org.example.Program.desktop».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no name of an interface; such names are like &apos;org.example.Viewer&apos;.</source>
        <translation>«%1» non è il nome di un&apos;interfaccia; nomi del genere sono come «org.example.Viewer».</translation>
    </message>
</context>
<context>
    <name>EntryTrial</name>
    <message>
        <source>The entry could not be written to a temporary file.</source>
        <translation>Impossibile scrivere la voce in un file temporaneo.</translation>
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
    <name>KeyDescription</name>
    <message>
        <source>Whether the entry starts a program, opens an address or describes a folder of the menu.</source>
        <translation>Se la voce avvia un programma, apre un indirizzo o descrive una cartella del menu.</translation>
    </message>
    <message>
        <source>The name that menus show.</source>
        <translation>Il nome mostrato dai menu.</translation>
    </message>
    <message>
        <source>The icon that menus show: a name from the icon theme, or the full path of a picture.</source>
        <translation>L&apos;icona mostrata dai menu: un nome del tema di icone o il percorso completo di un&apos;immagine.</translation>
    </message>
    <message>
        <source>The command that starts the program, with codes such as %f for the files that it opens.</source>
        <translation>Il comando che avvia il programma, con codici come %f per i file che apre.</translation>
    </message>
    <message>
        <source>Whether the program needs a terminal window.</source>
        <translation>Se il programma ha bisogno di una finestra di terminale.</translation>
    </message>
    <message>
        <source>The folder in which the program starts.</source>
        <translation>La cartella in cui il programma viene avviato.</translation>
    </message>
    <message>
        <source>A program that has to be installed; without it menus leave the entry out.</source>
        <translation>Un programma che deve essere installato; senza di esso i menu tralasciano la voce.</translation>
    </message>
    <message>
        <source>The address that the entry opens.</source>
        <translation>L&apos;indirizzo aperto dalla voce.</translation>
    </message>
    <message>
        <source>What kind of program it is, such as: Web browser.</source>
        <translation>Di che genere di programma si tratta, per esempio: Browser web.</translation>
    </message>
    <message>
        <source>A sentence about the program, which menus show as a tip.</source>
        <translation>Una frase sul programma, che i menu mostrano come suggerimento.</translation>
    </message>
    <message>
        <source>Whether menus leave the entry out although the program can be used.</source>
        <translation>Se i menu tralasciano la voce anche se il programma si può usare.</translation>
    </message>
    <message>
        <source>Whether the entry counts as deleted.</source>
        <translation>Se la voce è considerata eliminata.</translation>
    </message>
    <message>
        <source>The desktop environments that alone show the entry; none means all.</source>
        <translation>I soli ambienti desktop che mostrano la voce; se non ce n&apos;è nessuno, la mostrano tutti.</translation>
    </message>
    <message>
        <source>The desktop environments that do not show the entry.</source>
        <translation>Gli ambienti desktop che non mostrano la voce.</translation>
    </message>
    <message>
        <source>The types of files that the program opens.</source>
        <translation>I tipi di file aperti dal programma.</translation>
    </message>
    <message>
        <source>The groups of the menu that the program belongs to.</source>
        <translation>I gruppi del menu a cui appartiene il programma.</translation>
    </message>
    <message>
        <source>Words by which a search finds the program beside its name.</source>
        <translation>Parole con cui una ricerca trova il programma, oltre al suo nome.</translation>
    </message>
    <message>
        <source>Whether the program tells when it has started, so that the pointer shows it until then.</source>
        <translation>Se il programma segnala di essersi avviato, così che il puntatore lo indichi fino ad allora.</translation>
    </message>
    <message>
        <source>The class of the window by which the desktop knows that the program has started.</source>
        <translation>La classe della finestra da cui il desktop riconosce che il programma è stato avviato.</translation>
    </message>
    <message>
        <source>Further things that the program can be started for, such as: New window.</source>
        <translation>Altre cose per cui si può avviare il programma, per esempio: Nuova finestra.</translation>
    </message>
    <message>
        <source>The version of the standard for entries that this one follows.</source>
        <translation>La versione dello standard delle voci seguita da questa.</translation>
    </message>
    <message>
        <source>%1 Only for users of one language.</source>
        <comment>%1 is a sentence about a key</comment>
        <translation>%1 Solo per gli utenti di una lingua.</translation>
    </message>
</context>
<context>
    <name>LanguageNote</name>
    <message>
        <source>Users of %1 see these texts.</source>
        <translation>In %1 si vedono questi testi.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those of %2 where one is missing.</source>
        <translation>In %1 si vedono questi testi e, dove ne manca uno, quello in %2.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those without a language where one is missing.</source>
        <translation>In %1 si vedono questi testi e, dove ne manca uno, quello senza lingua.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts of %2.</source>
        <translation>In %1 si vedono i testi in %2.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts without a language.</source>
        <translation>In %1 si vedono i testi senza lingua.</translation>
    </message>
    <message>
        <source>%1 Texts of their own have: %2.</source>
        <comment>%1 is a sentence, %2 a list of languages</comment>
        <translation>%1 Hanno testi propri: %2.</translation>
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
    <message numerus="yes">
        <source>The deletion was canceled. %n items are still there, in whole or in part.</source>
        <translation>
            <numerusform>L&apos;eliminazione è stata interrotta. %n elemento c&apos;è ancora, in tutto o in parte.</numerusform>
            <numerusform>L&apos;eliminazione è stata interrotta. %n elementi ci sono ancora, in tutto o in parte.</numerusform>
        </translation>
    </message>
    <message>
        <source>The deletion was canceled. Still there, in whole or in part: %1.</source>
        <translation>L&apos;eliminazione è stata interrotta. Ci sono ancora, in tutto o in parte: %1.</translation>
    </message>
</context>
<context>
    <name>MenuDrop</name>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;. Keep both gives the new one another file name, Replace puts the old one into the trash, Skip leaves the new one where it is; Cancel leaves everything as it is.</source>
        <translation>La cartella «%1» contiene già «%2». Mantieni entrambi dà al nuovo un altro nome di file, Sostituisci mette il vecchio nel cestino, Tralascia lascia il nuovo dov&apos;è; Annulla lascia tutto com&apos;è.</translation>
    </message>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;, which the new one comes from. Keep both gives the new one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>La cartella «%1» contiene già «%2», da cui proviene il nuovo. Mantieni entrambi dà al nuovo un altro nome di file, Tralascia lo lascia dov&apos;è; Annulla lascia tutto com&apos;è.</translation>
    </message>
    <message>
        <source>Another one that comes to the folder &apos;%1&apos; has the same file name as &apos;%2&apos;. Keep both gives this one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>Un altro elemento destinato alla cartella «%1» ha lo stesso nome di file di «%2». Mantieni entrambi dà a questo un altro nome di file, Tralascia lo lascia dov&apos;è; Annulla lascia tutto com&apos;è.</translation>
    </message>
    <message>
        <source>Name already taken</source>
        <translation>Nome già in uso</translation>
    </message>
    <message>
        <source>&amp;Keep both</source>
        <translation>&amp;Mantieni entrambi</translation>
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
        <translation>&amp;Fai lo stesso con tutti gli altri</translation>
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
    <message numerus="yes">
        <source>Undo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Annulla l&apos;eliminazione di %1 elementi (%n voce)</numerusform>
            <numerusform>Annulla l&apos;eliminazione di %1 elementi (%n voci)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Rifai l&apos;eliminazione di %1 elementi (%n voce)</numerusform>
            <numerusform>Rifai l&apos;eliminazione di %1 elementi (%n voci)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 items were deleted (%n entries).</source>
        <translation>
            <numerusform>%1 elementi sono stati eliminati (%n voce).</numerusform>
            <numerusform>%1 elementi sono stati eliminati (%n voci).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo reordering of %n items</source>
        <translation>
            <numerusform>Annulla il riordino di %n elemento</numerusform>
            <numerusform>Annulla il riordino di %n elementi</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo reordering of %n items</source>
        <translation>
            <numerusform>Rifai il riordino di %n elemento</numerusform>
            <numerusform>Rifai il riordino di %n elementi</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items have other places.</source>
        <translation>
            <numerusform>%n elemento ha un altro posto.</numerusform>
            <numerusform>%n elementi hanno un altro posto.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo hiding of %n items</source>
        <translation>
            <numerusform>Annulla l&apos;occultamento di %n elemento</numerusform>
            <numerusform>Annulla l&apos;occultamento di %n elementi</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo hiding of %n items</source>
        <translation>
            <numerusform>Rifai l&apos;occultamento di %n elemento</numerusform>
            <numerusform>Rifai l&apos;occultamento di %n elementi</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items are hidden: the menu no longer shows them.</source>
        <translation>
            <numerusform>%n elemento è nascosto: il menu non lo mostra più.</numerusform>
            <numerusform>%n elementi sono nascosti: il menu non li mostra più.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo showing %n items again</source>
        <translation>
            <numerusform>Annulla la nuova visualizzazione di %n elemento</numerusform>
            <numerusform>Annulla la nuova visualizzazione di %n elementi</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo showing %n items again</source>
        <translation>
            <numerusform>Rifai la nuova visualizzazione di %n elemento</numerusform>
            <numerusform>Rifai la nuova visualizzazione di %n elementi</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The menu shows %n items again.</source>
        <translation>
            <numerusform>Il menu mostra di nuovo %n elemento.</numerusform>
            <numerusform>Il menu mostra di nuovo %n elementi.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo sorting of folder %1</source>
        <translation>Annulla l&apos;ordinamento della cartella %1</translation>
    </message>
    <message>
        <source>Redo sorting of folder %1</source>
        <translation>Rifai l&apos;ordinamento della cartella %1</translation>
    </message>
    <message>
        <source>The folder %1 was sorted by name.</source>
        <translation>La cartella %1 è stata ordinata in base al nome.</translation>
    </message>
    <message>
        <source>Undo duplication of %1</source>
        <translation>Annulla la duplicazione di %1</translation>
    </message>
    <message>
        <source>Redo duplication of %1</source>
        <translation>Rifai la duplicazione di %1</translation>
    </message>
    <message>
        <source>%1 was duplicated. The copy is selected.</source>
        <translation>%1 è stato duplicato. La copia è selezionata.</translation>
    </message>
    <message numerus="yes">
        <source>Undo duplication of %n items</source>
        <translation>
            <numerusform>Annulla la duplicazione di %n elemento</numerusform>
            <numerusform>Annulla la duplicazione di %n elementi</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo duplication of %n items</source>
        <translation>
            <numerusform>Rifai la duplicazione di %n elemento</numerusform>
            <numerusform>Rifai la duplicazione di %n elementi</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were duplicated. The copies are selected.</source>
        <translation>
            <numerusform>%n elemento è stato duplicato. La copia è selezionata.</numerusform>
            <numerusform>%n elementi sono stati duplicati. Le copie sono selezionate.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo deletion of %1 items (1 entry)</source>
        <translation>Annulla l&apos;eliminazione di %1 elementi (1 voce)</translation>
    </message>
    <message>
        <source>Redo deletion of %1 items (1 entry)</source>
        <translation>Rifai l&apos;eliminazione di %1 elementi (1 voce)</translation>
    </message>
    <message>
        <source>%1 items were deleted (1 entry).</source>
        <translation>%1 elementi sono stati eliminati (1 voce).</translation>
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
    <message>
        <source>Can&apos;t link %1: %2</source>
        <translation>Impossibile creare un collegamento a %1: %2</translation>
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
    <message>
        <source>The file %1 is not a desktop entry: it has no group [Desktop Entry].</source>
        <translation>Il file %1 non è una voce desktop: non ha un gruppo [Desktop Entry].</translation>
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
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Questo menu è vuoto. Premi %1 per una nuova voce, o fai clic qui con il tasto destro per vedere che altro si può aggiungere.</translation>
    </message>
    <message>
        <source>the program %1 ended with an error</source>
        <translation>il programma %1 è terminato con un errore</translation>
    </message>
    <message>
        <source>the program %1 cannot be run</source>
        <translation>impossibile eseguire il programma %1</translation>
    </message>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>E %n altro.</numerusform>
            <numerusform>E altri %n.</numerusform>
        </translation>
    </message>
    <message>
        <source>Open containin&amp;g folder</source>
        <translation>Apri la cartella c&amp;he lo contiene</translation>
    </message>
    <message>
        <source>The folder %1 was not opened: %2.</source>
        <translation>La cartella %1 non è stata aperta: %2.</translation>
    </message>
    <message>
        <source>New &amp;folder</source>
        <translation>&amp;Nuova cartella</translation>
    </message>
    <message>
        <source>New entr&amp;y</source>
        <translation>Nuova &amp;voce</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Modifica</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Elimina</translation>
    </message>
    <message>
        <source>E&amp;xecute</source>
        <translation>Eseg&amp;ui</translation>
    </message>
    <message>
        <source>F&amp;ind</source>
        <translation>&amp;Trova</translation>
    </message>
    <message>
        <source>Find &amp;Next</source>
        <translation>Trov&amp;a successivo</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Tag&amp;lia</translation>
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
        <source>Default &amp;menu...</source>
        <translation>Menu prede&amp;finito...</translation>
    </message>
    <message>
        <source>&amp;Up</source>
        <translation>&amp;Su</translation>
    </message>
    <message>
        <source>D&amp;own</source>
        <translation>&amp;Giù</translation>
    </message>
    <message>
        <source>Dup&amp;licate</source>
        <translation>Du&amp;plica</translation>
    </message>
    <message>
        <source>&amp;Hide</source>
        <translation>Nascon&amp;di</translation>
    </message>
    <message>
        <source>Sho&amp;w again</source>
        <translation>M&amp;ostra di nuovo</translation>
    </message>
    <message>
        <source>&amp;Reload</source>
        <translation>&amp;Ricarica</translation>
    </message>
    <message>
        <source>&amp;Sort by name</source>
        <translation>Ordina in &amp;base al nome</translation>
    </message>
    <message>
        <source>The folder %1 is sorted by name already.</source>
        <translation>La cartella %1 è già ordinata in base al nome.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1, because no application is installed. The menu was left as it is.</source>
        <translation>Impossibile creare il menu predefinito in %1, perché nessuna applicazione è installata. Il menu è rimasto com&apos;era.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1: %2. The menu was left as it is.</source>
        <translation>Impossibile creare il menu predefinito in %1: %2. Il menu è rimasto com&apos;era.</translation>
    </message>
    <message>
        <source>%1 is no file on this computer. Nothing was moved or copied.</source>
        <translation>%1 non è un file di questo computer. Non è stato spostato né copiato nulla.</translation>
    </message>
    <message>
        <source>%1 was not started: %2.</source>
        <translation>%1 non è stato avviato: %2.</translation>
    </message>
    <message>
        <source>This menu is empty. Right-click here and choose &apos;%2&apos; to fill it with the applications that are installed, or press %1 for a new entry.</source>
        <translation>Questo menu è vuoto. Fai clic qui con il tasto destro e scegli «%2» per riempirlo con le applicazioni installate, o premi %1 per una nuova voce.</translation>
    </message>
    <message>
        <source>This menu is empty, because no application was found that is installed. Once there is one, right-click here and choose &apos;%2&apos;. Until then, press %1 for an entry of your own.</source>
        <translation>Questo menu è vuoto, perché non è stata trovata nessuna applicazione installata. Quando ce ne sarà una, fai clic qui con il tasto destro e scegli «%2». Fino ad allora, premi %1 per una voce tua.</translation>
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
    <name>VelUI::CategoryChooser</name>
    <message>
        <source>Main category</source>
        <translation>Categoria principale</translation>
    </message>
    <message>
        <source>Goes with %1</source>
        <translation>Va insieme a %1</translation>
    </message>
    <message>
        <source>Only beside &quot;Only show in&quot;</source>
        <translation>Solo insieme a «Mostra solo in»</translation>
    </message>
    <message>
        <source>Deprecated</source>
        <translation>Obsoleta</translation>
    </message>
    <message>
        <source>Extension</source>
        <comment>a category of somebody&apos;s own, X-...</comment>
        <translation>Estensione</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Non registrata</translation>
    </message>
    <message>
        <source>Choose categories</source>
        <translation>Scegli le categorie</translation>
    </message>
    <message>
        <source>Name</source>
        <comment>title of a column</comment>
        <translation>Nome</translation>
    </message>
    <message>
        <source>Category</source>
        <comment>title of a column</comment>
        <translation>Categoria</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Nota</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryNames</name>
    <message>
        <source>Audio and video</source>
        <translation>Audio e video</translation>
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
        <translation>Sviluppo software</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>Istruzione</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>Giochi</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>Grafica</translation>
    </message>
    <message>
        <source>Internet and network</source>
        <translation>Internet e rete</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>Ufficio</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>Scienza</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Impostazioni</translation>
    </message>
    <message>
        <source>System tools</source>
        <translation>Strumenti di sistema</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Accessori</translation>
    </message>
    <message>
        <source>Build tools</source>
        <translation>Strumenti di compilazione</translation>
    </message>
    <message>
        <source>Debuggers</source>
        <translation>Debugger</translation>
    </message>
    <message>
        <source>Development environments</source>
        <translation>Ambienti di sviluppo</translation>
    </message>
    <message>
        <source>Designers of user interfaces</source>
        <translation>Progettazione di interfacce utente</translation>
    </message>
    <message>
        <source>Profilers</source>
        <translation>Profiler</translation>
    </message>
    <message>
        <source>Revision control</source>
        <translation>Controllo di versione</translation>
    </message>
    <message>
        <source>Translation tools</source>
        <translation>Strumenti di traduzione</translation>
    </message>
    <message>
        <source>Calendars</source>
        <translation>Calendari</translation>
    </message>
    <message>
        <source>Address books</source>
        <translation>Rubriche</translation>
    </message>
    <message>
        <source>Databases</source>
        <translation>Database</translation>
    </message>
    <message>
        <source>Dictionaries</source>
        <translation>Dizionari</translation>
    </message>
    <message>
        <source>Charts</source>
        <translation>Grafici</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>Posta elettronica</translation>
    </message>
    <message>
        <source>Finances</source>
        <translation>Finanza</translation>
    </message>
    <message>
        <source>Flow charts</source>
        <translation>Diagrammi di flusso</translation>
    </message>
    <message>
        <source>Handheld devices</source>
        <translation>Dispositivi palmari</translation>
    </message>
    <message>
        <source>Project management</source>
        <translation>Gestione di progetti</translation>
    </message>
    <message>
        <source>Presentations</source>
        <translation>Presentazioni</translation>
    </message>
    <message>
        <source>Spreadsheets</source>
        <translation>Fogli di calcolo</translation>
    </message>
    <message>
        <source>Word processors</source>
        <translation>Elaborazione di testi</translation>
    </message>
    <message>
        <source>Two-dimensional graphics</source>
        <translation>Grafica bidimensionale</translation>
    </message>
    <message>
        <source>Vector graphics</source>
        <translation>Grafica vettoriale</translation>
    </message>
    <message>
        <source>Raster graphics</source>
        <translation>Grafica raster</translation>
    </message>
    <message>
        <source>Three-dimensional graphics</source>
        <translation>Grafica tridimensionale</translation>
    </message>
    <message>
        <source>Scanning</source>
        <translation>Scansione</translation>
    </message>
    <message>
        <source>Text recognition</source>
        <translation>Riconoscimento del testo</translation>
    </message>
    <message>
        <source>Photography</source>
        <translation>Fotografia</translation>
    </message>
    <message>
        <source>Desktop publishing</source>
        <translation>Impaginazione</translation>
    </message>
    <message>
        <source>Viewers</source>
        <translation>Visualizzatori</translation>
    </message>
    <message>
        <source>Text tools</source>
        <translation>Strumenti per il testo</translation>
    </message>
    <message>
        <source>Desktop settings</source>
        <translation>Impostazioni del desktop</translation>
    </message>
    <message>
        <source>Hardware settings</source>
        <translation>Impostazioni dell&apos;hardware</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>Stampa</translation>
    </message>
    <message>
        <source>Package managers</source>
        <translation>Gestori di pacchetti</translation>
    </message>
    <message>
        <source>Dial-up connections</source>
        <translation>Connessioni via modem</translation>
    </message>
    <message>
        <source>Instant messaging</source>
        <translation>Messaggistica istantanea</translation>
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
        <translation>Notiziari</translation>
    </message>
    <message>
        <source>File transfer</source>
        <translation>Trasferimento di file</translation>
    </message>
    <message>
        <source>Amateur radio</source>
        <translation>Radioamatori</translation>
    </message>
    <message>
        <source>Newsgroups</source>
        <translation>Newsgroup</translation>
    </message>
    <message>
        <source>File sharing</source>
        <translation>Condivisione di file</translation>
    </message>
    <message>
        <source>Remote access</source>
        <translation>Accesso remoto</translation>
    </message>
    <message>
        <source>Telephony</source>
        <translation>Telefonia</translation>
    </message>
    <message>
        <source>Telephony tools</source>
        <translation>Strumenti di telefonia</translation>
    </message>
    <message>
        <source>Video conferences</source>
        <translation>Videoconferenze</translation>
    </message>
    <message>
        <source>Web browsers</source>
        <translation>Browser web</translation>
    </message>
    <message>
        <source>Web development</source>
        <translation>Sviluppo web</translation>
    </message>
    <message>
        <source>MIDI</source>
        <translation>MIDI</translation>
    </message>
    <message>
        <source>Mixers</source>
        <translation>Mixer</translation>
    </message>
    <message>
        <source>Sequencers</source>
        <translation>Sequencer</translation>
    </message>
    <message>
        <source>Tuners</source>
        <translation>Accordatori</translation>
    </message>
    <message>
        <source>Television</source>
        <translation>Televisione</translation>
    </message>
    <message>
        <source>Audio and video editing</source>
        <translation>Montaggio audio e video</translation>
    </message>
    <message>
        <source>Players</source>
        <translation>Riproduttori</translation>
    </message>
    <message>
        <source>Recorders</source>
        <translation>Registratori</translation>
    </message>
    <message>
        <source>Disc burning</source>
        <translation>Masterizzazione</translation>
    </message>
    <message>
        <source>Action games</source>
        <translation>Giochi d&apos;azione</translation>
    </message>
    <message>
        <source>Adventure games</source>
        <translation>Giochi d&apos;avventura</translation>
    </message>
    <message>
        <source>Arcade games</source>
        <translation>Giochi arcade</translation>
    </message>
    <message>
        <source>Board games</source>
        <translation>Giochi da tavolo</translation>
    </message>
    <message>
        <source>Falling blocks games</source>
        <translation>Giochi di blocchi</translation>
    </message>
    <message>
        <source>Card games</source>
        <translation>Giochi di carte</translation>
    </message>
    <message>
        <source>Games for children</source>
        <translation>Giochi per bambini</translation>
    </message>
    <message>
        <source>Logic games</source>
        <translation>Giochi di logica</translation>
    </message>
    <message>
        <source>Role-playing games</source>
        <translation>Giochi di ruolo</translation>
    </message>
    <message>
        <source>Shooters</source>
        <translation>Sparatutto</translation>
    </message>
    <message>
        <source>Simulations</source>
        <translation>Simulazioni</translation>
    </message>
    <message>
        <source>Sports games</source>
        <translation>Giochi sportivi</translation>
    </message>
    <message>
        <source>Strategy games</source>
        <translation>Giochi di strategia</translation>
    </message>
    <message>
        <source>Art</source>
        <translation>Arte</translation>
    </message>
    <message>
        <source>Construction</source>
        <translation>Edilizia</translation>
    </message>
    <message>
        <source>Music</source>
        <translation>Musica</translation>
    </message>
    <message>
        <source>Languages</source>
        <translation>Lingue</translation>
    </message>
    <message>
        <source>Artificial intelligence</source>
        <translation>Intelligenza artificiale</translation>
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
        <translation>Chimica</translation>
    </message>
    <message>
        <source>Computer science</source>
        <translation>Informatica</translation>
    </message>
    <message>
        <source>Data visualization</source>
        <translation>Visualizzazione di dati</translation>
    </message>
    <message>
        <source>Economics</source>
        <translation>Economia</translation>
    </message>
    <message>
        <source>Electricity</source>
        <translation>Elettricità</translation>
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
        <translation>Scienze della Terra</translation>
    </message>
    <message>
        <source>History</source>
        <translation>Storia</translation>
    </message>
    <message>
        <source>Humanities</source>
        <translation>Scienze umane</translation>
    </message>
    <message>
        <source>Image processing</source>
        <translation>Elaborazione di immagini</translation>
    </message>
    <message>
        <source>Literature</source>
        <translation>Letteratura</translation>
    </message>
    <message>
        <source>Maps</source>
        <translation>Mappe</translation>
    </message>
    <message>
        <source>Mathematics</source>
        <translation>Matematica</translation>
    </message>
    <message>
        <source>Numerical analysis</source>
        <translation>Analisi numerica</translation>
    </message>
    <message>
        <source>Medicine</source>
        <translation>Medicina</translation>
    </message>
    <message>
        <source>Physics</source>
        <translation>Fisica</translation>
    </message>
    <message>
        <source>Robotics</source>
        <translation>Robotica</translation>
    </message>
    <message>
        <source>Spirituality</source>
        <translation>Spiritualità</translation>
    </message>
    <message>
        <source>Sports</source>
        <translation>Sport</translation>
    </message>
    <message>
        <source>Parallel computing</source>
        <translation>Calcolo parallelo</translation>
    </message>
    <message>
        <source>Amusement</source>
        <translation>Passatempi</translation>
    </message>
    <message>
        <source>Archiving</source>
        <translation>Archiviazione</translation>
    </message>
    <message>
        <source>Compression</source>
        <translation>Compressione</translation>
    </message>
    <message>
        <source>Electronics</source>
        <translation>Elettronica</translation>
    </message>
    <message>
        <source>Emulators</source>
        <translation>Emulatori</translation>
    </message>
    <message>
        <source>Engineering</source>
        <translation>Ingegneria</translation>
    </message>
    <message>
        <source>File tools</source>
        <translation>Strumenti per i file</translation>
    </message>
    <message>
        <source>File managers</source>
        <translation>Gestori di file</translation>
    </message>
    <message>
        <source>Terminals</source>
        <translation>Terminali</translation>
    </message>
    <message>
        <source>File systems</source>
        <translation>File system</translation>
    </message>
    <message>
        <source>Monitors</source>
        <translation>Monitor di sistema</translation>
    </message>
    <message>
        <source>Security</source>
        <translation>Sicurezza</translation>
    </message>
    <message>
        <source>Accessibility</source>
        <translation>Accessibilità</translation>
    </message>
    <message>
        <source>Calculators</source>
        <translation>Calcolatrici</translation>
    </message>
    <message>
        <source>Clocks</source>
        <translation>Orologi</translation>
    </message>
    <message>
        <source>Text editors</source>
        <translation>Editor di testo</translation>
    </message>
    <message>
        <source>Documentation</source>
        <translation>Documentazione</translation>
    </message>
    <message>
        <source>For adults</source>
        <translation>Per adulti</translation>
    </message>
    <message>
        <source>Core of the desktop</source>
        <translation>Nucleo del desktop</translation>
    </message>
    <message>
        <source>Made with KDE</source>
        <translation>Create con KDE</translation>
    </message>
    <message>
        <source>Made with GNOME</source>
        <translation>Create con GNOME</translation>
    </message>
    <message>
        <source>Made with Xfce</source>
        <translation>Create con Xfce</translation>
    </message>
    <message>
        <source>Made with GTK</source>
        <translation>Create con GTK</translation>
    </message>
    <message>
        <source>Made with Qt</source>
        <translation>Create con Qt</translation>
    </message>
    <message>
        <source>Made with Motif</source>
        <translation>Create con Motif</translation>
    </message>
    <message>
        <source>Made with Java</source>
        <translation>Create con Java</translation>
    </message>
    <message>
        <source>For the console</source>
        <translation>Per la console</translation>
    </message>
    <message>
        <source>Screen savers</source>
        <translation>Salvaschermi</translation>
    </message>
    <message>
        <source>Icons of the system tray</source>
        <translation>Icone del vassoio di sistema</translation>
    </message>
    <message>
        <source>Applets of a panel</source>
        <translation>Applet di un pannello</translation>
    </message>
    <message>
        <source>Desktop shells</source>
        <translation>Shell del desktop</translation>
    </message>
    <message>
        <source>Applications</source>
        <translation>Applicazioni</translation>
    </message>
</context>
<context>
    <name>VelUI::ChoiceDialog</name>
    <message>
        <source>Filter</source>
        <translation>Filtro</translation>
    </message>
    <message>
        <source>Type to filter</source>
        <translation>Scrivi per filtrare</translation>
    </message>
    <message>
        <source>Reading...</source>
        <translation>Lettura...</translation>
    </message>
    <message>
        <source>No match</source>
        <translation>Nessuna corrispondenza</translation>
    </message>
    <message numerus="yes">
        <source>%n chosen</source>
        <translation>
            <numerusform>%n scelto</numerusform>
            <numerusform>%n scelti</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::DesktopChooser</name>
    <message>
        <source>Desktop environment</source>
        <translation>Ambiente desktop</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Nota</translation>
    </message>
    <message>
        <source>This session</source>
        <translation>Questa sessione</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Non registrato</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsDialog</name>
    <message>
        <source>An action has no id. It can have &quot;%1&quot;.</source>
        <translation>Un&apos;azione non ha un identificativo. Può avere «%1».</translation>
    </message>
    <message>
        <source>Two actions have the id &quot;%1&quot;. The second one can have &quot;%2&quot;.</source>
        <translation>Due azioni hanno l&apos;identificativo «%1». La seconda può avere «%2».</translation>
    </message>
    <message>
        <source>No entry can hold the id &quot;%1&quot;. It can be &quot;%2&quot;.</source>
        <translation>Nessuna voce può contenere l&apos;identificativo «%1». Può essere «%2».</translation>
    </message>
    <message>
        <source>The id &quot;%1&quot; should have only A to Z, a to z, 0 to 9 and &quot;-&quot; in it, as &quot;%2&quot; has.</source>
        <translation>L&apos;identificativo «%1» dovrebbe contenere solo A-Z, a-z, 0-9 e «-», come «%2».</translation>
    </message>
    <message numerus="yes">
        <source>%n more id(s) should be changed.</source>
        <translation>
            <numerusform>%n altro identificativo andrebbe modificato.</numerusform>
            <numerusform>%n altri identificativi andrebbero modificati.</numerusform>
        </translation>
    </message>
    <message>
        <source>Use &quot;%1&quot;</source>
        <translation>Usa «%1»</translation>
    </message>
    <message>
        <source>Use the proposed ids</source>
        <translation>Usa gli identificativi proposti</translation>
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
    <name>VelUI::EditStringsDialog</name>
    <message>
        <source>The &quot;;&quot; in &quot;%1&quot; does not separate items, it becomes part of one item.</source>
        <translation>Il «;» in «%1» non separa elementi, diventa parte di un elemento.</translation>
    </message>
    <message numerus="yes">
        <source>Make %n item(s) of it</source>
        <translation>
            <numerusform>Ricavane %n elemento</numerusform>
            <numerusform>Ricavane %n elementi</numerusform>
        </translation>
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
    <name>VelUI::EntryFormAssistance</name>
    <message>
        <source>Te&amp;xt</source>
        <comment>button: shows the file of the entry</comment>
        <translation>Te&amp;sto</translation>
    </message>
    <message>
        <source>Shows the file as it would be saved</source>
        <translation>Mostra il file come verrebbe salvato</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryTextDialog</name>
    <message>
        <source>Text of the entry</source>
        <translation>Testo della voce</translation>
    </message>
    <message>
        <source>The file as it would be saved</source>
        <translation>Il file come verrebbe salvato</translation>
    </message>
    <message>
        <source>Nothing is changed.</source>
        <translation>Nulla è stato modificato.</translation>
    </message>
    <message>
        <source>≠ changed lines: %1, + new lines: %2, removed lines: %3</source>
        <translation>≠ righe modificate: %1, + righe nuove: %2, righe rimosse: %3</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldChoosers</name>
    <message>
        <source>Choose %1</source>
        <comment>name of a &quot;Choose...&quot; button</comment>
        <translation>Scegli %1</translation>
    </message>
    <message>
        <source>Choose...</source>
        <translation>Scegli...</translation>
    </message>
    <message>
        <source>Chooses from all that are known (Alt+Down)</source>
        <translation>Sceglie tra tutto ciò che è noto (Alt+Giù)</translation>
    </message>
    <message>
        <source>Chooses an installed program (Alt+Down)</source>
        <translation>Sceglie un programma installato (Alt+Giù)</translation>
    </message>
    <message>
        <source>Insert</source>
        <comment>button: a field code</comment>
        <translation>Inserisci</translation>
    </message>
    <message>
        <source>Insert a field code</source>
        <translation>Inserisci un codice di campo</translation>
    </message>
    <message>
        <source>Inserts a code that stands for the files to open, or for a part of this entry</source>
        <translation>Inserisce un codice che rappresenta i file da aprire o una parte di questa voce</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldCodes</name>
    <message>
        <source>%f: one file; for several files the program is started several times</source>
        <translation>%f: un file; per più file il programma viene avviato più volte</translation>
    </message>
    <message>
        <source>%F: all files, each as a word of its own</source>
        <translation>%F: tutti i file, ciascuno come parola a sé</translation>
    </message>
    <message>
        <source>%u: one address (URL) or file; for several the program is started several times</source>
        <translation>%u: un indirizzo (URL) o un file; per più d&apos;uno il programma viene avviato più volte</translation>
    </message>
    <message>
        <source>%U: all addresses (URLs) or files, each as a word of its own</source>
        <translation>%U: tutti gli indirizzi (URL) o i file, ciascuno come parola a sé</translation>
    </message>
    <message>
        <source>%i: --icon and the icon of this entry, if it has one</source>
        <translation>%i: --icon e l&apos;icona di questa voce, se ne ha una</translation>
    </message>
    <message>
        <source>%c: the name of this entry, translated</source>
        <translation>%c: il nome di questa voce, tradotto</translation>
    </message>
    <message>
        <source>%k: where the file of this entry lies</source>
        <translation>%k: dove si trova il file di questa voce</translation>
    </message>
    <message>
        <source>%%: a percent sign</source>
        <translation>%%: un segno di percentuale</translation>
    </message>
</context>
<context>
    <name>VelUI::FindingLine</name>
    <message>
        <source>Fix</source>
        <translation>Correggi</translation>
    </message>
    <message>
        <source>Fix: %1</source>
        <comment>on a button; %1 is what it does</comment>
        <translation>Correggi: %1</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>how bad something is, and what it is</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Errore</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Avviso</translation>
    </message>
    <message>
        <source>Hint</source>
        <translation>Suggerimento</translation>
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
        <translation>Annulla la modifica di %1</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Rifai la modifica di %1</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Rifai</translation>
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
    <name>VelUI::LanguageBar</name>
    <message>
        <source>&amp;Language:</source>
        <translation>&amp;Lingua:</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Lingua</translation>
    </message>
    <message>
        <source>Another language...</source>
        <translation>Un&apos;altra lingua...</translation>
    </message>
    <message>
        <source>Another language</source>
        <translation>Un&apos;altra lingua</translation>
    </message>
    <message>
        <source>Unknown language</source>
        <translation>Lingua sconosciuta</translation>
    </message>
    <message>
        <source>%1 (%2), yours: %3 of %4 texts</source>
        <translation>%1 (%2), la tua: %3 testi su %4</translation>
    </message>
    <message>
        <source>%1 (%2), yours: no text yet</source>
        <translation>%1 (%2), la tua: ancora nessun testo</translation>
    </message>
    <message>
        <source>%1 (%2): %3 of %4 texts</source>
        <translation>%1 (%2): %3 testi su %4</translation>
    </message>
    <message>
        <source>%1 (%2): no text yet</source>
        <translation>%1 (%2): ancora nessun testo</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageDialog</name>
    <message>
        <source>Another language</source>
        <translation>Un&apos;altra lingua</translation>
    </message>
    <message>
        <source>&amp;Language or its code, such as pt_BR:</source>
        <translation>&amp;Lingua o relativo codice, per esempio pt_BR:</translation>
    </message>
    <message>
        <source>Language or its code</source>
        <translation>Lingua o relativo codice</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>a language and its code</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>No language has such a code: it is like de, pt_BR or sr@latin.</source>
        <translation>Nessuna lingua ha un codice simile: deve essere come de, pt_BR o sr@latin.</translation>
    </message>
    <message>
        <source>The code %1 is well-formed, but no language of this name is known.</source>
        <translation>Il codice %1 è ben formato, ma non si conosce nessuna lingua con questo nome.</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeChooser</name>
    <message>
        <source>Choose MIME types</source>
        <translation>Scegli i tipi MIME</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeSource</name>
    <message>
        <source>MIME type</source>
        <translation>Tipo MIME</translation>
    </message>
    <message>
        <source>Description</source>
        <translation>Descrizione</translation>
    </message>
    <message>
        <source>File names</source>
        <translation>Nomi dei file</translation>
    </message>
    <message>
        <source>Not in the database</source>
        <translation>Non nel database</translation>
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
<context>
    <name>VelUI::ProgramChooser</name>
    <message>
        <source>Choose a program</source>
        <translation>Scegli un programma</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramSource</name>
    <message>
        <source>Program</source>
        <comment>title of a column</comment>
        <translation>Programma</translation>
    </message>
    <message>
        <source>Folder</source>
        <comment>title of a column</comment>
        <translation>Cartella</translation>
    </message>
</context>
<context>
    <name>VelUI::RowFindings</name>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>E %n altro.</numerusform>
            <numerusform>E altri %n.</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::TrialLine</name>
    <message>
        <source>Stop</source>
        <comment>button: ends the trial of an entry</comment>
        <translation>Ferma</translation>
    </message>
    <message>
        <source>T&amp;ry</source>
        <comment>button: runs the entry</comment>
        <translation>P&amp;rova</translation>
    </message>
    <message>
        <source>Stops the trial</source>
        <translation>Ferma la prova</translation>
    </message>
    <message>
        <source>Runs the entry as it is now, without saving it</source>
        <translation>Esegue la voce com&apos;è ora, senza salvarla</translation>
    </message>
    <message>
        <source>The program vel-open, which runs entries, could not be started: %1</source>
        <translation>Impossibile avviare il programma vel-open, che esegue le voci: %1</translation>
    </message>
    <message>
        <source>The trial was stopped.</source>
        <translation>La prova è stata fermata.</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0).</source>
        <translation>La voce è stata avviata (stato d&apos;uscita 0).</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0): %1</source>
        <translation>La voce è stata avviata (stato d&apos;uscita 0): %1</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1).</source>
        <translation>Impossibile avviare la voce (stato d&apos;uscita %1).</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1): %2</source>
        <translation>Impossibile avviare la voce (stato d&apos;uscita %1): %2</translation>
    </message>
</context>
</TS>

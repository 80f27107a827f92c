<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es" sourcelanguage="en">
<context>
    <name>DesktopEntryPages</name>
    <message>
        <source>&amp;Read-only</source>
        <translation>&amp;Solo lectura</translation>
    </message>
    <message>
        <source>&amp;Button beside the address</source>
        <translation>&amp;Botón junto a la dirección</translation>
    </message>
    <message>
        <source>Information requested for %1</source>
        <translation>Se ha pedido información sobre %1</translation>
    </message>
    <message>
        <source>Use the buttons beside the fields to edit commands, files, icons, lists and actions.</source>
        <translation>Las órdenes y archivos, los iconos, las listas y las acciones se editan con los botones de sus campos.</translation>
    </message>
    <message>
        <source>Properties form</source>
        <translation>Formulario de propiedades</translation>
    </message>
    <message>
        <source>Desktop entries</source>
        <translation>Entradas de escritorio</translation>
    </message>
    <message>
        <source>Paths, icons, lists and actions</source>
        <translation>Rutas, iconos, listas y acciones</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Ayudas</translation>
    </message>
</context>
<context>
    <name>EditorCommands</name>
    <message>
        <source>Open</source>
        <translation>Abrir</translation>
    </message>
    <message>
        <source>Cannot read %1.</source>
        <translation>No se puede leer %1.</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Guardar</translation>
    </message>
    <message>
        <source>Cannot write %1.</source>
        <translation>No se puede escribir %1.</translation>
    </message>
    <message>
        <source>Go to line</source>
        <translation>Ir a la línea</translation>
    </message>
    <message>
        <source>Line:</source>
        <translation>Línea:</translation>
    </message>
    <message>
        <source>File</source>
        <translation>Archivo</translation>
    </message>
    <message>
        <source>&amp;New</source>
        <translation>&amp;Nuevo</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>&amp;Abrir...</translation>
    </message>
    <message>
        <source>&amp;Save...</source>
        <translation>&amp;Guardar...</translation>
    </message>
    <message>
        <source>Insert &amp;date</source>
        <translation>Insertar &amp;fecha</translation>
    </message>
    <message>
        <source>Insert &amp;time</source>
        <translation>Insertar &amp;hora</translation>
    </message>
    <message>
        <source>Insert &amp;rule</source>
        <translation>Insertar línea &amp;separadora</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Editar</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Deshacer</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Rehacer</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Cor&amp;tar</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Copiar</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>&amp;Pegar</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>Seleccionar t&amp;odo</translation>
    </message>
    <message>
        <source>Select word</source>
        <translation>Seleccionar palabra</translation>
    </message>
    <message>
        <source>Select line</source>
        <translation>Seleccionar línea</translation>
    </message>
    <message>
        <source>Select paragraph</source>
        <translation>Seleccionar párrafo</translation>
    </message>
    <message>
        <source>Find selected a&amp;gain</source>
        <translation>&amp;Buscar la selección siguiente</translation>
    </message>
    <message>
        <source>Find selected backward</source>
        <translation>Buscar la selección anterior</translation>
    </message>
    <message>
        <source>Find selected word</source>
        <translation>Buscar la palabra seleccionada</translation>
    </message>
    <message>
        <source>Find selected, matching case</source>
        <translation>Buscar la selección distinguiendo mayúsculas</translation>
    </message>
    <message>
        <source>Go to &amp;line...</source>
        <translation>Ir a la &amp;línea...</translation>
    </message>
    <message>
        <source>Go to start</source>
        <translation>Ir al principio</translation>
    </message>
    <message>
        <source>Go to end</source>
        <translation>Ir al final</translation>
    </message>
    <message>
        <source>Go to next paragraph</source>
        <translation>Ir al párrafo siguiente</translation>
    </message>
    <message>
        <source>Go to previous paragraph</source>
        <translation>Ir al párrafo anterior</translation>
    </message>
    <message>
        <source>Delete word to the left</source>
        <translation>Borrar palabra a la izquierda</translation>
    </message>
    <message>
        <source>Delete word to the right</source>
        <translation>Borrar palabra a la derecha</translation>
    </message>
    <message>
        <source>Delete to start of line</source>
        <translation>Borrar hasta el principio de la línea</translation>
    </message>
    <message>
        <source>Delete to end of line</source>
        <translation>Borrar hasta el final de la línea</translation>
    </message>
    <message>
        <source>To upper case</source>
        <translation>Convertir a mayúsculas</translation>
    </message>
    <message>
        <source>To lower case</source>
        <translation>Convertir a minúsculas</translation>
    </message>
    <message>
        <source>Swap case</source>
        <translation>Intercambiar mayúsculas y minúsculas</translation>
    </message>
    <message>
        <source>Capitalize</source>
        <translation>Poner mayúscula inicial</translation>
    </message>
    <message>
        <source>Move line up</source>
        <translation>Mover línea hacia arriba</translation>
    </message>
    <message>
        <source>Move line down</source>
        <translation>Mover línea hacia abajo</translation>
    </message>
    <message>
        <source>New line above</source>
        <translation>Línea nueva encima</translation>
    </message>
    <message>
        <source>New line below</source>
        <translation>Línea nueva debajo</translation>
    </message>
    <message>
        <source>Duplicate lines</source>
        <translation>Duplicar líneas</translation>
    </message>
    <message>
        <source>Join lines</source>
        <translation>Unir líneas</translation>
    </message>
    <message>
        <source>Sort lines</source>
        <translation>Ordenar líneas</translation>
    </message>
    <message>
        <source>Reverse lines</source>
        <translation>Invertir líneas</translation>
    </message>
    <message>
        <source>Remove duplicate lines</source>
        <translation>Eliminar líneas duplicadas</translation>
    </message>
    <message>
        <source>Remove empty lines</source>
        <translation>Eliminar líneas vacías</translation>
    </message>
    <message>
        <source>Trim lines</source>
        <translation>Recortar espacios de las líneas</translation>
    </message>
    <message>
        <source>Indent lines</source>
        <translation>Sangrar líneas</translation>
    </message>
    <message>
        <source>Unindent lines</source>
        <translation>Quitar sangrado de líneas</translation>
    </message>
    <message>
        <source>Comment lines</source>
        <translation>Comentar líneas</translation>
    </message>
    <message>
        <source>Uncomment lines</source>
        <translation>Descomentar líneas</translation>
    </message>
    <message>
        <source>Tabs to spaces</source>
        <translation>Convertir tabuladores en espacios</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Ver</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>&amp;Ampliar</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>&amp;Reducir</translation>
    </message>
    <message>
        <source>&amp;Wrap lines</source>
        <translation>A&amp;justar líneas</translation>
    </message>
    <message>
        <source>&amp;Fixed-width font</source>
        <translation>Ancho &amp;fijo</translation>
    </message>
    <message>
        <source>&amp;Proportional font</source>
        <translation>Ancho &amp;proporcional</translation>
    </message>
    <message>
        <source>O&amp;verwrite</source>
        <translation>&amp;Sobrescribir</translation>
    </message>
    <message>
        <source>&amp;Read only</source>
        <translation>So&amp;lo lectura</translation>
    </message>
    <message>
        <source>Wide cur&amp;sor</source>
        <translation>Cursor a&amp;ncho</translation>
    </message>
    <message>
        <source>&amp;Center on cursor</source>
        <translation>&amp;Centrar en el cursor</translation>
    </message>
    <message>
        <source>Scroll &amp;up</source>
        <translation>Desplazar hacia arri&amp;ba</translation>
    </message>
    <message>
        <source>Scroll &amp;down</source>
        <translation>Desplazar hacia abaj&amp;o</translation>
    </message>
    <message>
        <source>Scroll to &amp;top</source>
        <translation>Desplazar al pr&amp;incipio</translation>
    </message>
    <message>
        <source>Scroll to botto&amp;m</source>
        <translation>D&amp;esplazar al final</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Texto</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Teclas</translation>
    </message>
    <message>
        <source>The file has %1 for %2, but %3 has it, too.</source>
        <translation>El archivo tiene %1 para %2, pero también lo tiene %3.</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Sustituir</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>&amp;Omitir</translation>
    </message>
    <message>
        <source>&amp;Export keys...</source>
        <translation>&amp;Exportar teclas...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>&amp;Importar teclas...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>Guardar &amp;la chuleta como HTML...</translation>
    </message>
    <message>
        <source>Save cheat sheet as te&amp;xt...</source>
        <translation>Guardar la chuleta como te&amp;xto...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>&amp;Copiar la chuleta</translation>
    </message>
</context>
<context>
    <name>EntryWindow</name>
    <message>
        <source>Unsaved changes</source>
        <translation>Cambios sin guardar</translation>
    </message>
    <message>
        <source>The entry %1 was changed.
Save the changes?</source>
        <translation>Se ha cambiado la entrada %1.
¿Desea guardar los cambios?</translation>
    </message>
</context>
<context>
    <name>FileIconsPage</name>
    <message>
        <source>File icons</source>
        <translation>Iconos de archivos</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>Modelos</translation>
    </message>
</context>
<context>
    <name>GalleryWindow</name>
    <message>
        <source>Widget gallery</source>
        <translation>Galería de elementos gráficos</translation>
    </message>
    <message>
        <source>Pages</source>
        <translation>Páginas</translation>
    </message>
    <message>
        <source>Code of this page</source>
        <translation>Código de esta página</translation>
    </message>
</context>
<context>
    <name>KeyNamesPage</name>
    <message>
        <source>&amp;Press keys:</source>
        <translation>&amp;Pulsar teclas:</translation>
    </message>
    <message>
        <source>In the window manager&apos;s notation:</source>
        <translation>Tal como las escribe el gestor de ventanas:</translation>
    </message>
    <message>
        <source>Read back:</source>
        <translation>Leído de nuevo:</translation>
    </message>
    <message>
        <source>Global action with these keys:</source>
        <translation>Acción global con estas teclas:</translation>
    </message>
    <message>
        <source>Key names</source>
        <translation>Nombres de teclas</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Accesos rápidos</translation>
    </message>
</context>
<context>
    <name>MenuPages</name>
    <message>
        <source>&amp;Pick an entry...</source>
        <translation>&amp;Elegir una entrada...</translation>
    </message>
    <message>
        <source>Edit the &amp;menu...</source>
        <translation>Editar el &amp;menú...</translation>
    </message>
    <message>
        <source>Edit an e&amp;ntry...</source>
        <translation>Editar una e&amp;ntrada...</translation>
    </message>
    <message>
        <source>Menu tree</source>
        <translation>Árbol del menú</translation>
    </message>
    <message>
        <source>Menus</source>
        <translation>Menús</translation>
    </message>
    <message>
        <source>Menu and entry dialogs</source>
        <translation>Diálogos de menú y de entrada</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Ayudas</translation>
    </message>
</context>
<context>
    <name>RadioGroupBoxPage</name>
    <message>
        <source>&amp;Automatic configuration</source>
        <translation>Configuración &amp;automática</translation>
    </message>
    <message>
        <source>Script address:</source>
        <translation>Dirección del script:</translation>
    </message>
    <message>
        <source>Ask again at every start</source>
        <translation>Volver a preguntar en cada inicio</translation>
    </message>
    <message>
        <source>&amp;Manual configuration</source>
        <translation>Configuración &amp;manual</translation>
    </message>
    <message>
        <source>Host:</source>
        <translation>Servidor:</translation>
    </message>
    <message>
        <source>Port:</source>
        <translation>Puerto:</translation>
    </message>
    <message>
        <source>Protocol:</source>
        <translation>Protocolo:</translation>
    </message>
    <message>
        <source>&amp;Direct connection</source>
        <translation>Conexión &amp;directa</translation>
    </message>
    <message>
        <source>There is nothing to set.</source>
        <translation>No hay nada que configurar.</translation>
    </message>
    <message>
        <source>Radio group boxes</source>
        <translation>Cuadros de grupo con botón de radio</translation>
    </message>
    <message>
        <source>Widgets</source>
        <translation>Elementos gráficos</translation>
    </message>
</context>
<context>
    <name>SettingsPage</name>
    <message>
        <source>Settings file</source>
        <translation>Archivo de preferencias</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Preferencias</translation>
    </message>
    <message>
        <source>F&amp;lat buttons</source>
        <translation>Botones p&amp;lanos</translation>
    </message>
    <message>
        <source>S&amp;ection:</source>
        <translation>S&amp;ección:</translation>
    </message>
    <message>
        <source>&amp;Font:</source>
        <translation>&amp;Tipo de letra:</translation>
    </message>
    <message>
        <source>&amp;Size:</source>
        <translation>Ta&amp;maño:</translation>
    </message>
    <message>
        <source>Contents of the file on disk</source>
        <translation>Contenido del archivo en el disco</translation>
    </message>
    <message>
        <source>Name a settings file on the command line to edit it here.</source>
        <translation>Indique un archivo de preferencias en la línea de órdenes para editarlo aquí.</translation>
    </message>
    <message>
        <source>%1 cannot be opened.</source>
        <translation>No se puede abrir %1.</translation>
    </message>
</context>
<context>
    <name>ShortcutsPage</name>
    <message>
        <source>Delete the whole line</source>
        <translation>Eliminar la línea completa</translation>
    </message>
    <message>
        <source>Last command: %1</source>
        <translation>Última orden: %1</translation>
    </message>
    <message>
        <source>one line
another line
and a third one
</source>
        <translation>una línea
otra línea
y una tercera
</translation>
    </message>
    <message>
        <source>Go to the editor</source>
        <translation>Ir al editor</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Ver</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Preferencias</translation>
    </message>
    <message>
        <source>Configure shortcuts...</source>
        <translation>Configurar accesos rápidos...</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Accesos rápidos</translation>
    </message>
    <message>
        <source>Configure shortcuts in the plain dialog...</source>
        <translation>Configurar accesos rápidos en el diálogo sencillo...</translation>
    </message>
</context>
<context>
    <name>vel-entryedit</name>
    <message>
        <source>Edits a desktop entry.</source>
        <translation>Edita una entrada de escritorio.</translation>
    </message>
    <message>
        <source>Make a new entry when there is no such file.</source>
        <translation>Crear una entrada nueva si el archivo no existe.</translation>
    </message>
    <message>
        <source>Begin with the values of the entry &lt;file&gt;.</source>
        <translation>Empezar con los valores de la entrada &lt;file&gt;.</translation>
    </message>
    <message>
        <source>Show the entry only.</source>
        <translation>Solo mostrar la entrada.</translation>
    </message>
    <message>
        <source>The entry to edit.</source>
        <translation>La entrada que se va a editar.</translation>
    </message>
    <message>
        <source>one file has to be named</source>
        <translation>hay que indicar un archivo</translation>
    </message>
    <message>
        <source>cannot open %1</source>
        <translation>no se puede abrir %1</translation>
    </message>
    <message>
        <source>cannot open %1: there is no such file, --create makes a new entry</source>
        <translation>no se puede abrir %1: el archivo no existe, --create crea una entrada nueva</translation>
    </message>
    <message>
        <source>cannot open %1: it is no regular file</source>
        <translation>no se puede abrir %1: no es un archivo normal</translation>
    </message>
    <message>
        <source>cannot open %1: %2</source>
        <translation>no se puede abrir %1: %2</translation>
    </message>
</context>
<context>
    <name>vel-gallery</name>
    <message>
        <source>the page %1 did not finish loading</source>
        <translation>la página %1 no llegó a estar lista</translation>
    </message>
    <message>
        <source>cannot write %1</source>
        <translation>no se puede escribir %1</translation>
    </message>
    <message>
        <source>cannot make the folder %1</source>
        <translation>no se puede crear la carpeta %1</translation>
    </message>
    <message>
        <source>Shows the library&apos;s widgets, dialogs and models in action.</source>
        <translation>Muestra los elementos gráficos, diálogos y modelos de la biblioteca en funcionamiento.</translation>
    </message>
    <message>
        <source>Start with the page &lt;name&gt;.</source>
        <translation>Empezar por la página &lt;name&gt;.</translation>
    </message>
    <message>
        <source>Write screenshots of every page, or of the page given with --page, to &lt;dir&gt; and exit.</source>
        <translation>Escribir en &lt;dir&gt; imágenes de todas las páginas, o de la indicada con --page, y terminar.</translation>
    </message>
    <message>
        <source>The settings file that the settings page edits.</source>
        <translation>El archivo de preferencias que edita la página de preferencias.</translation>
    </message>
    <message>
        <source>Widget gallery</source>
        <translation>Galería de elementos gráficos</translation>
    </message>
    <message>
        <source>there is no page %1</source>
        <translation>no existe la página %1</translation>
    </message>
</context>
<context>
    <name>vel-menuedit</name>
    <message>
        <source>cannot create the start menu %1</source>
        <translation>no se puede crear el menú de inicio %1</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>no existe esa carpeta: %1</translation>
    </message>
    <message>
        <source>not a directory: %1</source>
        <translation>no es una carpeta: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>no se puede leer la carpeta %1</translation>
    </message>
    <message>
        <source>Edits the start menu, or picks an entry of it.</source>
        <translation>Edita el menú de inicio o elige una de sus entradas.</translation>
    </message>
    <message>
        <source>Show the menu directory &lt;dir&gt; instead of the start menu.</source>
        <translation>Mostrar la carpeta de menú &lt;dir&gt; en lugar del menú de inicio.</translation>
    </message>
    <message>
        <source>Show the desktop folder.</source>
        <translation>Mostrar la carpeta del escritorio.</translation>
    </message>
    <message>
        <source>Show the tool bar.</source>
        <translation>Mostrar la barra de herramientas.</translation>
    </message>
    <message>
        <source>Look only, change nothing.</source>
        <translation>Solo mirar, sin cambiar nada.</translation>
    </message>
    <message>
        <source>Show icons of &lt;pixels&gt; pixels.</source>
        <translation>Mostrar iconos de &lt;pixels&gt; píxeles.</translation>
    </message>
    <message>
        <source>Pick an entry and print its path and its command line.</source>
        <translation>Elegir una entrada y mostrar su ruta y su línea de órdenes.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>argumento inesperado: %1</translation>
    </message>
    <message>
        <source>only one of --dir, --desktop and --toolbar can be given</source>
        <translation>solo se puede indicar una de las opciones --dir, --desktop y --toolbar</translation>
    </message>
    <message>
        <source>--icon-size needs a number of pixels from 1 to 512, not &quot;%1&quot;</source>
        <translation>--icon-size necesita un número de píxeles de 1 a 512, no «%1»</translation>
    </message>
</context>
<context>
    <name>vel-menuprint</name>
    <message>
        <source>Prints a menu directory in its order.</source>
        <translation>Muestra una carpeta de menú en su orden.</translation>
    </message>
    <message>
        <source>The menu directory; the start menu when none is given.</source>
        <translation>La carpeta de menú; el menú de inicio si no se indica ninguna.</translation>
    </message>
    <message>
        <source>unknown format: %1</source>
        <translation>formato desconocido: %1</translation>
    </message>
    <message>
        <source>more than one directory</source>
        <translation>más de una carpeta</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>no existe esa carpeta: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>no se puede leer la carpeta %1</translation>
    </message>
    <message>
        <source>The menu has more than %1 items or %2 levels, and the rest of it is left out. Look for links that lead into the same folders again.</source>
        <translation>El menú tiene más de %1 elementos o %2 niveles; se ha omitido el resto. Busque enlaces que lleven una y otra vez a las mismas carpetas.</translation>
    </message>
    <message>
        <source>What to print: %1. The default is text.</source>
        <translation>Qué se muestra: %1. El valor predeterminado es text.</translation>
    </message>
    <message>
        <source>The icon theme to take the files of icons from; the user&apos;s own when none is given.</source>
        <translation>El tema de iconos del que se toman los archivos de los iconos; el del usuario si no se indica ninguno.</translation>
    </message>
    <message>
        <source>The edge of the icons in pixels, 24 by default.</source>
        <translation>El lado de los iconos en píxeles, 24 si no se indica otra cosa.</translation>
    </message>
    <message>
        <source>Reads one of the lines that rofi or dmenu was given from standard input and starts its entry.</source>
        <translation>Leer de la entrada estándar una de las líneas que recibió rofi o dmenu e iniciar su entrada.</translation>
    </message>
    <message>
        <source>the size of icons is not between 1 and %1</source>
        <translation>el tamaño de los iconos no está entre 1 y %1</translation>
    </message>
    <message>
        <source>The start menu is empty: no application is installed.</source>
        <translation>El menú de inicio está vacío: no hay ninguna aplicación instalada.</translation>
    </message>
    <message>
        <source>The start menu %1 cannot be made: %2</source>
        <translation>No se puede crear el menú de inicio %1: %2</translation>
    </message>
    <message>
        <source>%1 is left out, as the line end in its name cannot be written in this format. Rename it.</source>
        <translation>%1 se omite, porque el fin de línea de su nombre no se puede escribir en este formato. Cámbiele el nombre.</translation>
    </message>
    <message>
        <source>The start menu is empty: nothing in %1 is shown.</source>
        <translation>El menú de inicio está vacío: no se muestra nada de %1.</translation>
    </message>
    <message>
        <source>cannot run vel-open: %1</source>
        <translation>no se puede ejecutar vel-open: %1</translation>
    </message>
    <message>
        <source>There is no &quot;%1&quot; in the menu.</source>
        <translation>No hay ningún «%1» en el menú.</translation>
    </message>
</context>
<context>
    <name>vel-wmbridge</name>
    <message>
        <source>Owns the window manager&apos;s command channel on a desktop that has none, and runs a command of the shell for each kind of update. The variable VEL_COMMAND holds the line that came.</source>
        <translation>Mantiene el canal de órdenes del gestor de ventanas en un escritorio que no lo tiene y ejecuta una orden del intérprete para cada tipo de actualización. La variable VEL_COMMAND contiene la línea recibida.</translation>
    </message>
    <message>
        <source>Run when the start menu has changed.</source>
        <translation>Ejecutar cuando haya cambiado el menú de inicio.</translation>
    </message>
    <message>
        <source>Run when the tool bar has changed.</source>
        <translation>Ejecutar cuando haya cambiado la barra de herramientas.</translation>
    </message>
    <message>
        <source>Run when the desktop&apos;s entries have changed.</source>
        <translation>Ejecutar cuando hayan cambiado las entradas del escritorio.</translation>
    </message>
    <message>
        <source>Run for every other line.</source>
        <translation>Ejecutar para cualquier otra línea.</translation>
    </message>
    <message>
        <source>Take the channel from the program that has it.</source>
        <translation>Quitar el canal al programa que lo tiene.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>argumento inesperado: %1</translation>
    </message>
    <message>
        <source>cannot run the command for %1</source>
        <translation>no se puede ejecutar la orden para %1</translation>
    </message>
    <message>
        <source>another program has taken the channel</source>
        <translation>otro programa ha tomado el canal</translation>
    </message>
    <message>
        <source>cannot take the channel: there is no display, or another program has it</source>
        <translation>no se puede tomar el canal: no hay pantalla o lo tiene otro programa</translation>
    </message>
    <message>
        <source>unknown window manager: %1 (known are %2)</source>
        <translation>gestor de ventanas desconocido: %1 (se conocen %2)</translation>
    </message>
    <message>
        <source>Do what this window manager needs to show the start menu as it is: %1.</source>
        <translation>Hacer lo que necesita este gestor de ventanas para mostrar el menú de inicio tal como está: %1.</translation>
    </message>
</context>
</TS>

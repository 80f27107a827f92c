<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es" sourcelanguage="en">
<context>
    <name>ActionListEdit</name>
    <message>
        <source>Form</source>
        <translation>Formulario</translation>
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
        <translation>Ir a</translation>
    </message>
    <message>
        <source>Go to action &apos;%1&apos;</source>
        <translation>Ir a la acción «%1»</translation>
    </message>
    <message>
        <source>Take over</source>
        <translation>Tomar</translation>
    </message>
    <message>
        <source>Take over &apos;%1&apos; from action &apos;%2&apos;</source>
        <translation>Tomar «%1» de la acción «%2»</translation>
    </message>
    <message>
        <source>Further clashes: %1</source>
        <translation>Otros conflictos: %1</translation>
    </message>
</context>
<context>
    <name>EditActionsDialog</name>
    <message>
        <source>Actions</source>
        <translation>Acciones</translation>
    </message>
</context>
<context>
    <name>EditActionsWidget</name>
    <message>
        <source>Form</source>
        <translation>Formulario</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Añadir...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Editar...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Borrar</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Subir</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Bajar</translation>
    </message>
</context>
<context>
    <name>EditShortcutsAssistance</name>
    <message>
        <source>Schemes</source>
        <translation>Esquemas</translation>
    </message>
    <message>
        <source>No action matches the filter.</source>
        <translation>Ninguna acción coincide con el filtro.</translation>
    </message>
    <message>
        <source>No action has the shortcut %1.</source>
        <translation>Ninguna acción tiene el acceso rápido %1.</translation>
    </message>
</context>
<context>
    <name>EditShortcutsDialog</name>
    <message>
        <source>None</source>
        <translation>Ninguna</translation>
    </message>
    <message>
        <source>Configure shortcuts</source>
        <translation>Configurar accesos rápidos</translation>
    </message>
    <message>
        <source>Choose a key for selected action</source>
        <translation>Elegir una tecla para la acción seleccionada</translation>
    </message>
    <message>
        <source>Default key:</source>
        <translation>Tecla predeterminada:</translation>
    </message>
    <message>
        <source>Assign key:</source>
        <translation>Asignar tecla:</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>El acceso rápido «%1» ya se usa para la acción global «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;. Please try another.</source>
        <translation>El acceso rápido «%1» ya se usa para la acción «%2». Pruebe con otro.</translation>
    </message>
    <message>
        <source>Shortcuts conflict</source>
        <translation>Conflicto de accesos rápidos</translation>
    </message>
    <message>
        <source>Apply changes</source>
        <translation>Aplicar cambios</translation>
    </message>
    <message>
        <source>Some shortcuts have been changed. Do you want to apply changes?</source>
        <translation>Se han modificado algunos accesos rápidos. ¿Desea aplicar los cambios?</translation>
    </message>
</context>
<context>
    <name>EditStringsDialog</name>
    <message>
        <source>Strings</source>
        <translation>Cadenas</translation>
    </message>
</context>
<context>
    <name>EditableListWidget</name>
    <message>
        <source>Form</source>
        <translation>Formulario</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Añadir...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Editar...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Borrar</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Subir</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Bajar</translation>
    </message>
</context>
<context>
    <name>EntryCheck</name>
    <message>
        <source>The condition &apos;%1&apos; needs a file.</source>
        <translation>La condición «%1» necesita un archivo.</translation>
    </message>
    <message>
        <source>The file of the condition &apos;%1&apos; is one in the folder of settings, without &apos;/&apos; before it.</source>
        <translation>El archivo de la condición «%1» está en la carpeta de configuración y no lleva «/» delante.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a key.</source>
        <translation>La condición «%1» necesita una clave.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs &apos;if-session&apos; or &apos;unless-session&apos; and a session.</source>
        <translation>La condición «%1» necesita «if-session» o «unless-session» y una sesión.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a schema and a key.</source>
        <translation>La condición «%1» necesita un esquema y una clave.</translation>
    </message>
    <message>
        <source>There is no condition &apos;%1&apos;.</source>
        <translation>La condición «%1» no existe.</translation>
    </message>
    <message>
        <source>A category is empty.</source>
        <translation>Hay una categoría vacía.</translation>
    </message>
    <message>
        <source>There is no registered category &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>La categoría «%1» no está registrada; una propia tiene que empezar por «X-».</translation>
    </message>
    <message>
        <source>Change it to &apos;%1&apos;</source>
        <translation>Cambiar a «%1»</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; also needs: %2.</source>
        <translation>La categoría «%1» requiere además: %2.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; goes with one of these: %2.</source>
        <translation>La categoría «%1» va con una de estas: %2.</translation>
    </message>
    <message>
        <source>Add &apos;%1&apos;</source>
        <translation>Añadir «%1»</translation>
    </message>
    <message>
        <source>Remove it</source>
        <translation>Quitar</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is out of use.</source>
        <translation>La categoría «%1» está en desuso.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is only for entries that list desktops in &apos;Only show in&apos;.</source>
        <translation>La categoría «%1» es solo para entradas que indican escritorios en «Mostrar solo en».</translation>
    </message>
    <message>
        <source>No main category is among them, so menus may not know where to show the entry.</source>
        <translation>No hay ninguna categoría principal entre ellas, y los menús quizá no sepan dónde mostrar la entrada.</translation>
    </message>
    <message>
        <source>Several main categories are among them, so the entry may be shown more than once.</source>
        <translation>Hay varias categorías principales entre ellas, y la entrada puede aparecer más de una vez.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; stands more than once.</source>
        <translation>«%1» aparece más de una vez.</translation>
    </message>
    <message>
        <source>Keep the first</source>
        <translation>Conservar el primero</translation>
    </message>
    <message>
        <source>The application has no command.</source>
        <translation>La aplicación no tiene ninguna orden.</translation>
    </message>
    <message>
        <source>The link leads nowhere.</source>
        <translation>El enlace no lleva a ninguna parte.</translation>
    </message>
    <message>
        <source>A quote is not closed.</source>
        <translation>Hay unas comillas sin cerrar.</translation>
    </message>
    <message>
        <source>In quotes, a backslash has to stand before &apos;%1&apos;.</source>
        <translation>Entre comillas, «%1» tiene que llevar delante una barra inversa.</translation>
    </message>
    <message>
        <source>The command ends in a single backslash, which stands for nothing.</source>
        <translation>La orden termina en una barra inversa suelta, que no significa nada.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to stand in double quotes.</source>
        <translation>«%1» tiene que estar entre comillas dobles.</translation>
    </message>
    <message>
        <source>Close the quote</source>
        <translation>Cerrar las comillas</translation>
    </message>
    <message>
        <source>Put it in quotes</source>
        <translation>Poner entre comillas</translation>
    </message>
    <message>
        <source>Have a shell run it</source>
        <translation>Ejecutar con un intérprete de órdenes</translation>
    </message>
    <message>
        <source>Write &apos;%&apos; as &apos;%%&apos;</source>
        <translation>Escribir «%» como «%%»</translation>
    </message>
    <message>
        <source>A field code is not complete: &apos;%&apos; ends the command.</source>
        <translation>Hay un código de campo incompleto: «%» termina la orden.</translation>
    </message>
    <message>
        <source>There is no field code &apos;%%1&apos;.</source>
        <translation>El código de campo «%%1» no existe.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; is out of use; nothing is put in its place.</source>
        <translation>El código de campo «%%1» está en desuso; no se pone nada en su lugar.</translation>
    </message>
    <message>
        <source>Only one of &apos;%f&apos;, &apos;%F&apos;, &apos;%u&apos; and &apos;%U&apos; may stand in a command, and once.</source>
        <translation>En una orden solo puede haber uno de los códigos «%f», «%F», «%u» y «%U», y una sola vez.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; stands more than once.</source>
        <translation>El código de campo «%%1» aparece más de una vez.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; has to be an argument of its own, not in quotes.</source>
        <translation>El código de campo «%%1» tiene que ser un argumento aparte y sin comillas.</translation>
    </message>
    <message>
        <source>The path of the program has a blank: it has to stand in quotes.</source>
        <translation>La ruta del programa contiene un espacio: tiene que estar entre comillas.</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;.</source>
        <translation>El programa «%1» no existe.</translation>
    </message>
    <message>
        <source>The command has to begin with a program.</source>
        <translation>La orden tiene que empezar por un programa.</translation>
    </message>
    <message>
        <source>&apos;Try exec&apos; takes the program alone, without quotes and arguments.</source>
        <translation>«Orden de comprobación» admite solo el programa, sin comillas ni argumentos.</translation>
    </message>
    <message>
        <source>Keep the program</source>
        <translation>Conservar el programa</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;, so the entry is not shown.</source>
        <translation>El programa «%1» no existe, por lo que la entrada no se muestra.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is missing.</source>
        <translation>Falta «%1».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has translations only, and nothing for all other languages.</source>
        <translation>«%1» solo tiene traducciones y nada para los demás idiomas.</translation>
    </message>
    <message>
        <source>Take &apos;%1&apos;</source>
        <translation>Tomar «%1»</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is only for entries of the type &apos;%2&apos;.</source>
        <translation>«%1» es solo para entradas del tipo «%2».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here.</source>
        <translation>«%1» está en desuso aquí.</translation>
    </message>
    <message>
        <source>No key can be called &apos;%1&apos;.</source>
        <translation>Ninguna clave puede llamarse «%1».</translation>
    </message>
    <message>
        <source>There is no key &apos;%1&apos; here; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>La clave «%1» no existe aquí; una propia tiene que empezar por «X-».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; cannot be translated.</source>
        <translation>«%1» no se puede traducir.</translation>
    </message>
    <message>
        <source>&apos;Only show in&apos; and &apos;Not show in&apos; exclude each other.</source>
        <translation>«Mostrar solo en» y «No mostrar en» se excluyen entre sí.</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>El archivo está vacío.</translation>
    </message>
    <message>
        <source>The first group of the file is not &apos;[Desktop Entry]&apos;.</source>
        <translation>El primer grupo del archivo no es «[Desktop Entry]».</translation>
    </message>
    <message>
        <source>The name of the file has to end in &apos;.%1&apos;.</source>
        <translation>El nombre del archivo tiene que terminar en «.%1».</translation>
    </message>
    <message>
        <source>Lines of the file end in a carriage return.</source>
        <translation>Hay líneas del archivo que terminan en un retorno de carro.</translation>
    </message>
    <message>
        <source>A line of the file says nothing: %1</source>
        <translation>Una línea del archivo no dice nada: %1</translation>
    </message>
    <message>
        <source>A line of the file stands before all groups: %1</source>
        <translation>Una línea del archivo está antes de todos los grupos: %1</translation>
    </message>
    <message>
        <source>A line of the file begins with a blank: %1</source>
        <translation>Una línea del archivo empieza por un espacio: %1</translation>
    </message>
    <message>
        <source>A blank stands behind a group: %1</source>
        <translation>Hay un espacio detrás de un grupo: %1</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; stands more than once.</source>
        <translation>El grupo «%1» aparece más de una vez.</translation>
    </message>
    <message>
        <source>No group can be called &apos;%1&apos;.</source>
        <translation>Ningún grupo puede llamarse «%1».</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; is out of use.</source>
        <translation>El grupo «%1» está en desuso.</translation>
    </message>
    <message>
        <source>There is no group &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>El grupo «%1» no existe; uno propio tiene que empezar por «X-».</translation>
    </message>
    <message>
        <source>The id &apos;%1&apos; of an action may only have letters A to Z, digits and &apos;-&apos;.</source>
        <translation>El identificador «%1» de una acción solo puede tener letras de la A a la Z, cifras y «-».</translation>
    </message>
    <message>
        <source>The action &apos;%1&apos; is described, but &apos;Actions&apos; does not name it.</source>
        <translation>La acción «%1» está descrita, pero «Actions» no la menciona.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has no &apos;/&apos;.</source>
        <translation>«%1» no es un tipo MIME: le falta «/».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: nothing stands behind the &apos;/&apos;.</source>
        <translation>«%1» no es un tipo MIME: no hay nada detrás de «/».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: there is no kind &apos;%2&apos;.</source>
        <translation>«%1» no es un tipo MIME: la clase «%2» no existe.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has a character that none has.</source>
        <translation>«%1» no es un tipo MIME: contiene un carácter que no se admite.</translation>
    </message>
    <message>
        <source>MIME types like &apos;%1&apos; are not used for files.</source>
        <translation>Los tipos MIME como «%1» no se usan para archivos.</translation>
    </message>
    <message>
        <source>This computer does not know the MIME type &apos;%1&apos;.</source>
        <translation>Este equipo no conoce el tipo MIME «%1».</translation>
    </message>
    <message>
        <source>An action has no id.</source>
        <translation>Una acción no tiene identificador.</translation>
    </message>
    <message>
        <source>Nothing says what the action &apos;%1&apos; is.</source>
        <translation>Nada indica qué es la acción «%1».</translation>
    </message>
    <message>
        <source>There is no registered desktop &apos;%1&apos;; others have to begin with &apos;X-&apos;.</source>
        <translation>El escritorio «%1» no está registrado; los demás tienen que empezar por «X-».</translation>
    </message>
    <message>
        <source>In your language the entry is shown as &apos;%1&apos;.</source>
        <translation>En su idioma, la entrada se muestra como «%1».</translation>
    </message>
    <message>
        <source>The comment says no more than the name.</source>
        <translation>El comentario no dice más que el nombre.</translation>
    </message>
    <message>
        <source>The comment says no more than the generic name.</source>
        <translation>El comentario no dice más que el nombre genérico.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here; it has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>«%1» está en desuso aquí; tiene que ser «true» o «false».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>«%1» tiene que ser «true» o «false».</translation>
    </message>
    <message>
        <source>Change it to &apos;true&apos;</source>
        <translation>Cambiar a «true»</translation>
    </message>
    <message>
        <source>The name of an icon has no suffix like &apos;%1&apos;.</source>
        <translation>El nombre de un icono no lleva una extensión como «%1».</translation>
    </message>
    <message>
        <source>Remove the suffix</source>
        <translation>Quitar la extensión</translation>
    </message>
    <message>
        <source>No icon theme has an icon &apos;%1&apos;.</source>
        <translation>Ningún tema de iconos tiene el icono «%1».</translation>
    </message>
    <message>
        <source>Write the folder in full</source>
        <translation>Escribir la carpeta completa</translation>
    </message>
    <message>
        <source>The address does not say how to reach it, as &apos;https:&apos; and &apos;file:&apos; do.</source>
        <translation>La dirección no indica cómo llegar a ella, como hacen «https:» y «file:».</translation>
    </message>
    <message>
        <source>The text is not encoded in UTF-8.</source>
        <translation>El texto no está codificado en UTF-8.</translation>
    </message>
    <message>
        <source>A control character or tab may not stand here.</source>
        <translation>Aquí no puede haber caracteres de control ni tabuladores.</translation>
    </message>
    <message>
        <source>The type has to be &apos;Application&apos;, &apos;Link&apos; or &apos;Directory&apos;, not &apos;%1&apos;.</source>
        <translation>El tipo tiene que ser «Application», «Link» o «Directory», no «%1».</translation>
    </message>
    <message>
        <source>There is no version &apos;%1&apos; of the standard.</source>
        <translation>La versión «%1» del estándar no existe.</translation>
    </message>
    <message>
        <source>There is no encoding &apos;%1&apos;.</source>
        <translation>La codificación «%1» no existe.</translation>
    </message>
    <message>
        <source>There is no picture &apos;%1&apos;.</source>
        <translation>La imagen «%1» no existe.</translation>
    </message>
    <message>
        <source>An icon has a name or a path that begins with &apos;/&apos;.</source>
        <translation>Un icono tiene un nombre o una ruta que empieza por «/».</translation>
    </message>
    <message>
        <source>The path of a folder begins with &apos;/&apos;.</source>
        <translation>La ruta de una carpeta empieza por «/».</translation>
    </message>
    <message>
        <source>There is no folder &apos;%1&apos;.</source>
        <translation>La carpeta «%1» no existe.</translation>
    </message>
    <message>
        <source>There is no file &apos;%1&apos;.</source>
        <translation>El archivo «%1» no existe.</translation>
    </message>
    <message>
        <source>D-Bus cannot start &apos;%1&apos;: a file of a name like &apos;org.example.Program.desktop&apos; is needed.</source>
        <translation>D-Bus no puede iniciar «%1»: hace falta un archivo con un nombre como «org.example.Program.desktop».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no name of an interface; such names are like &apos;org.example.Viewer&apos;.</source>
        <translation>«%1» no es el nombre de una interfaz; esos nombres son como «org.example.Viewer».</translation>
    </message>
</context>
<context>
    <name>EntryTrial</name>
    <message>
        <source>The entry could not be written to a temporary file.</source>
        <translation>No se ha podido escribir la entrada en un archivo temporal.</translation>
    </message>
</context>
<context>
    <name>KeyAssistance</name>
    <message>
        <source>Press the keys of the shortcut. Tab leaves the field.</source>
        <translation>Pulse las teclas del acceso rápido. Tab sale del campo.</translation>
    </message>
    <message>
        <source>Key for action &apos;%1&apos;</source>
        <translation>Tecla para la acción «%1»</translation>
    </message>
    <message>
        <source>None: no key for action &apos;%1&apos;</source>
        <translation>Ninguna: ningún acceso rápido para la acción «%1»</translation>
    </message>
    <message>
        <source>What speaks against the key for action &apos;%1&apos;</source>
        <translation>Lo que se opone al acceso rápido de la acción «%1»</translation>
    </message>
</context>
<context>
    <name>KeyDescription</name>
    <message>
        <source>Whether the entry starts a program, opens an address or describes a folder of the menu.</source>
        <translation>Si la entrada inicia un programa, abre una dirección o describe una carpeta del menú.</translation>
    </message>
    <message>
        <source>The name that menus show.</source>
        <translation>El nombre que muestran los menús.</translation>
    </message>
    <message>
        <source>The icon that menus show: a name from the icon theme, or the full path of a picture.</source>
        <translation>El icono que muestran los menús: un nombre del tema de iconos o la ruta completa de una imagen.</translation>
    </message>
    <message>
        <source>The command that starts the program, with codes such as %f for the files that it opens.</source>
        <translation>La orden que inicia el programa, con códigos como %f para los archivos que abre.</translation>
    </message>
    <message>
        <source>Whether the program needs a terminal window.</source>
        <translation>Si el programa necesita una ventana de terminal.</translation>
    </message>
    <message>
        <source>The folder in which the program starts.</source>
        <translation>La carpeta en la que se inicia el programa.</translation>
    </message>
    <message>
        <source>A program that has to be installed; without it menus leave the entry out.</source>
        <translation>Un programa que tiene que estar instalado; sin él, los menús omiten la entrada.</translation>
    </message>
    <message>
        <source>The address that the entry opens.</source>
        <translation>La dirección que abre la entrada.</translation>
    </message>
    <message>
        <source>What kind of program it is, such as: Web browser.</source>
        <translation>Qué clase de programa es, por ejemplo: Navegador web.</translation>
    </message>
    <message>
        <source>A sentence about the program, which menus show as a tip.</source>
        <translation>Una frase sobre el programa, que los menús muestran como sugerencia.</translation>
    </message>
    <message>
        <source>Whether menus leave the entry out although the program can be used.</source>
        <translation>Si los menús omiten la entrada aunque el programa se pueda usar.</translation>
    </message>
    <message>
        <source>Whether the entry counts as deleted.</source>
        <translation>Si la entrada se considera borrada.</translation>
    </message>
    <message>
        <source>The desktop environments that alone show the entry; none means all.</source>
        <translation>Los únicos entornos de escritorio que muestran la entrada; ninguno significa todos.</translation>
    </message>
    <message>
        <source>The desktop environments that do not show the entry.</source>
        <translation>Los entornos de escritorio que no muestran la entrada.</translation>
    </message>
    <message>
        <source>The types of files that the program opens.</source>
        <translation>Los tipos de archivos que abre el programa.</translation>
    </message>
    <message>
        <source>The groups of the menu that the program belongs to.</source>
        <translation>Los grupos del menú a los que pertenece el programa.</translation>
    </message>
    <message>
        <source>Words by which a search finds the program beside its name.</source>
        <translation>Palabras con las que una búsqueda encuentra el programa, además de por su nombre.</translation>
    </message>
    <message>
        <source>Whether the program tells when it has started, so that the pointer shows it until then.</source>
        <translation>Si el programa avisa de que se ha iniciado, para que el puntero lo indique hasta entonces.</translation>
    </message>
    <message>
        <source>The class of the window by which the desktop knows that the program has started.</source>
        <translation>La clase de la ventana por la que el escritorio sabe que el programa se ha iniciado.</translation>
    </message>
    <message>
        <source>Further things that the program can be started for, such as: New window.</source>
        <translation>Otras cosas para las que se puede iniciar el programa, por ejemplo: Ventana nueva.</translation>
    </message>
    <message>
        <source>The version of the standard for entries that this one follows.</source>
        <translation>La versión del estándar de entradas que sigue esta.</translation>
    </message>
    <message>
        <source>%1 Only for users of one language.</source>
        <comment>%1 is a sentence about a key</comment>
        <translation>%1 Solo para los usuarios de un idioma.</translation>
    </message>
</context>
<context>
    <name>LanguageNote</name>
    <message>
        <source>Users of %1 see these texts.</source>
        <translation>En %1 se ven estos textos.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those of %2 where one is missing.</source>
        <translation>En %1 se ven estos textos y, donde falta alguno, los de %2.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those without a language where one is missing.</source>
        <translation>En %1 se ven estos textos y, donde falta alguno, los que no tienen idioma.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts of %2.</source>
        <translation>En %1 se ven los textos de %2.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts without a language.</source>
        <translation>En %1 se ven los textos que no tienen idioma.</translation>
    </message>
    <message>
        <source>%1 Texts of their own have: %2.</source>
        <comment>%1 is a sentence, %2 a list of languages</comment>
        <translation>%1 Tienen textos propios: %2.</translation>
    </message>
</context>
<context>
    <name>MenuDeletion</name>
    <message>
        <source>There is no trash for %1. It would be deleted for good: this cannot be undone. Delete it?</source>
        <translation>No hay papelera para %1. Se borraría definitivamente: no se puede deshacer. ¿Desea borrarlo?</translation>
    </message>
    <message numerus="yes">
        <source>There is no trash for %n of these items. They would be deleted for good: this cannot be undone. Delete them?</source>
        <translation>
            <numerusform>No hay papelera para %n de estos elementos. Se borraría definitivamente: no se puede deshacer. ¿Desea borrarlo?</numerusform>
            <numerusform>No hay papelera para %n de estos elementos. Se borrarían definitivamente: no se puede deshacer. ¿Desea borrarlos?</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 cannot be deleted: %2</source>
        <translation>No se puede borrar %1: %2</translation>
    </message>
    <message numerus="yes">
        <source>The deletion was canceled. %n items are still there, in whole or in part.</source>
        <translation>
            <numerusform>Se ha cancelado el borrado. %n elemento sigue ahí, entero o en parte.</numerusform>
            <numerusform>Se ha cancelado el borrado. %n elementos siguen ahí, enteros o en parte.</numerusform>
        </translation>
    </message>
    <message>
        <source>The deletion was canceled. Still there, in whole or in part: %1.</source>
        <translation>Se ha cancelado el borrado. Siguen ahí, enteros o en parte: %1.</translation>
    </message>
</context>
<context>
    <name>MenuDrop</name>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;. Keep both gives the new one another file name, Replace puts the old one into the trash, Skip leaves the new one where it is; Cancel leaves everything as it is.</source>
        <translation>La carpeta «%1» ya contiene «%2». Conservar ambos da otro nombre de archivo al nuevo, Sustituir envía el antiguo a la papelera, Omitir deja el nuevo donde está; Cancelar deja todo como está.</translation>
    </message>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;, which the new one comes from. Keep both gives the new one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>La carpeta «%1» ya contiene «%2», del que procede el nuevo. Conservar ambos da otro nombre de archivo al nuevo, Omitir lo deja donde está; Cancelar deja todo como está.</translation>
    </message>
    <message>
        <source>Another one that comes to the folder &apos;%1&apos; has the same file name as &apos;%2&apos;. Keep both gives this one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>Otro de los que llegan a la carpeta «%1» tiene el mismo nombre de archivo que «%2». Conservar ambos da otro nombre de archivo a este, Omitir lo deja donde está; Cancelar deja todo como está.</translation>
    </message>
    <message>
        <source>Name already taken</source>
        <translation>El nombre ya existe</translation>
    </message>
    <message>
        <source>&amp;Keep both</source>
        <translation>&amp;Conservar ambos</translation>
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
        <source>&amp;Do the same with all further ones</source>
        <translation>&amp;Hacer lo mismo con todos los demás</translation>
    </message>
</context>
<context>
    <name>MenuHistory</name>
    <message>
        <source>Undo</source>
        <translation>Deshacer</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Rehacer</translation>
    </message>
    <message>
        <source>Done: %1</source>
        <translation>Hecho: %1</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Moviendo archivos...</translation>
    </message>
    <message>
        <source>Nothing was undone: %1</source>
        <translation>No se ha deshecho nada: %1</translation>
    </message>
    <message>
        <source>Nothing was done again: %1</source>
        <translation>No se ha rehecho nada: %1</translation>
    </message>
    <message>
        <source>%1 is not there any more.</source>
        <translation>%1 ya no está.</translation>
    </message>
    <message>
        <source>There is another %1 by now.</source>
        <translation>Ahora hay otro %1.</translation>
    </message>
    <message>
        <source>%1 was changed by another program.</source>
        <translation>Otro programa ha cambiado %1.</translation>
    </message>
    <message>
        <source>%1 is not in the trash any more.</source>
        <translation>%1 ya no está en la papelera.</translation>
    </message>
    <message>
        <source>%1 cannot be put into the trash.</source>
        <translation>No se puede enviar %1 a la papelera.</translation>
    </message>
    <message>
        <source>It was canceled.</source>
        <translation>Se ha cancelado.</translation>
    </message>
    <message>
        <source>%1 cannot be changed: %2</source>
        <translation>No se puede cambiar %1: %2</translation>
    </message>
    <message>
        <source>Undo creation of %1</source>
        <translation>Deshacer la creación de %1</translation>
    </message>
    <message>
        <source>Redo creation of %1</source>
        <translation>Rehacer la creación de %1</translation>
    </message>
    <message>
        <source>%1 was created.</source>
        <translation>Se ha creado %1.</translation>
    </message>
    <message>
        <source>Undo change of %1</source>
        <translation>Deshacer el cambio de %1</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Rehacer el cambio de %1</translation>
    </message>
    <message>
        <source>%1 was changed.</source>
        <translation>Se ha cambiado %1.</translation>
    </message>
    <message>
        <source>Undo deletion of %1</source>
        <translation>Deshacer el borrado de %1</translation>
    </message>
    <message>
        <source>Redo deletion of %1</source>
        <translation>Rehacer el borrado de %1</translation>
    </message>
    <message>
        <source>%1 was deleted.</source>
        <translation>Se ha borrado %1.</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Deshacer el borrado de la carpeta %1 (%n entrada)</numerusform>
            <numerusform>Deshacer el borrado de la carpeta %1 (%n entradas)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Rehacer el borrado de la carpeta %1 (%n entrada)</numerusform>
            <numerusform>Rehacer el borrado de la carpeta %1 (%n entradas)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The folder %1 was deleted (%n entries).</source>
        <translation>
            <numerusform>Se ha borrado la carpeta %1 (%n entrada).</numerusform>
            <numerusform>Se ha borrado la carpeta %1 (%n entradas).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %n items</source>
        <translation>
            <numerusform>Deshacer el borrado de %n elemento</numerusform>
            <numerusform>Deshacer el borrado de %n elementos</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %n items</source>
        <translation>
            <numerusform>Rehacer el borrado de %n elemento</numerusform>
            <numerusform>Rehacer el borrado de %n elementos</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were deleted.</source>
        <translation>
            <numerusform>Se ha borrado %n elemento.</numerusform>
            <numerusform>Se han borrado %n elementos.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo moving of %1 to %2</source>
        <translation>Deshacer el traslado de %1 a %2</translation>
    </message>
    <message>
        <source>Redo moving of %1 to %2</source>
        <translation>Rehacer el traslado de %1 a %2</translation>
    </message>
    <message>
        <source>%1 was moved to %2.</source>
        <translation>Se ha movido %1 a %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo moving of %n items to %2</source>
        <translation>
            <numerusform>Deshacer el traslado de %n elemento a %2</numerusform>
            <numerusform>Deshacer el traslado de %n elementos a %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo moving of %n items to %2</source>
        <translation>
            <numerusform>Rehacer el traslado de %n elemento a %2</numerusform>
            <numerusform>Rehacer el traslado de %n elementos a %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were moved to %2.</source>
        <translation>
            <numerusform>Se ha movido %n elemento a %2.</numerusform>
            <numerusform>Se han movido %n elementos a %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo copying of %1 to %2</source>
        <translation>Deshacer la copia de %1 en %2</translation>
    </message>
    <message>
        <source>Redo copying of %1 to %2</source>
        <translation>Rehacer la copia de %1 en %2</translation>
    </message>
    <message>
        <source>%1 was copied to %2.</source>
        <translation>Se ha copiado %1 en %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo copying of %n items to %2</source>
        <translation>
            <numerusform>Deshacer la copia de %n elemento en %2</numerusform>
            <numerusform>Deshacer la copia de %n elementos en %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo copying of %n items to %2</source>
        <translation>
            <numerusform>Rehacer la copia de %n elemento en %2</numerusform>
            <numerusform>Rehacer la copia de %n elementos en %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were copied to %2.</source>
        <translation>
            <numerusform>Se ha copiado %n elemento en %2.</numerusform>
            <numerusform>Se han copiado %n elementos en %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo reordering of %1</source>
        <translation>Deshacer la reordenación de %1</translation>
    </message>
    <message>
        <source>Redo reordering of %1</source>
        <translation>Rehacer la reordenación de %1</translation>
    </message>
    <message>
        <source>%1 has another place.</source>
        <translation>%1 está en otro lugar.</translation>
    </message>
    <message>
        <source>Undo default menu</source>
        <translation>Deshacer el menú predeterminado</translation>
    </message>
    <message>
        <source>Redo default menu</source>
        <translation>Rehacer el menú predeterminado</translation>
    </message>
    <message>
        <source>The default menu was built.</source>
        <translation>Se ha creado el menú predeterminado.</translation>
    </message>
    <message>
        <source>Undo hiding of %1</source>
        <translation>Deshacer la ocultación de %1</translation>
    </message>
    <message>
        <source>Redo hiding of %1</source>
        <translation>Rehacer la ocultación de %1</translation>
    </message>
    <message>
        <source>%1 is hidden: the menu no longer shows it.</source>
        <translation>%1 está oculto: el menú ya no lo muestra.</translation>
    </message>
    <message>
        <source>Undo showing %1 again</source>
        <translation>Deshacer la reaparición de %1</translation>
    </message>
    <message>
        <source>Redo showing %1 again</source>
        <translation>Rehacer la reaparición de %1</translation>
    </message>
    <message>
        <source>The menu shows %1 again.</source>
        <translation>El menú vuelve a mostrar %1.</translation>
    </message>
    <message>
        <source>Undo deletion of folder %1 (1 entry)</source>
        <translation>Deshacer el borrado de la carpeta %1 (1 entrada)</translation>
    </message>
    <message>
        <source>Redo deletion of folder %1 (1 entry)</source>
        <translation>Rehacer el borrado de la carpeta %1 (1 entrada)</translation>
    </message>
    <message>
        <source>The folder %1 was deleted (1 entry).</source>
        <translation>Se ha borrado la carpeta %1 (1 entrada).</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Deshacer el borrado de %1 elementos (%n entrada)</numerusform>
            <numerusform>Deshacer el borrado de %1 elementos (%n entradas)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Rehacer el borrado de %1 elementos (%n entrada)</numerusform>
            <numerusform>Rehacer el borrado de %1 elementos (%n entradas)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 items were deleted (%n entries).</source>
        <translation>
            <numerusform>Se han borrado %1 elementos (%n entrada).</numerusform>
            <numerusform>Se han borrado %1 elementos (%n entradas).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo reordering of %n items</source>
        <translation>
            <numerusform>Deshacer la reordenación de %n elemento</numerusform>
            <numerusform>Deshacer la reordenación de %n elementos</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo reordering of %n items</source>
        <translation>
            <numerusform>Rehacer la reordenación de %n elemento</numerusform>
            <numerusform>Rehacer la reordenación de %n elementos</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items have other places.</source>
        <translation>
            <numerusform>%n elemento está en otro lugar.</numerusform>
            <numerusform>%n elementos están en otros lugares.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo hiding of %n items</source>
        <translation>
            <numerusform>Deshacer la ocultación de %n elemento</numerusform>
            <numerusform>Deshacer la ocultación de %n elementos</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo hiding of %n items</source>
        <translation>
            <numerusform>Rehacer la ocultación de %n elemento</numerusform>
            <numerusform>Rehacer la ocultación de %n elementos</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items are hidden: the menu no longer shows them.</source>
        <translation>
            <numerusform>%n elemento está oculto: el menú ya no lo muestra.</numerusform>
            <numerusform>%n elementos están ocultos: el menú ya no los muestra.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo showing %n items again</source>
        <translation>
            <numerusform>Deshacer la reaparición de %n elemento</numerusform>
            <numerusform>Deshacer la reaparición de %n elementos</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo showing %n items again</source>
        <translation>
            <numerusform>Rehacer la reaparición de %n elemento</numerusform>
            <numerusform>Rehacer la reaparición de %n elementos</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The menu shows %n items again.</source>
        <translation>
            <numerusform>El menú vuelve a mostrar %n elemento.</numerusform>
            <numerusform>El menú vuelve a mostrar %n elementos.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo sorting of folder %1</source>
        <translation>Deshacer la ordenación de la carpeta %1</translation>
    </message>
    <message>
        <source>Redo sorting of folder %1</source>
        <translation>Rehacer la ordenación de la carpeta %1</translation>
    </message>
    <message>
        <source>The folder %1 was sorted by name.</source>
        <translation>Se ha ordenado por nombre la carpeta %1.</translation>
    </message>
    <message>
        <source>Undo duplication of %1</source>
        <translation>Deshacer la duplicación de %1</translation>
    </message>
    <message>
        <source>Redo duplication of %1</source>
        <translation>Rehacer la duplicación de %1</translation>
    </message>
    <message>
        <source>%1 was duplicated. The copy is selected.</source>
        <translation>Se ha duplicado %1. La copia está seleccionada.</translation>
    </message>
    <message numerus="yes">
        <source>Undo duplication of %n items</source>
        <translation>
            <numerusform>Deshacer la duplicación de %n elemento</numerusform>
            <numerusform>Deshacer la duplicación de %n elementos</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo duplication of %n items</source>
        <translation>
            <numerusform>Rehacer la duplicación de %n elemento</numerusform>
            <numerusform>Rehacer la duplicación de %n elementos</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were duplicated. The copies are selected.</source>
        <translation>
            <numerusform>Se ha duplicado %n elemento. La copia está seleccionada.</numerusform>
            <numerusform>Se han duplicado %n elementos. Las copias están seleccionadas.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo deletion of %1 items (1 entry)</source>
        <translation>Deshacer el borrado de %1 elementos (1 entrada)</translation>
    </message>
    <message>
        <source>Redo deletion of %1 items (1 entry)</source>
        <translation>Rehacer el borrado de %1 elementos (1 entrada)</translation>
    </message>
    <message>
        <source>%1 items were deleted (1 entry).</source>
        <translation>Se han borrado %1 elementos (1 entrada).</translation>
    </message>
</context>
<context>
    <name>QFileSystemModel</name>
    <message>
        <source>%1 does not exist.</source>
        <translation>%1 no existe.</translation>
    </message>
    <message>
        <source>%1 exists and was left as it is.</source>
        <translation>%1 ya existe y no se ha modificado.</translation>
    </message>
    <message>
        <source>%1 cannot be put into itself.</source>
        <translation>%1 no se puede colocar dentro de sí mismo.</translation>
    </message>
    <message>
        <source>%1 cannot be written.</source>
        <translation>No se puede escribir %1.</translation>
    </message>
    <message>
        <source>Can&apos;t move %1: %2</source>
        <translation>No se puede mover %1: %2</translation>
    </message>
    <message>
        <source>Can&apos;t copy %1: %2</source>
        <translation>No se puede copiar %1: %2</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Atención</translation>
    </message>
    <message>
        <source>%1 already exists. Overwrite?</source>
        <translation>%1 ya existe. ¿Desea sobrescribirlo?</translation>
    </message>
    <message>
        <source>Can&apos;t link %1: %2</source>
        <translation>No se puede enlazar %1: %2</translation>
    </message>
</context>
<context>
    <name>SchemeMenu</name>
    <message>
        <source>This is not a regular file.</source>
        <translation>No es un archivo normal.</translation>
    </message>
    <message>
        <source>Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <translation>Accesos rápidos tomados: %1, omitidos: %2. Aceptar los pone en vigor, Reiniciar los retira.</translation>
    </message>
    <message>
        <source>%3
Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <comment>%3: a sentence about lines that were skipped</comment>
        <translation>%3
Accesos rápidos tomados: %1, omitidos: %2. Aceptar los pone en vigor, Reiniciar los retira.</translation>
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
        <translation>Guardar la chuleta como &amp;HTML...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;text...</source>
        <translation>Guardar la chuleta como &amp;texto...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>&amp;Copiar la chuleta</translation>
    </message>
    <message>
        <source>Export keys</source>
        <translation>Exportar teclas</translation>
    </message>
    <message>
        <source>Keys (*.ini);;All files (*)</source>
        <translation>Teclas (*.ini);;Todos los archivos (*)</translation>
    </message>
    <message>
        <source>%1
Choose another folder or another name, and try again.</source>
        <translation>%1
Elija otra carpeta u otro nombre e inténtelo de nuevo.</translation>
    </message>
    <message>
        <source>Import keys</source>
        <translation>Importar teclas</translation>
    </message>
    <message>
        <source>%1
Choose a file that was written with &apos;Export keys...&apos;.</source>
        <translation>%1
Elija un archivo escrito con «Exportar teclas...».</translation>
    </message>
    <message>
        <source>HTML documents (*.html);;All files (*)</source>
        <translation>Documentos HTML (*.html);;Todos los archivos (*)</translation>
    </message>
    <message>
        <source>Plain text (*.txt);;All files (*)</source>
        <translation>Texto sin formato (*.txt);;Todos los archivos (*)</translation>
    </message>
    <message>
        <source>Save cheat sheet</source>
        <translation>Guardar la chuleta</translation>
    </message>
    <message>
        <source>The cheat sheet could not be saved to %1: %2
Choose another folder or another name, and try again.</source>
        <comment>%2: what the system says</comment>
        <translation>No se ha podido guardar la chuleta en %1: %2
Elija otra carpeta u otro nombre e inténtelo de nuevo.</translation>
    </message>
</context>
<context>
    <name>SchemeQuestion</name>
    <message>
        <source>Import keys</source>
        <translation>Importar teclas</translation>
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
        <source>&amp;Do the same with all further ones</source>
        <translation>&amp;Hacer lo mismo con todas las demás</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but the global action &apos;%3&apos; has it. Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>El archivo tiene el acceso rápido «%1» para la acción «%2», pero lo tiene la acción global «%3». Omitir deja la acción «%2» como está; Cancelar no toma nada.</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but action &apos;%3&apos; has it, too. Replace takes it away from action &apos;%3&apos;, Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>El archivo tiene el acceso rápido «%1» para la acción «%2», pero también lo tiene la acción «%3». Sustituir se lo quita a la acción «%3», Omitir deja la acción «%2» como está; Cancelar no toma nada.</translation>
    </message>
</context>
<context>
    <name>ShortcutClash</name>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;.</source>
        <translation>El acceso rápido «%1» ya se usa para la acción «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; of action &apos;%3&apos; begins with &apos;%1&apos;.</source>
        <translation>El acceso rápido «%2» de la acción «%3» empieza por «%1».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; begins with &apos;%1&apos;, the shortcut of action &apos;%3&apos;.</source>
        <translation>El acceso rápido «%2» empieza por «%1», el acceso rápido de la acción «%3».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; opens the menu &apos;%2&apos;.</source>
        <translation>El acceso rápido «%1» abre el menú «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; leads to &apos;%2&apos; in the window.</source>
        <translation>El acceso rápido «%1» lleva a «%2» en la ventana.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is the standard shortcut for &apos;%2&apos;.</source>
        <translation>El acceso rápido «%1» es el acceso rápido estándar de «%2».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>El acceso rápido «%1» ya se usa para la acción global «%2».</translation>
    </message>
    <message>
        <source>With &apos;%1&apos; as a shortcut this key cannot be typed into texts.</source>
        <translation>Con «%1» como acceso rápido, esta tecla no se puede escribir en los textos.</translation>
    </message>
    <message>
        <source>The current keyboard layout cannot produce &apos;%1&apos;.</source>
        <translation>La distribución de teclado actual no puede producir «%1».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is a further shortcut of action &apos;%2&apos;.</source>
        <translation>El acceso rápido «%1» es otro acceso rápido de la acción «%2».</translation>
    </message>
</context>
<context>
    <name>ShortcutDelegate</name>
    <message>
        <source>Back to no shortcut</source>
        <translation>Volver a ningún acceso rápido</translation>
    </message>
    <message>
        <source>Back to %1</source>
        <translation>Volver a %1</translation>
    </message>
</context>
<context>
    <name>ShortcutFilterBar</name>
    <message>
        <source>Press keys</source>
        <translation>Pulsar teclas</translation>
    </message>
    <message>
        <source>Changed only</source>
        <translation>Solo cambiados</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtro</translation>
    </message>
    <message>
        <source>Shows who has the keys that you press; Escape ends it.</source>
        <translation>Muestra quién tiene las teclas que pulsa; Escape lo termina.</translation>
    </message>
    <message>
        <source>Shows the actions alone whose shortcut is not the default one, or was edited.</source>
        <translation>Muestra solo las acciones cuyo acceso rápido no es el predeterminado o se ha editado.</translation>
    </message>
    <message>
        <source>Press the keys to look for</source>
        <translation>Pulse las teclas que busca</translation>
    </message>
    <message>
        <source>Filter by name, group or shortcut</source>
        <translation>Filtrar por nombre, grupo o acceso rápido</translation>
    </message>
</context>
<context>
    <name>ShortcutScheme</name>
    <message>
        <source>The shortcuts could not be saved to %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>No se pudieron guardar los accesos rápidos en %1: %2</translation>
    </message>
    <message>
        <source>The shortcuts could not be read from %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>No se pudieron leer los accesos rápidos de %1: %2</translation>
    </message>
    <message>
        <source>%1 is not a regular file.</source>
        <translation>%1 no es un archivo normal.</translation>
    </message>
    <message>
        <source>%1 is too large for a file of shortcuts.</source>
        <translation>%1 es demasiado grande para ser un archivo de accesos rápidos.</translation>
    </message>
    <message>
        <source>%1 holds no shortcuts.</source>
        <translation>%1 no contiene accesos rápidos.</translation>
    </message>
    <message>
        <source>Unreadable shortcuts in %1 were skipped: %2</source>
        <comment>%2: their number</comment>
        <translation>Se omitieron accesos rápidos ilegibles de %1: %2</translation>
    </message>
</context>
<context>
    <name>ShortcutSheet</name>
    <message>
        <source>Keyboard shortcuts</source>
        <comment>title of a printed sheet</comment>
        <translation>Accesos rápidos de teclado</translation>
    </message>
</context>
<context>
    <name>ShortcutsModel</name>
    <message>
        <source>Action</source>
        <translation>Acción</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Acceso rápido</translation>
    </message>
    <message>
        <source>%1, changed</source>
        <comment>%1: an action or a key</comment>
        <translation>%1, cambiado</translation>
    </message>
    <message>
        <source>No shortcut</source>
        <translation>Ningún acceso rápido</translation>
    </message>
    <message>
        <source>There is no default shortcut.</source>
        <translation>No hay acceso rápido predeterminado.</translation>
    </message>
    <message>
        <source>The default shortcut is %1.</source>
        <translation>El acceso rápido predeterminado es %1.</translation>
    </message>
</context>
<context>
    <name>StandardKeyNames</name>
    <message>
        <source>Help</source>
        <translation>Ayuda</translation>
    </message>
    <message>
        <source>What&apos;s this?</source>
        <translation>¿Qué es esto?</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Abrir</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Cerrar</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Guardar</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>Guardar como</translation>
    </message>
    <message>
        <source>New</source>
        <translation>Nuevo</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Cortar</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copiar</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Pegar</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Deshacer</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Rehacer</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Atrás</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Adelante</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Actualizar</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Ampliar</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Reducir</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Imprimir</translation>
    </message>
    <message>
        <source>New tab</source>
        <translation>Nueva pestaña</translation>
    </message>
    <message>
        <source>Next tab</source>
        <translation>Pestaña siguiente</translation>
    </message>
    <message>
        <source>Previous tab</source>
        <translation>Pestaña anterior</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Buscar</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Buscar siguiente</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Buscar anterior</translation>
    </message>
    <message>
        <source>Replace</source>
        <translation>Sustituir</translation>
    </message>
    <message>
        <source>Select all</source>
        <translation>Seleccionar todo</translation>
    </message>
    <message>
        <source>Deselect</source>
        <translation>Deseleccionar</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Pantalla completa</translation>
    </message>
    <message>
        <source>Preferences</source>
        <translation>Preferencias</translation>
    </message>
    <message>
        <source>Quit</source>
        <translation>Salir</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Negrita</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Cursiva</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Subrayado</translation>
    </message>
    <message>
        <source>Move the cursor</source>
        <translation>Mover el cursor</translation>
    </message>
    <message>
        <source>Select text</source>
        <translation>Seleccionar texto</translation>
    </message>
    <message>
        <source>Edit text</source>
        <translation>Editar texto</translation>
    </message>
</context>
<context>
    <name>StringListEdit</name>
    <message>
        <source>Form</source>
        <translation>Formulario</translation>
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
        <translation>&amp;Restablecer este acceso rápido</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryEditDialog</name>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>no executable</source>
        <translation>falta el ejecutable</translation>
    </message>
    <message>
        <source>can&apos;t find executable</source>
        <translation>no se encuentra el ejecutable</translation>
    </message>
    <message>
        <source>can&apos;t find try executable</source>
        <translation>no se encuentra el ejecutable de comprobación</translation>
    </message>
    <message>
        <source>can&apos;t find URL</source>
        <translation>no se encuentra la URL</translation>
    </message>
    <message>
        <source>wrong/incomplete desktop entry</source>
        <translation>entrada de escritorio errónea o incompleta</translation>
    </message>
    <message>
        <source>Can&apos;t save position on desktop for %1</source>
        <translation>No se puede guardar la posición de %1 en el escritorio</translation>
    </message>
    <message>
        <source>Copy from...</source>
        <translation>Copiar de...</translation>
    </message>
    <message>
        <source>Can&apos;t load file %1</source>
        <translation>No se puede cargar el archivo %1</translation>
    </message>
    <message>
        <source>Desktop Entry Editor</source>
        <translation>Editor de entradas de escritorio</translation>
    </message>
    <message>
        <source>You create hidden desktop entry</source>
        <translation>Está creando una entrada de escritorio oculta</translation>
    </message>
    <message>
        <source>Can&apos;t save file %1</source>
        <translation>No se puede guardar el archivo %1</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Ayuda</translation>
    </message>
    <message>
        <source>&lt;b&gt;Desktop entry&lt;/b&gt; is a multipurpose info file for installed apps, devices, etc. It can be used to build menu entries, shortcuts, etc. This dialog implements the &apos;Desktop Entry Standard&apos; of &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Desktop entry file is a text ini-like file with one main section [Desktop Entry] and possible additional sections for each action defined in the main section field &apos;Actions&apos;. All fields are text string pairs: key=value. Value can also be a semicolon separated string list.</source>
        <translation>Una &lt;b&gt;entrada de escritorio&lt;/b&gt; es un archivo de información de uso múltiple para aplicaciones instaladas, dispositivos, etc. Se puede usar para construir elementos de menú, accesos directos, etc. Este diálogo implementa el «Desktop Entry Standard» de &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;El archivo de una entrada de escritorio es un archivo de texto de estilo INI con una sección principal [Desktop Entry] y posibles secciones adicionales para cada acción definida en el campo «Actions» de la sección principal. Todos los campos son pares de cadenas de texto: clave=valor. El valor también puede ser una lista de cadenas separadas por puntos y comas.</translation>
    </message>
    <message>
        <source>The file %1 is not a desktop entry: it has no group [Desktop Entry].</source>
        <translation>El archivo %1 no es una entrada de escritorio: no tiene ningún grupo [Desktop Entry].</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryPropsWidgetPrivate</name>
    <message>
        <source>Information about the URL</source>
        <translation>Información sobre la URL</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Mostrar solo en</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>No mostrar en</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Añadir entorno de escritorio:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Editar entorno de escritorio:</translation>
    </message>
    <message>
        <source>MIME type or file name extension:</source>
        <translation>Tipo MIME o extensión del nombre de archivo:</translation>
    </message>
    <message>
        <source>MIME type</source>
        <translation>Tipo MIME</translation>
    </message>
    <message>
        <source>Add MIME type</source>
        <translation>Añadir tipo MIME</translation>
    </message>
    <message>
        <source>Edit MIME type</source>
        <translation>Editar tipo MIME</translation>
    </message>
    <message>
        <source>Categories</source>
        <translation>Categorías</translation>
    </message>
    <message>
        <source>Add category</source>
        <translation>Añadir categoría</translation>
    </message>
    <message>
        <source>Category:</source>
        <translation>Categoría:</translation>
    </message>
    <message>
        <source>Edit category</source>
        <translation>Editar categoría</translation>
    </message>
    <message>
        <source>Keywords</source>
        <translation>Palabras clave</translation>
    </message>
    <message>
        <source>Add keyword</source>
        <translation>Añadir palabra clave</translation>
    </message>
    <message>
        <source>Keyword:</source>
        <translation>Palabra clave:</translation>
    </message>
    <message>
        <source>Edit keyword</source>
        <translation>Editar palabra clave</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Acciones</translation>
    </message>
    <message>
        <source>Add action</source>
        <translation>Añadir acción</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Editar acción</translation>
    </message>
    <message>
        <source>Application</source>
        <translation>Aplicación</translation>
    </message>
    <message>
        <source>Link</source>
        <translation>Enlace</translation>
    </message>
    <message>
        <source>Directory</source>
        <translation>Carpeta</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Atención</translation>
    </message>
    <message>
        <source>Desktop entry type was changed.
Some field values may be lost...
Continue?</source>
        <translation>Se ha cambiado el tipo de la entrada de escritorio.
Se pueden perder los valores de algunos campos...
¿Continuar?</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>Tipo</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nombre</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Icono</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Orden</translation>
    </message>
    <message>
        <source>Terminal</source>
        <translation>Terminal</translation>
    </message>
    <message>
        <source>Path</source>
        <translation>Ruta de trabajo</translation>
    </message>
    <message>
        <source>Try exec</source>
        <translation>Orden de comprobación</translation>
    </message>
    <message>
        <source>Url</source>
        <translation>URL</translation>
    </message>
    <message>
        <source>Generic name</source>
        <translation>Nombre genérico</translation>
    </message>
    <message>
        <source>Comment</source>
        <translation>Comentario</translation>
    </message>
    <message>
        <source>No display</source>
        <translation>No mostrar</translation>
    </message>
    <message>
        <source>Hidden</source>
        <translation>Oculto</translation>
    </message>
    <message>
        <source>Startup notify</source>
        <translation>Notificación de lanzamiento</translation>
    </message>
    <message>
        <source>Startup WM class</source>
        <translation>Clase de ventana al iniciar</translation>
    </message>
    <message>
        <source>Version</source>
        <translation>Versión</translation>
    </message>
</context>
<context>
    <name>VelMenuDialog</name>
    <message>
        <source>Edit</source>
        <translation>Editar</translation>
    </message>
    <message>
        <source>Send command to vel-wm to update
 edited menu, toolbar, etc.</source>
        <translation>Enviar a vel-wm la orden de actualizar
 el menú, la barra de herramientas, etc. editados</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>Can&apos;t send command to vel-wm</source>
        <translation>No se puede enviar la orden a vel-wm</translation>
    </message>
    <message>
        <source>This menu cannot be changed: the folder %1 does not exist.</source>
        <translation>Este menú no se puede cambiar: la carpeta %1 no existe.</translation>
    </message>
    <message>
        <source>This menu cannot be changed: you may not write to the folder %1.</source>
        <translation>Este menú no se puede cambiar: no puede escribir en la carpeta %1.</translation>
    </message>
    <message>
        <source>Show hidden</source>
        <translation>Mostrar ocultos</translation>
    </message>
    <message>
        <source>Filter by name, command or keyword</source>
        <translation>Filtrar por nombre, orden o palabra clave</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtro</translation>
    </message>
    <message>
        <source>Also show the entries that the menu leaves out</source>
        <translation>Mostrar también las entradas que el menú omite</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Deshacer</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>Start menu</source>
        <translation>Menú de inicio</translation>
    </message>
</context>
<context>
    <name>VelMenuView</name>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>Can&apos;t start:
%1 %2</source>
        <translation>No se puede iniciar:
%1 %2</translation>
    </message>
    <message>
        <source>All previous shortcuts
will be lost. Are you sure?</source>
        <translation>Se perderán todos los accesos directos
anteriores. ¿Está seguro?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Editar</translation>
    </message>
    <message>
        <source>New folder</source>
        <translation>Nueva carpeta</translation>
    </message>
    <message>
        <source>New entry</source>
        <translation>Nueva entrada</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Borrar</translation>
    </message>
    <message>
        <source>Execute</source>
        <translation>Ejecutar</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Buscar</translation>
    </message>
    <message>
        <source>Find Next</source>
        <translation>Buscar siguiente</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Cortar</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copiar</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Pegar</translation>
    </message>
    <message>
        <source>Default menu...</source>
        <translation>Menú predeterminado...</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Subir</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Bajar</translation>
    </message>
    <message>
        <source>Move</source>
        <translation>Mover</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Grupo</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Acceso directo</translation>
    </message>
    <message>
        <source>Can&apos;t edit non desktop file</source>
        <translation>No se puede editar un archivo que no es de tipo «desktop»</translation>
    </message>
    <message>
        <source>Desktop Entry %1</source>
        <translation>Entrada de escritorio %1</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Atención</translation>
    </message>
    <message>
        <source>Are you sure to delete it?</source>
        <translation>¿Seguro que desea borrarlo?</translation>
    </message>
    <message>
        <source>Find string:</source>
        <translation>Buscar cadena:</translation>
    </message>
    <message>
        <source>&apos;%1&apos; not found .</source>
        <translation>No se ha encontrado «%1».</translation>
    </message>
    <message>
        <source>Not in the menu: it is not meant for this desktop.</source>
        <translation>No está en el menú: no es para este escritorio.</translation>
    </message>
    <message>
        <source>Not in the menu: it is meant for other desktops only (%1).</source>
        <translation>No está en el menú: solo es para otros escritorios (%1).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked as deleted (Hidden).</source>
        <translation>No está en el menú: está marcada como borrada (Hidden).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked not to be displayed (NoDisplay).</source>
        <translation>No está en el menú: está marcada para no mostrarse (NoDisplay).</translation>
    </message>
    <message>
        <source>Not in the menu: the program %1 is not installed (TryExec).</source>
        <translation>No está en el menú: el programa %1 no está instalado (TryExec).</translation>
    </message>
    <message>
        <source>This file is not a desktop entry, whatever its name says.</source>
        <translation>Este archivo no es una entrada de escritorio, diga lo que diga su nombre.</translation>
    </message>
    <message>
        <source>This file cannot be read.</source>
        <translation>Este archivo no se puede leer.</translation>
    </message>
    <message>
        <source>This entry has no name. The name of its file is shown.</source>
        <translation>Esta entrada no tiene nombre. Se muestra el nombre de su archivo.</translation>
    </message>
    <message>
        <source>Taking back what was done...</source>
        <translation>Deshaciendo lo hecho...</translation>
    </message>
    <message>
        <source>The program that holds the clipboard does not answer. Nothing was pasted.</source>
        <translation>El programa que tiene el portapapeles no responde. No se ha pegado nada.</translation>
    </message>
    <message>
        <source>Nothing can be created in %1, because there is no such folder.</source>
        <translation>No se puede crear nada en %1, porque no existe esa carpeta.</translation>
    </message>
    <message>
        <source>%1 could not be saved. Make sure that the folder %2 may be written and that the disk is not full, then try again.</source>
        <translation>No se ha podido guardar %1. Asegúrese de que se pueda escribir en la carpeta %2 y de que el disco no esté lleno, e inténtelo de nuevo.</translation>
    </message>
    <message>
        <source>%1 could not be deleted: %2. Make sure that the folder that holds it may be written, then try again.</source>
        <translation>No se ha podido borrar %1: %2. Asegúrese de que se pueda escribir en la carpeta que lo contiene e inténtelo de nuevo.</translation>
    </message>
    <message>
        <source>%1 was deleted in part only, because %2 could not be deleted: %3. Make sure that its folder may be written, then delete the rest.</source>
        <translation>%1 se ha borrado solo en parte, porque no se ha podido borrar %2: %3. Asegúrese de que se pueda escribir en su carpeta y borre después el resto.</translation>
    </message>
    <message>
        <source>Nothing in this menu matches &apos;%1&apos;.</source>
        <translation>Nada de este menú coincide con «%1».</translation>
    </message>
    <message>
        <source>Searching the menu for &apos;%1&apos;...</source>
        <translation>Buscando «%1» en el menú...</translation>
    </message>
    <message>
        <source>The menu is too large to be searched as a whole. Only a part of it was searched.</source>
        <translation>El menú es demasiado grande para buscar en todo él. Solo se ha buscado en una parte.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; was not changed: the file %2 cannot be written.</source>
        <translation>«%1» no se ha cambiado: no se puede escribir en el archivo %2.</translation>
    </message>
    <message>
        <source>The order of the folder %1 could not be saved. Make sure that the folder may be written and that the disk is not full, then try again.</source>
        <translation>No se ha podido guardar el orden de la carpeta %1. Asegúrese de que se pueda escribir en la carpeta y de que el disco no esté lleno, e inténtelo de nuevo.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1. The menu was left as it is.</source>
        <translation>No se ha podido crear el menú predeterminado en %1. El menú se ha dejado como estaba.</translation>
    </message>
    <message>
        <source>Menu</source>
        <comment>the tree</comment>
        <translation>Menú</translation>
    </message>
    <message>
        <source>%1 cannot be edited, because the folder %2 may not be written.</source>
        <translation>%1 no se puede editar, porque no se puede escribir en la carpeta %2.</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Moviendo archivos...</translation>
    </message>
    <message>
        <source>Copying files...</source>
        <translation>Copiando archivos...</translation>
    </message>
    <message>
        <source>Deleting files...</source>
        <translation>Borrando archivos...</translation>
    </message>
    <message>
        <source>The deletion of %1 was canceled. What was not yet deleted is still there.</source>
        <translation>Se ha cancelado el borrado de %1. Lo que aún no se había borrado sigue ahí.</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Este menú está vacío. Pulse %1 para una entrada nueva, o haga clic aquí con el botón derecho para ver qué más se puede añadir.</translation>
    </message>
    <message>
        <source>the program %1 ended with an error</source>
        <translation>el programa %1 ha terminado con un error</translation>
    </message>
    <message>
        <source>the program %1 cannot be run</source>
        <translation>no se puede ejecutar el programa %1</translation>
    </message>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>Y %n más.</numerusform>
            <numerusform>Y %n más.</numerusform>
        </translation>
    </message>
    <message>
        <source>Open containin&amp;g folder</source>
        <translation>Abrir la carpeta &amp;que lo contiene</translation>
    </message>
    <message>
        <source>The folder %1 was not opened: %2.</source>
        <translation>No se ha abierto la carpeta %1: %2.</translation>
    </message>
    <message>
        <source>New &amp;folder</source>
        <translation>Nue&amp;va carpeta</translation>
    </message>
    <message>
        <source>New entr&amp;y</source>
        <translation>&amp;Nueva entrada</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Editar</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Borrar</translation>
    </message>
    <message>
        <source>E&amp;xecute</source>
        <translation>E&amp;jecutar</translation>
    </message>
    <message>
        <source>F&amp;ind</source>
        <translation>B&amp;uscar</translation>
    </message>
    <message>
        <source>Find &amp;Next</source>
        <translation>Buscar s&amp;iguiente</translation>
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
        <source>Default &amp;menu...</source>
        <translation>&amp;Menú predeterminado...</translation>
    </message>
    <message>
        <source>&amp;Up</source>
        <translation>&amp;Subir</translation>
    </message>
    <message>
        <source>D&amp;own</source>
        <translation>B&amp;ajar</translation>
    </message>
    <message>
        <source>Dup&amp;licate</source>
        <translation>&amp;Duplicar</translation>
    </message>
    <message>
        <source>&amp;Hide</source>
        <translation>&amp;Ocultar</translation>
    </message>
    <message>
        <source>Sho&amp;w again</source>
        <translation>Vo&amp;lver a mostrar</translation>
    </message>
    <message>
        <source>&amp;Reload</source>
        <translation>Recar&amp;gar</translation>
    </message>
    <message>
        <source>&amp;Sort by name</source>
        <translation>O&amp;rdenar por nombre</translation>
    </message>
    <message>
        <source>The folder %1 is sorted by name already.</source>
        <translation>La carpeta %1 ya está ordenada por nombre.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1, because no application is installed. The menu was left as it is.</source>
        <translation>No se ha podido crear el menú predeterminado en %1, porque no hay ninguna aplicación instalada. El menú se ha dejado como estaba.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1: %2. The menu was left as it is.</source>
        <translation>No se ha podido crear el menú predeterminado en %1: %2. El menú se ha dejado como estaba.</translation>
    </message>
    <message>
        <source>%1 is no file on this computer. Nothing was moved or copied.</source>
        <translation>%1 no es un archivo de este equipo. No se ha movido ni copiado nada.</translation>
    </message>
    <message>
        <source>%1 was not started: %2.</source>
        <translation>No se ha iniciado %1: %2.</translation>
    </message>
    <message>
        <source>This menu is empty. Right-click here and choose &apos;%2&apos; to fill it with the applications that are installed, or press %1 for a new entry.</source>
        <translation>Este menú está vacío. Haga clic aquí con el botón derecho y elija «%2» para llenarlo con las aplicaciones instaladas, o pulse %1 para una entrada nueva.</translation>
    </message>
    <message>
        <source>This menu is empty, because no application was found that is installed. Once there is one, right-click here and choose &apos;%2&apos;. Until then, press %1 for an entry of your own.</source>
        <translation>Este menú está vacío, porque no se ha encontrado ninguna aplicación instalada. Cuando haya alguna, haga clic aquí con el botón derecho y elija «%2». Mientras tanto, pulse %1 para una entrada propia.</translation>
    </message>
</context>
<context>
    <name>VelUI::ActionPropsDialog</name>
    <message>
        <source>Id</source>
        <translation>Identificador</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nombre</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Icono</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Orden</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Mostrar solo en</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Añadir entorno de escritorio:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Editar entorno de escritorio:</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>No mostrar en</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryChooser</name>
    <message>
        <source>Main category</source>
        <translation>Categoría principal</translation>
    </message>
    <message>
        <source>Goes with %1</source>
        <translation>Va con %1</translation>
    </message>
    <message>
        <source>Only beside &quot;Only show in&quot;</source>
        <translation>Solo junto con «Mostrar solo en»</translation>
    </message>
    <message>
        <source>Deprecated</source>
        <translation>Obsoleta</translation>
    </message>
    <message>
        <source>Extension</source>
        <comment>a category of somebody&apos;s own, X-...</comment>
        <translation>Extensión</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>No registrada</translation>
    </message>
    <message>
        <source>Choose categories</source>
        <translation>Elegir categorías</translation>
    </message>
    <message>
        <source>Name</source>
        <comment>title of a column</comment>
        <translation>Nombre</translation>
    </message>
    <message>
        <source>Category</source>
        <comment>title of a column</comment>
        <translation>Categoría</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Observación</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryNames</name>
    <message>
        <source>Audio and video</source>
        <translation>Sonido y vídeo</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>Sonido</translation>
    </message>
    <message>
        <source>Video</source>
        <translation>Vídeo</translation>
    </message>
    <message>
        <source>Software development</source>
        <translation>Desarrollo de software</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>Educación</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>Juegos</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>Gráficos</translation>
    </message>
    <message>
        <source>Internet and network</source>
        <translation>Internet y red</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>Oficina</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>Ciencia</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Preferencias</translation>
    </message>
    <message>
        <source>System tools</source>
        <translation>Herramientas del sistema</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Accesorios</translation>
    </message>
    <message>
        <source>Build tools</source>
        <translation>Herramientas de compilación</translation>
    </message>
    <message>
        <source>Debuggers</source>
        <translation>Depuradores</translation>
    </message>
    <message>
        <source>Development environments</source>
        <translation>Entornos de desarrollo</translation>
    </message>
    <message>
        <source>Designers of user interfaces</source>
        <translation>Diseñadores de interfaces de usuario</translation>
    </message>
    <message>
        <source>Profilers</source>
        <translation>Analizadores de rendimiento</translation>
    </message>
    <message>
        <source>Revision control</source>
        <translation>Control de versiones</translation>
    </message>
    <message>
        <source>Translation tools</source>
        <translation>Herramientas de traducción</translation>
    </message>
    <message>
        <source>Calendars</source>
        <translation>Calendarios</translation>
    </message>
    <message>
        <source>Address books</source>
        <translation>Libretas de direcciones</translation>
    </message>
    <message>
        <source>Databases</source>
        <translation>Bases de datos</translation>
    </message>
    <message>
        <source>Dictionaries</source>
        <translation>Diccionarios</translation>
    </message>
    <message>
        <source>Charts</source>
        <translation>Diagramas</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>Correo electrónico</translation>
    </message>
    <message>
        <source>Finances</source>
        <translation>Finanzas</translation>
    </message>
    <message>
        <source>Flow charts</source>
        <translation>Diagramas de flujo</translation>
    </message>
    <message>
        <source>Handheld devices</source>
        <translation>Dispositivos de mano</translation>
    </message>
    <message>
        <source>Project management</source>
        <translation>Gestión de proyectos</translation>
    </message>
    <message>
        <source>Presentations</source>
        <translation>Presentaciones</translation>
    </message>
    <message>
        <source>Spreadsheets</source>
        <translation>Hojas de cálculo</translation>
    </message>
    <message>
        <source>Word processors</source>
        <translation>Procesadores de texto</translation>
    </message>
    <message>
        <source>Two-dimensional graphics</source>
        <translation>Gráficos bidimensionales</translation>
    </message>
    <message>
        <source>Vector graphics</source>
        <translation>Gráficos vectoriales</translation>
    </message>
    <message>
        <source>Raster graphics</source>
        <translation>Gráficos de mapa de bits</translation>
    </message>
    <message>
        <source>Three-dimensional graphics</source>
        <translation>Gráficos tridimensionales</translation>
    </message>
    <message>
        <source>Scanning</source>
        <translation>Digitalización</translation>
    </message>
    <message>
        <source>Text recognition</source>
        <translation>Reconocimiento de texto</translation>
    </message>
    <message>
        <source>Photography</source>
        <translation>Fotografía</translation>
    </message>
    <message>
        <source>Desktop publishing</source>
        <translation>Autoedición</translation>
    </message>
    <message>
        <source>Viewers</source>
        <translation>Visores</translation>
    </message>
    <message>
        <source>Text tools</source>
        <translation>Herramientas de texto</translation>
    </message>
    <message>
        <source>Desktop settings</source>
        <translation>Preferencias del escritorio</translation>
    </message>
    <message>
        <source>Hardware settings</source>
        <translation>Preferencias del hardware</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>Impresión</translation>
    </message>
    <message>
        <source>Package managers</source>
        <translation>Gestores de paquetes</translation>
    </message>
    <message>
        <source>Dial-up connections</source>
        <translation>Conexiones por módem</translation>
    </message>
    <message>
        <source>Instant messaging</source>
        <translation>Mensajería instantánea</translation>
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
        <translation>Canales de noticias</translation>
    </message>
    <message>
        <source>File transfer</source>
        <translation>Transferencia de archivos</translation>
    </message>
    <message>
        <source>Amateur radio</source>
        <translation>Radioafición</translation>
    </message>
    <message>
        <source>Newsgroups</source>
        <translation>Grupos de noticias</translation>
    </message>
    <message>
        <source>File sharing</source>
        <translation>Intercambio de archivos</translation>
    </message>
    <message>
        <source>Remote access</source>
        <translation>Acceso remoto</translation>
    </message>
    <message>
        <source>Telephony</source>
        <translation>Telefonía</translation>
    </message>
    <message>
        <source>Telephony tools</source>
        <translation>Herramientas de telefonía</translation>
    </message>
    <message>
        <source>Video conferences</source>
        <translation>Videoconferencias</translation>
    </message>
    <message>
        <source>Web browsers</source>
        <translation>Navegadores web</translation>
    </message>
    <message>
        <source>Web development</source>
        <translation>Desarrollo web</translation>
    </message>
    <message>
        <source>MIDI</source>
        <translation>MIDI</translation>
    </message>
    <message>
        <source>Mixers</source>
        <translation>Mezcladores</translation>
    </message>
    <message>
        <source>Sequencers</source>
        <translation>Secuenciadores</translation>
    </message>
    <message>
        <source>Tuners</source>
        <translation>Afinadores</translation>
    </message>
    <message>
        <source>Television</source>
        <translation>Televisión</translation>
    </message>
    <message>
        <source>Audio and video editing</source>
        <translation>Edición de sonido y vídeo</translation>
    </message>
    <message>
        <source>Players</source>
        <translation>Reproductores</translation>
    </message>
    <message>
        <source>Recorders</source>
        <translation>Grabadores</translation>
    </message>
    <message>
        <source>Disc burning</source>
        <translation>Grabación de discos</translation>
    </message>
    <message>
        <source>Action games</source>
        <translation>Juegos de acción</translation>
    </message>
    <message>
        <source>Adventure games</source>
        <translation>Juegos de aventuras</translation>
    </message>
    <message>
        <source>Arcade games</source>
        <translation>Juegos recreativos</translation>
    </message>
    <message>
        <source>Board games</source>
        <translation>Juegos de mesa</translation>
    </message>
    <message>
        <source>Falling blocks games</source>
        <translation>Juegos de bloques</translation>
    </message>
    <message>
        <source>Card games</source>
        <translation>Juegos de cartas</translation>
    </message>
    <message>
        <source>Games for children</source>
        <translation>Juegos infantiles</translation>
    </message>
    <message>
        <source>Logic games</source>
        <translation>Juegos de lógica</translation>
    </message>
    <message>
        <source>Role-playing games</source>
        <translation>Juegos de rol</translation>
    </message>
    <message>
        <source>Shooters</source>
        <translation>Juegos de disparos</translation>
    </message>
    <message>
        <source>Simulations</source>
        <translation>Simuladores</translation>
    </message>
    <message>
        <source>Sports games</source>
        <translation>Juegos de deportes</translation>
    </message>
    <message>
        <source>Strategy games</source>
        <translation>Juegos de estrategia</translation>
    </message>
    <message>
        <source>Art</source>
        <translation>Arte</translation>
    </message>
    <message>
        <source>Construction</source>
        <translation>Construcción</translation>
    </message>
    <message>
        <source>Music</source>
        <translation>Música</translation>
    </message>
    <message>
        <source>Languages</source>
        <translation>Idiomas</translation>
    </message>
    <message>
        <source>Artificial intelligence</source>
        <translation>Inteligencia artificial</translation>
    </message>
    <message>
        <source>Astronomy</source>
        <translation>Astronomía</translation>
    </message>
    <message>
        <source>Biology</source>
        <translation>Biología</translation>
    </message>
    <message>
        <source>Chemistry</source>
        <translation>Química</translation>
    </message>
    <message>
        <source>Computer science</source>
        <translation>Informática</translation>
    </message>
    <message>
        <source>Data visualization</source>
        <translation>Visualización de datos</translation>
    </message>
    <message>
        <source>Economics</source>
        <translation>Economía</translation>
    </message>
    <message>
        <source>Electricity</source>
        <translation>Electricidad</translation>
    </message>
    <message>
        <source>Geography</source>
        <translation>Geografía</translation>
    </message>
    <message>
        <source>Geology</source>
        <translation>Geología</translation>
    </message>
    <message>
        <source>Earth sciences</source>
        <translation>Ciencias de la Tierra</translation>
    </message>
    <message>
        <source>History</source>
        <translation>Historia</translation>
    </message>
    <message>
        <source>Humanities</source>
        <translation>Humanidades</translation>
    </message>
    <message>
        <source>Image processing</source>
        <translation>Procesamiento de imágenes</translation>
    </message>
    <message>
        <source>Literature</source>
        <translation>Literatura</translation>
    </message>
    <message>
        <source>Maps</source>
        <translation>Mapas</translation>
    </message>
    <message>
        <source>Mathematics</source>
        <translation>Matemáticas</translation>
    </message>
    <message>
        <source>Numerical analysis</source>
        <translation>Análisis numérico</translation>
    </message>
    <message>
        <source>Medicine</source>
        <translation>Medicina</translation>
    </message>
    <message>
        <source>Physics</source>
        <translation>Física</translation>
    </message>
    <message>
        <source>Robotics</source>
        <translation>Robótica</translation>
    </message>
    <message>
        <source>Spirituality</source>
        <translation>Espiritualidad</translation>
    </message>
    <message>
        <source>Sports</source>
        <translation>Deportes</translation>
    </message>
    <message>
        <source>Parallel computing</source>
        <translation>Computación en paralelo</translation>
    </message>
    <message>
        <source>Amusement</source>
        <translation>Entretenimiento</translation>
    </message>
    <message>
        <source>Archiving</source>
        <translation>Archivado</translation>
    </message>
    <message>
        <source>Compression</source>
        <translation>Compresión</translation>
    </message>
    <message>
        <source>Electronics</source>
        <translation>Electrónica</translation>
    </message>
    <message>
        <source>Emulators</source>
        <translation>Emuladores</translation>
    </message>
    <message>
        <source>Engineering</source>
        <translation>Ingeniería</translation>
    </message>
    <message>
        <source>File tools</source>
        <translation>Herramientas de archivos</translation>
    </message>
    <message>
        <source>File managers</source>
        <translation>Gestores de archivos</translation>
    </message>
    <message>
        <source>Terminals</source>
        <translation>Terminales</translation>
    </message>
    <message>
        <source>File systems</source>
        <translation>Sistemas de archivos</translation>
    </message>
    <message>
        <source>Monitors</source>
        <translation>Monitores del sistema</translation>
    </message>
    <message>
        <source>Security</source>
        <translation>Seguridad</translation>
    </message>
    <message>
        <source>Accessibility</source>
        <translation>Accesibilidad</translation>
    </message>
    <message>
        <source>Calculators</source>
        <translation>Calculadoras</translation>
    </message>
    <message>
        <source>Clocks</source>
        <translation>Relojes</translation>
    </message>
    <message>
        <source>Text editors</source>
        <translation>Editores de texto</translation>
    </message>
    <message>
        <source>Documentation</source>
        <translation>Documentación</translation>
    </message>
    <message>
        <source>For adults</source>
        <translation>Para adultos</translation>
    </message>
    <message>
        <source>Core of the desktop</source>
        <translation>Núcleo del escritorio</translation>
    </message>
    <message>
        <source>Made with KDE</source>
        <translation>Hechas con KDE</translation>
    </message>
    <message>
        <source>Made with GNOME</source>
        <translation>Hechas con GNOME</translation>
    </message>
    <message>
        <source>Made with Xfce</source>
        <translation>Hechas con Xfce</translation>
    </message>
    <message>
        <source>Made with GTK</source>
        <translation>Hechas con GTK</translation>
    </message>
    <message>
        <source>Made with Qt</source>
        <translation>Hechas con Qt</translation>
    </message>
    <message>
        <source>Made with Motif</source>
        <translation>Hechas con Motif</translation>
    </message>
    <message>
        <source>Made with Java</source>
        <translation>Hechas con Java</translation>
    </message>
    <message>
        <source>For the console</source>
        <translation>Para la consola</translation>
    </message>
    <message>
        <source>Screen savers</source>
        <translation>Salvapantallas</translation>
    </message>
    <message>
        <source>Icons of the system tray</source>
        <translation>Iconos de la bandeja del sistema</translation>
    </message>
    <message>
        <source>Applets of a panel</source>
        <translation>Miniaplicaciones de un panel</translation>
    </message>
    <message>
        <source>Desktop shells</source>
        <translation>Shells de escritorio</translation>
    </message>
    <message>
        <source>Applications</source>
        <translation>Aplicaciones</translation>
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
        <translation>Escriba para filtrar</translation>
    </message>
    <message>
        <source>Reading...</source>
        <translation>Leyendo...</translation>
    </message>
    <message>
        <source>No match</source>
        <translation>No hay coincidencias</translation>
    </message>
    <message numerus="yes">
        <source>%n chosen</source>
        <translation>
            <numerusform>%n elegido</numerusform>
            <numerusform>%n elegidos</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::DesktopChooser</name>
    <message>
        <source>Desktop environment</source>
        <translation>Entorno de escritorio</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Observación</translation>
    </message>
    <message>
        <source>This session</source>
        <translation>Esta sesión</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>No registrado</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsDialog</name>
    <message>
        <source>An action has no id. It can have &quot;%1&quot;.</source>
        <translation>Una acción no tiene identificador. Puede tener «%1».</translation>
    </message>
    <message>
        <source>Two actions have the id &quot;%1&quot;. The second one can have &quot;%2&quot;.</source>
        <translation>Dos acciones tienen el identificador «%1». La segunda puede tener «%2».</translation>
    </message>
    <message>
        <source>No entry can hold the id &quot;%1&quot;. It can be &quot;%2&quot;.</source>
        <translation>Ninguna entrada puede contener el identificador «%1». Puede ser «%2».</translation>
    </message>
    <message>
        <source>The id &quot;%1&quot; should have only A to Z, a to z, 0 to 9 and &quot;-&quot; in it, as &quot;%2&quot; has.</source>
        <translation>El identificador «%1» solo debería contener de la A a la Z, de la a a la z, del 0 al 9 y «-», como «%2».</translation>
    </message>
    <message numerus="yes">
        <source>%n more id(s) should be changed.</source>
        <translation>
            <numerusform>Debería cambiarse %n identificador más.</numerusform>
            <numerusform>Deberían cambiarse %n identificadores más.</numerusform>
        </translation>
    </message>
    <message>
        <source>Use &quot;%1&quot;</source>
        <translation>Usar «%1»</translation>
    </message>
    <message>
        <source>Use the proposed ids</source>
        <translation>Usar los identificadores propuestos</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsWidget</name>
    <message>
        <source>Add action</source>
        <translation>Añadir acción</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Editar acción</translation>
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
        <translation>El «;» de «%1» no separa elementos, pasa a ser parte de un elemento.</translation>
    </message>
    <message numerus="yes">
        <source>Make %n item(s) of it</source>
        <translation>
            <numerusform>Convertirlo en %n elemento</numerusform>
            <numerusform>Convertirlo en %n elementos</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::EditableListWidget</name>
    <message>
        <source>Add string</source>
        <translation>Añadir cadena</translation>
    </message>
    <message>
        <source>String:</source>
        <translation>Cadena:</translation>
    </message>
    <message>
        <source>Edit string</source>
        <translation>Editar cadena</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryFormAssistance</name>
    <message>
        <source>Te&amp;xt</source>
        <comment>button: shows the file of the entry</comment>
        <translation>Te&amp;xto</translation>
    </message>
    <message>
        <source>Shows the file as it would be saved</source>
        <translation>Muestra el archivo tal como se guardaría</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryTextDialog</name>
    <message>
        <source>Text of the entry</source>
        <translation>Texto de la entrada</translation>
    </message>
    <message>
        <source>The file as it would be saved</source>
        <translation>El archivo tal como se guardaría</translation>
    </message>
    <message>
        <source>Nothing is changed.</source>
        <translation>No hay ningún cambio.</translation>
    </message>
    <message>
        <source>≠ changed lines: %1, + new lines: %2, removed lines: %3</source>
        <translation>≠ líneas cambiadas: %1, + líneas nuevas: %2, líneas eliminadas: %3</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldChoosers</name>
    <message>
        <source>Choose %1</source>
        <comment>name of a &quot;Choose...&quot; button</comment>
        <translation>Elegir %1</translation>
    </message>
    <message>
        <source>Choose...</source>
        <translation>Elegir...</translation>
    </message>
    <message>
        <source>Chooses from all that are known (Alt+Down)</source>
        <translation>Elige entre todo lo conocido (Alt+Abajo)</translation>
    </message>
    <message>
        <source>Chooses an installed program (Alt+Down)</source>
        <translation>Elige un programa instalado (Alt+Abajo)</translation>
    </message>
    <message>
        <source>Insert</source>
        <comment>button: a field code</comment>
        <translation>Insertar</translation>
    </message>
    <message>
        <source>Insert a field code</source>
        <translation>Insertar un código de campo</translation>
    </message>
    <message>
        <source>Inserts a code that stands for the files to open, or for a part of this entry</source>
        <translation>Inserta un código que representa los archivos que se van a abrir o una parte de esta entrada</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldCodes</name>
    <message>
        <source>%f: one file; for several files the program is started several times</source>
        <translation>%f: un archivo; para varios archivos, el programa se inicia varias veces</translation>
    </message>
    <message>
        <source>%F: all files, each as a word of its own</source>
        <translation>%F: todos los archivos, cada uno como una palabra aparte</translation>
    </message>
    <message>
        <source>%u: one address (URL) or file; for several the program is started several times</source>
        <translation>%u: una dirección (URL) o un archivo; para varios, el programa se inicia varias veces</translation>
    </message>
    <message>
        <source>%U: all addresses (URLs) or files, each as a word of its own</source>
        <translation>%U: todas las direcciones (URL) o archivos, cada uno como una palabra aparte</translation>
    </message>
    <message>
        <source>%i: --icon and the icon of this entry, if it has one</source>
        <translation>%i: --icon y el icono de esta entrada, si lo tiene</translation>
    </message>
    <message>
        <source>%c: the name of this entry, translated</source>
        <translation>%c: el nombre de esta entrada, traducido</translation>
    </message>
    <message>
        <source>%k: where the file of this entry lies</source>
        <translation>%k: dónde está el archivo de esta entrada</translation>
    </message>
    <message>
        <source>%%: a percent sign</source>
        <translation>%%: un signo de porcentaje</translation>
    </message>
</context>
<context>
    <name>VelUI::FindingLine</name>
    <message>
        <source>Fix</source>
        <translation>Corregir</translation>
    </message>
    <message>
        <source>Fix: %1</source>
        <comment>on a button; %1 is what it does</comment>
        <translation>Corregir: %1</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>how bad something is, and what it is</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>Hint</source>
        <translation>Sugerencia</translation>
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
        <translation>Deshacer el cambio de %1</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Deshacer</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Rehacer el cambio de %1</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Rehacer</translation>
    </message>
</context>
<context>
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>Editar %1</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageBar</name>
    <message>
        <source>&amp;Language:</source>
        <translation>&amp;Idioma:</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Idioma</translation>
    </message>
    <message>
        <source>Another language...</source>
        <translation>Otro idioma...</translation>
    </message>
    <message>
        <source>Another language</source>
        <translation>Otro idioma</translation>
    </message>
    <message>
        <source>Unknown language</source>
        <translation>Idioma desconocido</translation>
    </message>
    <message>
        <source>%1 (%2), yours: %3 of %4 texts</source>
        <translation>%1 (%2), el suyo: %3 de %4 textos</translation>
    </message>
    <message>
        <source>%1 (%2), yours: no text yet</source>
        <translation>%1 (%2), el suyo: aún sin textos</translation>
    </message>
    <message>
        <source>%1 (%2): %3 of %4 texts</source>
        <translation>%1 (%2): %3 de %4 textos</translation>
    </message>
    <message>
        <source>%1 (%2): no text yet</source>
        <translation>%1 (%2): aún sin textos</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageDialog</name>
    <message>
        <source>Another language</source>
        <translation>Otro idioma</translation>
    </message>
    <message>
        <source>&amp;Language or its code, such as pt_BR:</source>
        <translation>&amp;Idioma o su código, por ejemplo pt_BR:</translation>
    </message>
    <message>
        <source>Language or its code</source>
        <translation>Idioma o su código</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>a language and its code</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>No language has such a code: it is like de, pt_BR or sr@latin.</source>
        <translation>Ningún idioma tiene un código así: tiene que ser como de, pt_BR o sr@latin.</translation>
    </message>
    <message>
        <source>The code %1 is well-formed, but no language of this name is known.</source>
        <translation>El código %1 está bien formado, pero no se conoce ningún idioma con ese nombre.</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeChooser</name>
    <message>
        <source>Choose MIME types</source>
        <translation>Elegir tipos MIME</translation>
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
        <translation>Descripción</translation>
    </message>
    <message>
        <source>File names</source>
        <translation>Nombres de archivo</translation>
    </message>
    <message>
        <source>Not in the database</source>
        <translation>No está en la base de datos</translation>
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
        <translation>Elegir la ruta del ejecutable de la aplicación</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramChooser</name>
    <message>
        <source>Choose a program</source>
        <translation>Elegir un programa</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramSource</name>
    <message>
        <source>Program</source>
        <comment>title of a column</comment>
        <translation>Programa</translation>
    </message>
    <message>
        <source>Folder</source>
        <comment>title of a column</comment>
        <translation>Carpeta</translation>
    </message>
</context>
<context>
    <name>VelUI::RowFindings</name>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>Y %n más.</numerusform>
            <numerusform>Y %n más.</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::TrialLine</name>
    <message>
        <source>Stop</source>
        <comment>button: ends the trial of an entry</comment>
        <translation>Detener</translation>
    </message>
    <message>
        <source>T&amp;ry</source>
        <comment>button: runs the entry</comment>
        <translation>P&amp;robar</translation>
    </message>
    <message>
        <source>Stops the trial</source>
        <translation>Detiene la prueba</translation>
    </message>
    <message>
        <source>Runs the entry as it is now, without saving it</source>
        <translation>Ejecuta la entrada tal como está ahora, sin guardarla</translation>
    </message>
    <message>
        <source>The program vel-open, which runs entries, could not be started: %1</source>
        <translation>No se ha podido iniciar el programa vel-open, que ejecuta las entradas: %1</translation>
    </message>
    <message>
        <source>The trial was stopped.</source>
        <translation>Se ha detenido la prueba.</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0).</source>
        <translation>Se ha iniciado la entrada (estado de salida 0).</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0): %1</source>
        <translation>Se ha iniciado la entrada (estado de salida 0): %1</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1).</source>
        <translation>No se ha podido iniciar la entrada (estado de salida %1).</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1): %2</source>
        <translation>No se ha podido iniciar la entrada (estado de salida %1): %2</translation>
    </message>
</context>
</TS>

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
        <source>Hide</source>
        <translation>Ocultar</translation>
    </message>
    <message>
        <source>Show again</source>
        <translation>Volver a mostrar</translation>
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
        <source>Reload</source>
        <translation>Recargar</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Este menú está vacío. Pulse %1 para una entrada nueva, o haga clic aquí con el botón derecho para ver qué más se puede añadir.</translation>
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
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>Editar %1</translation>
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
</TS>

<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr" sourcelanguage="en">
<context>
    <name>ActionListEdit</name>
    <message>
        <source>Form</source>
        <translation>Formulaire</translation>
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
        <translation>Aller à</translation>
    </message>
    <message>
        <source>Go to action &apos;%1&apos;</source>
        <translation>Aller à l&apos;action « %1 »</translation>
    </message>
    <message>
        <source>Take over</source>
        <translation>Reprendre</translation>
    </message>
    <message>
        <source>Take over &apos;%1&apos; from action &apos;%2&apos;</source>
        <translation>Reprendre « %1 » à l&apos;action « %2 »</translation>
    </message>
    <message>
        <source>Further clashes: %1</source>
        <translation>Autres conflits : %1</translation>
    </message>
</context>
<context>
    <name>EditActionsDialog</name>
    <message>
        <source>Actions</source>
        <translation>Actions</translation>
    </message>
</context>
<context>
    <name>EditActionsWidget</name>
    <message>
        <source>Form</source>
        <translation>Formulaire</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Ajouter...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Modifier...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Monter</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Descendre</translation>
    </message>
</context>
<context>
    <name>EditShortcutsAssistance</name>
    <message>
        <source>Schemes</source>
        <translation>Profils</translation>
    </message>
    <message>
        <source>No action matches the filter.</source>
        <translation>Aucune action ne correspond au filtre.</translation>
    </message>
    <message>
        <source>No action has the shortcut %1.</source>
        <translation>Aucune action n&apos;a le raccourci %1.</translation>
    </message>
</context>
<context>
    <name>EditShortcutsDialog</name>
    <message>
        <source>None</source>
        <translation>Aucune</translation>
    </message>
    <message>
        <source>Configure shortcuts</source>
        <translation>Configurer les raccourcis clavier</translation>
    </message>
    <message>
        <source>Choose a key for selected action</source>
        <translation>Choisir une touche pour l&apos;action sélectionnée</translation>
    </message>
    <message>
        <source>Default key:</source>
        <translation>Touche par défaut&#xa0;:</translation>
    </message>
    <message>
        <source>Assign key:</source>
        <translation>Affecter une touche&#xa0;:</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>Le raccourci «&#xa0;%1&#xa0;» est déjà utilisé pour l&apos;action globale «&#xa0;%2&#xa0;».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;. Please try another.</source>
        <translation>Le raccourci «&#xa0;%1&#xa0;» est déjà utilisé pour l&apos;action «&#xa0;%2&#xa0;». Veuillez en essayer un autre.</translation>
    </message>
    <message>
        <source>Shortcuts conflict</source>
        <translation>Conflit de raccourcis</translation>
    </message>
    <message>
        <source>Apply changes</source>
        <translation>Appliquer les modifications</translation>
    </message>
    <message>
        <source>Some shortcuts have been changed. Do you want to apply changes?</source>
        <translation>Certains raccourcis ont été modifiés. Voulez-vous appliquer les modifications&#xa0;?</translation>
    </message>
</context>
<context>
    <name>EditStringsDialog</name>
    <message>
        <source>Strings</source>
        <translation>Chaînes</translation>
    </message>
</context>
<context>
    <name>EditableListWidget</name>
    <message>
        <source>Form</source>
        <translation>Formulaire</translation>
    </message>
    <message>
        <source>Add...</source>
        <translation>Ajouter...</translation>
    </message>
    <message>
        <source>Edit...</source>
        <translation>Modifier...</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Monter</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Descendre</translation>
    </message>
</context>
<context>
    <name>KeyAssistance</name>
    <message>
        <source>Press the keys of the shortcut. Tab leaves the field.</source>
        <translation>Appuyez sur les touches du raccourci. Tab quitte le champ.</translation>
    </message>
    <message>
        <source>Key for action &apos;%1&apos;</source>
        <translation>Touche pour l&apos;action « %1 »</translation>
    </message>
    <message>
        <source>None: no key for action &apos;%1&apos;</source>
        <translation>Aucune : aucun raccourci pour l&apos;action « %1 »</translation>
    </message>
    <message>
        <source>What speaks against the key for action &apos;%1&apos;</source>
        <translation>Ce qui s&apos;oppose au raccourci de l&apos;action « %1 »</translation>
    </message>
</context>
<context>
    <name>MenuDeletion</name>
    <message>
        <source>There is no trash for %1. It would be deleted for good: this cannot be undone. Delete it?</source>
        <translation>Il n&apos;y a pas de corbeille pour %1. La suppression serait définitive et ne pourrait pas être annulée. Voulez-vous supprimer ?</translation>
    </message>
    <message numerus="yes">
        <source>There is no trash for %n of these items. They would be deleted for good: this cannot be undone. Delete them?</source>
        <translation>
            <numerusform>Il n&apos;y a pas de corbeille pour %n de ces éléments. La suppression serait définitive et ne pourrait pas être annulée. Voulez-vous supprimer ?</numerusform>
            <numerusform>Il n&apos;y a pas de corbeille pour %n de ces éléments. La suppression serait définitive et ne pourrait pas être annulée. Voulez-vous supprimer ?</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 cannot be deleted: %2</source>
        <translation>Impossible de supprimer %1 : %2</translation>
    </message>
</context>
<context>
    <name>MenuHistory</name>
    <message>
        <source>Undo</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Rétablir</translation>
    </message>
    <message>
        <source>Done: %1</source>
        <translation>Fait : %1</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Déplacement des fichiers...</translation>
    </message>
    <message>
        <source>Nothing was undone: %1</source>
        <translation>Rien n&apos;a été annulé : %1</translation>
    </message>
    <message>
        <source>Nothing was done again: %1</source>
        <translation>Rien n&apos;a été rétabli : %1</translation>
    </message>
    <message>
        <source>%1 is not there any more.</source>
        <translation>%1 n&apos;est plus là.</translation>
    </message>
    <message>
        <source>There is another %1 by now.</source>
        <translation>Il y a maintenant un autre %1.</translation>
    </message>
    <message>
        <source>%1 was changed by another program.</source>
        <translation>%1 a été modifié par un autre programme.</translation>
    </message>
    <message>
        <source>%1 is not in the trash any more.</source>
        <translation>%1 n&apos;est plus dans la corbeille.</translation>
    </message>
    <message>
        <source>%1 cannot be put into the trash.</source>
        <translation>%1 ne peut pas être mis à la corbeille.</translation>
    </message>
    <message>
        <source>It was canceled.</source>
        <translation>L&apos;opération a été interrompue.</translation>
    </message>
    <message>
        <source>%1 cannot be changed: %2</source>
        <translation>Impossible de modifier %1 : %2</translation>
    </message>
    <message>
        <source>Undo creation of %1</source>
        <translation>Annuler la création de %1</translation>
    </message>
    <message>
        <source>Redo creation of %1</source>
        <translation>Rétablir la création de %1</translation>
    </message>
    <message>
        <source>%1 was created.</source>
        <translation>%1 a été créé.</translation>
    </message>
    <message>
        <source>Undo change of %1</source>
        <translation>Annuler la modification de %1</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Rétablir la modification de %1</translation>
    </message>
    <message>
        <source>%1 was changed.</source>
        <translation>%1 a été modifié.</translation>
    </message>
    <message>
        <source>Undo deletion of %1</source>
        <translation>Annuler la suppression de %1</translation>
    </message>
    <message>
        <source>Redo deletion of %1</source>
        <translation>Rétablir la suppression de %1</translation>
    </message>
    <message>
        <source>%1 was deleted.</source>
        <translation>%1 a été supprimé.</translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Annuler la suppression du dossier %1 (%n entrée)</numerusform>
            <numerusform>Annuler la suppression du dossier %1 (%n entrées)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of folder %1 (%n entries)</source>
        <translation>
            <numerusform>Rétablir la suppression du dossier %1 (%n entrée)</numerusform>
            <numerusform>Rétablir la suppression du dossier %1 (%n entrées)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The folder %1 was deleted (%n entries).</source>
        <translation>
            <numerusform>Le dossier %1 a été supprimé (%n entrée).</numerusform>
            <numerusform>Le dossier %1 a été supprimé (%n entrées).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo deletion of %n items</source>
        <translation>
            <numerusform>Annuler la suppression de %n élément</numerusform>
            <numerusform>Annuler la suppression de %n éléments</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %n items</source>
        <translation>
            <numerusform>Rétablir la suppression de %n élément</numerusform>
            <numerusform>Rétablir la suppression de %n éléments</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were deleted.</source>
        <translation>
            <numerusform>%n élément a été supprimé.</numerusform>
            <numerusform>%n éléments ont été supprimés.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo moving of %1 to %2</source>
        <translation>Annuler le déplacement de %1 vers %2</translation>
    </message>
    <message>
        <source>Redo moving of %1 to %2</source>
        <translation>Rétablir le déplacement de %1 vers %2</translation>
    </message>
    <message>
        <source>%1 was moved to %2.</source>
        <translation>%1 a été déplacé vers %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo moving of %n items to %2</source>
        <translation>
            <numerusform>Annuler le déplacement de %n élément vers %2</numerusform>
            <numerusform>Annuler le déplacement de %n éléments vers %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo moving of %n items to %2</source>
        <translation>
            <numerusform>Rétablir le déplacement de %n élément vers %2</numerusform>
            <numerusform>Rétablir le déplacement de %n éléments vers %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were moved to %2.</source>
        <translation>
            <numerusform>%n élément a été déplacé vers %2.</numerusform>
            <numerusform>%n éléments ont été déplacés vers %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo copying of %1 to %2</source>
        <translation>Annuler la copie de %1 vers %2</translation>
    </message>
    <message>
        <source>Redo copying of %1 to %2</source>
        <translation>Rétablir la copie de %1 vers %2</translation>
    </message>
    <message>
        <source>%1 was copied to %2.</source>
        <translation>%1 a été copié vers %2.</translation>
    </message>
    <message numerus="yes">
        <source>Undo copying of %n items to %2</source>
        <translation>
            <numerusform>Annuler la copie de %n élément vers %2</numerusform>
            <numerusform>Annuler la copie de %n éléments vers %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo copying of %n items to %2</source>
        <translation>
            <numerusform>Rétablir la copie de %n élément vers %2</numerusform>
            <numerusform>Rétablir la copie de %n éléments vers %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were copied to %2.</source>
        <translation>
            <numerusform>%n élément a été copié vers %2.</numerusform>
            <numerusform>%n éléments ont été copiés vers %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo reordering of %1</source>
        <translation>Annuler le réordonnancement de %1</translation>
    </message>
    <message>
        <source>Redo reordering of %1</source>
        <translation>Rétablir le réordonnancement de %1</translation>
    </message>
    <message>
        <source>%1 has another place.</source>
        <translation>%1 a changé de place.</translation>
    </message>
    <message>
        <source>Undo default menu</source>
        <translation>Annuler le menu par défaut</translation>
    </message>
    <message>
        <source>Redo default menu</source>
        <translation>Rétablir le menu par défaut</translation>
    </message>
    <message>
        <source>The default menu was built.</source>
        <translation>Le menu par défaut a été construit.</translation>
    </message>
    <message>
        <source>Undo hiding of %1</source>
        <translation>Annuler le masquage de %1</translation>
    </message>
    <message>
        <source>Redo hiding of %1</source>
        <translation>Rétablir le masquage de %1</translation>
    </message>
    <message>
        <source>%1 is hidden: the menu no longer shows it.</source>
        <translation>%1 est masqué : le menu ne l&apos;affiche plus.</translation>
    </message>
    <message>
        <source>Undo showing %1 again</source>
        <translation>Annuler le réaffichage de %1</translation>
    </message>
    <message>
        <source>Redo showing %1 again</source>
        <translation>Rétablir le réaffichage de %1</translation>
    </message>
    <message>
        <source>The menu shows %1 again.</source>
        <translation>Le menu affiche de nouveau %1.</translation>
    </message>
    <message>
        <source>Undo deletion of folder %1 (1 entry)</source>
        <translation>Annuler la suppression du dossier %1 (1 entrée)</translation>
    </message>
    <message>
        <source>Redo deletion of folder %1 (1 entry)</source>
        <translation>Rétablir la suppression du dossier %1 (1 entrée)</translation>
    </message>
    <message>
        <source>The folder %1 was deleted (1 entry).</source>
        <translation>Le dossier %1 a été supprimé (1 entrée).</translation>
    </message>
</context>
<context>
    <name>QFileSystemModel</name>
    <message>
        <source>%1 does not exist.</source>
        <translation>%1 n&apos;existe pas.</translation>
    </message>
    <message>
        <source>%1 exists and was left as it is.</source>
        <translation>%1 existe déjà et est resté tel quel.</translation>
    </message>
    <message>
        <source>%1 cannot be put into itself.</source>
        <translation>%1 ne peut pas être placé dans lui-même.</translation>
    </message>
    <message>
        <source>%1 cannot be written.</source>
        <translation>Impossible d&apos;écrire %1.</translation>
    </message>
    <message>
        <source>Can&apos;t move %1: %2</source>
        <translation>Impossible de déplacer %1&#xa0;: %2</translation>
    </message>
    <message>
        <source>Can&apos;t copy %1: %2</source>
        <translation>Impossible de copier %1&#xa0;: %2</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Attention</translation>
    </message>
    <message>
        <source>%1 already exists. Overwrite?</source>
        <translation>%1 existe déjà. Voulez-vous l&apos;écraser&#xa0;?</translation>
    </message>
</context>
<context>
    <name>SchemeMenu</name>
    <message>
        <source>This is not a regular file.</source>
        <translation>Ce n&apos;est pas un fichier ordinaire.</translation>
    </message>
    <message>
        <source>Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <translation>Raccourcis repris : %1, laissés de côté : %2. OK les met en vigueur, Réinitialiser les retire.</translation>
    </message>
    <message>
        <source>%3
Shortcuts taken over: %1, left out: %2. Ok puts them into force, Reset takes them back.</source>
        <comment>%3: a sentence about lines that were skipped</comment>
        <translation>%3
Raccourcis repris : %1, laissés de côté : %2. OK les met en vigueur, Réinitialiser les retire.</translation>
    </message>
    <message>
        <source>&amp;Export keys...</source>
        <translation>&amp;Exporter les touches...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>&amp;Importer les touches...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>Enregistrer l&apos;aide-mémoire en &amp;HTML...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;text...</source>
        <translation>Enregistrer l&apos;aide-mémoire en &amp;texte...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>&amp;Copier l&apos;aide-mémoire</translation>
    </message>
    <message>
        <source>Export keys</source>
        <translation>Exporter les touches</translation>
    </message>
    <message>
        <source>Keys (*.ini);;All files (*)</source>
        <translation>Touches (*.ini);;Tous les fichiers (*)</translation>
    </message>
    <message>
        <source>%1
Choose another folder or another name, and try again.</source>
        <translation>%1
Choisissez un autre dossier ou un autre nom, puis réessayez.</translation>
    </message>
    <message>
        <source>Import keys</source>
        <translation>Importer les touches</translation>
    </message>
    <message>
        <source>%1
Choose a file that was written with &apos;Export keys...&apos;.</source>
        <translation>%1
Choisissez un fichier écrit avec « Exporter les touches... ».</translation>
    </message>
    <message>
        <source>HTML documents (*.html);;All files (*)</source>
        <translation>Documents HTML (*.html);;Tous les fichiers (*)</translation>
    </message>
    <message>
        <source>Plain text (*.txt);;All files (*)</source>
        <translation>Texte brut (*.txt);;Tous les fichiers (*)</translation>
    </message>
    <message>
        <source>Save cheat sheet</source>
        <translation>Enregistrer l&apos;aide-mémoire</translation>
    </message>
    <message>
        <source>The cheat sheet could not be saved to %1: %2
Choose another folder or another name, and try again.</source>
        <comment>%2: what the system says</comment>
        <translation>L&apos;aide-mémoire n&apos;a pas pu être enregistré dans %1 : %2
Choisissez un autre dossier ou un autre nom, puis réessayez.</translation>
    </message>
</context>
<context>
    <name>SchemeQuestion</name>
    <message>
        <source>Import keys</source>
        <translation>Importer les touches</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>&amp;Remplacer</translation>
    </message>
    <message>
        <source>&amp;Skip</source>
        <translation>&amp;Ignorer</translation>
    </message>
    <message>
        <source>&amp;Do the same with all further ones</source>
        <translation>&amp;Faire de même pour toutes les suivantes</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but the global action &apos;%3&apos; has it. Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>Le fichier contient le raccourci « %1 » pour l&apos;action « %2 », mais l&apos;action globale « %3 » l&apos;utilise. Ignorer laisse l&apos;action « %2 » telle quelle ; Annuler ne reprend rien.</translation>
    </message>
    <message>
        <source>The file has shortcut &apos;%1&apos; for action &apos;%2&apos;, but action &apos;%3&apos; has it, too. Replace takes it away from action &apos;%3&apos;, Skip leaves action &apos;%2&apos; as it is; Cancel takes nothing over.</source>
        <translation>Le fichier contient le raccourci « %1 » pour l&apos;action « %2 », mais l&apos;action « %3 » l&apos;utilise aussi. Remplacer le retire à l&apos;action « %3 », Ignorer laisse l&apos;action « %2 » telle quelle ; Annuler ne reprend rien.</translation>
    </message>
</context>
<context>
    <name>ShortcutClash</name>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;.</source>
        <translation>Le raccourci «&#xa0;%1&#xa0;» est déjà utilisé pour l&apos;action «&#xa0;%2&#xa0;».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; of action &apos;%3&apos; begins with &apos;%1&apos;.</source>
        <translation>Le raccourci «&#xa0;%2&#xa0;» de l&apos;action «&#xa0;%3&#xa0;» commence par «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; begins with &apos;%1&apos;, the shortcut of action &apos;%3&apos;.</source>
        <translation>Le raccourci «&#xa0;%2&#xa0;» commence par «&#xa0;%1&#xa0;», le raccourci de l&apos;action «&#xa0;%3&#xa0;».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; opens the menu &apos;%2&apos;.</source>
        <translation>Le raccourci «&#xa0;%1&#xa0;» ouvre le menu «&#xa0;%2&#xa0;».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; leads to &apos;%2&apos; in the window.</source>
        <translation>Le raccourci «&#xa0;%1&#xa0;» mène à «&#xa0;%2&#xa0;» dans la fenêtre.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is the standard shortcut for &apos;%2&apos;.</source>
        <translation>Le raccourci «&#xa0;%1&#xa0;» est le raccourci standard pour «&#xa0;%2&#xa0;».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>Le raccourci «&#xa0;%1&#xa0;» est déjà utilisé pour l&apos;action globale «&#xa0;%2&#xa0;».</translation>
    </message>
    <message>
        <source>With &apos;%1&apos; as a shortcut this key cannot be typed into texts.</source>
        <translation>Avec «&#xa0;%1&#xa0;» comme raccourci, cette touche ne peut plus être saisie dans les textes.</translation>
    </message>
    <message>
        <source>The current keyboard layout cannot produce &apos;%1&apos;.</source>
        <translation>La disposition de clavier actuelle ne permet pas de produire «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is a further shortcut of action &apos;%2&apos;.</source>
        <translation>Le raccourci « %1 » est un autre raccourci de l&apos;action « %2 ».</translation>
    </message>
</context>
<context>
    <name>ShortcutDelegate</name>
    <message>
        <source>Back to no shortcut</source>
        <translation>Revenir à aucun raccourci</translation>
    </message>
    <message>
        <source>Back to %1</source>
        <translation>Revenir à %1</translation>
    </message>
</context>
<context>
    <name>ShortcutFilterBar</name>
    <message>
        <source>Press keys</source>
        <translation>Appuyer sur des touches</translation>
    </message>
    <message>
        <source>Changed only</source>
        <translation>Modifiés seulement</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtre</translation>
    </message>
    <message>
        <source>Shows who has the keys that you press; Escape ends it.</source>
        <translation>Montre qui a les touches sur lesquelles vous appuyez ; Échap y met fin.</translation>
    </message>
    <message>
        <source>Shows the actions alone whose shortcut is not the default one, or was edited.</source>
        <translation>Ne montre que les actions dont le raccourci n&apos;est pas celui par défaut ou a été modifié.</translation>
    </message>
    <message>
        <source>Press the keys to look for</source>
        <translation>Appuyez sur les touches à chercher</translation>
    </message>
    <message>
        <source>Filter by name, group or shortcut</source>
        <translation>Filtrer par nom, groupe ou raccourci</translation>
    </message>
</context>
<context>
    <name>ShortcutScheme</name>
    <message>
        <source>The shortcuts could not be saved to %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Impossible d&apos;enregistrer les raccourcis dans %1&#xa0;: %2</translation>
    </message>
    <message>
        <source>The shortcuts could not be read from %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Impossible de lire les raccourcis dans %1&#xa0;: %2</translation>
    </message>
    <message>
        <source>%1 is not a regular file.</source>
        <translation>%1 n&apos;est pas un fichier ordinaire.</translation>
    </message>
    <message>
        <source>%1 is too large for a file of shortcuts.</source>
        <translation>%1 est trop volumineux pour un fichier de raccourcis.</translation>
    </message>
    <message>
        <source>%1 holds no shortcuts.</source>
        <translation>%1 ne contient aucun raccourci.</translation>
    </message>
    <message>
        <source>Unreadable shortcuts in %1 were skipped: %2</source>
        <comment>%2: their number</comment>
        <translation>Des raccourcis illisibles dans %1 ont été ignorés&#xa0;: %2</translation>
    </message>
</context>
<context>
    <name>ShortcutSheet</name>
    <message>
        <source>Keyboard shortcuts</source>
        <comment>title of a printed sheet</comment>
        <translation>Raccourcis clavier</translation>
    </message>
</context>
<context>
    <name>ShortcutsModel</name>
    <message>
        <source>Action</source>
        <translation>Action</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Raccourci</translation>
    </message>
    <message>
        <source>%1, changed</source>
        <comment>%1: an action or a key</comment>
        <translation>%1, modifié</translation>
    </message>
    <message>
        <source>No shortcut</source>
        <translation>Aucun raccourci</translation>
    </message>
    <message>
        <source>There is no default shortcut.</source>
        <translation>Il n&apos;y a pas de raccourci par défaut.</translation>
    </message>
    <message>
        <source>The default shortcut is %1.</source>
        <translation>Le raccourci par défaut est %1.</translation>
    </message>
</context>
<context>
    <name>StandardKeyNames</name>
    <message>
        <source>Help</source>
        <translation>Aide</translation>
    </message>
    <message>
        <source>What&apos;s this?</source>
        <translation>Qu&apos;est-ce que c&apos;est&#xa0;?</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Ouvrir</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Fermer</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Enregistrer</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>Enregistrer sous</translation>
    </message>
    <message>
        <source>New</source>
        <translation>Nouveau</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Couper</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copier</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Coller</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Rétablir</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Précédent</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>Suivant</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Actualiser</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Zoom avant</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Zoom arrière</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Imprimer</translation>
    </message>
    <message>
        <source>New tab</source>
        <translation>Nouvel onglet</translation>
    </message>
    <message>
        <source>Next tab</source>
        <translation>Onglet suivant</translation>
    </message>
    <message>
        <source>Previous tab</source>
        <translation>Onglet précédent</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Rechercher</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>Rechercher le suivant</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>Rechercher le précédent</translation>
    </message>
    <message>
        <source>Replace</source>
        <translation>Remplacer</translation>
    </message>
    <message>
        <source>Select all</source>
        <translation>Tout sélectionner</translation>
    </message>
    <message>
        <source>Deselect</source>
        <translation>Désélectionner</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Plein écran</translation>
    </message>
    <message>
        <source>Preferences</source>
        <translation>Préférences</translation>
    </message>
    <message>
        <source>Quit</source>
        <translation>Quitter</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>Gras</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>Italique</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>Souligné</translation>
    </message>
    <message>
        <source>Move the cursor</source>
        <translation>Déplacer le curseur</translation>
    </message>
    <message>
        <source>Select text</source>
        <translation>Sélectionner du texte</translation>
    </message>
    <message>
        <source>Edit text</source>
        <translation>Modifier le texte</translation>
    </message>
</context>
<context>
    <name>StringListEdit</name>
    <message>
        <source>Form</source>
        <translation>Formulaire</translation>
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
        <translation>&amp;Réinitialiser ce raccourci</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryEditDialog</name>
    <message>
        <source>Warning</source>
        <translation>Avertissement</translation>
    </message>
    <message>
        <source>no executable</source>
        <translation>aucun exécutable</translation>
    </message>
    <message>
        <source>can&apos;t find executable</source>
        <translation>impossible de trouver l&apos;exécutable</translation>
    </message>
    <message>
        <source>can&apos;t find try executable</source>
        <translation>impossible de trouver l&apos;exécutable de test</translation>
    </message>
    <message>
        <source>can&apos;t find URL</source>
        <translation>impossible de trouver l&apos;URL</translation>
    </message>
    <message>
        <source>wrong/incomplete desktop entry</source>
        <translation>entrée de bureau erronée ou incomplète</translation>
    </message>
    <message>
        <source>Can&apos;t save position on desktop for %1</source>
        <translation>Impossible d&apos;enregistrer la position de %1 sur le bureau</translation>
    </message>
    <message>
        <source>Copy from...</source>
        <translation>Copier depuis...</translation>
    </message>
    <message>
        <source>Can&apos;t load file %1</source>
        <translation>Impossible de charger le fichier %1</translation>
    </message>
    <message>
        <source>Desktop Entry Editor</source>
        <translation>Éditeur d&apos;entrées de bureau</translation>
    </message>
    <message>
        <source>You create hidden desktop entry</source>
        <translation>Vous créez une entrée de bureau masquée</translation>
    </message>
    <message>
        <source>Can&apos;t save file %1</source>
        <translation>Impossible d&apos;enregistrer le fichier %1</translation>
    </message>
    <message>
        <source>Help</source>
        <translation>Aide</translation>
    </message>
    <message>
        <source>&lt;b&gt;Desktop entry&lt;/b&gt; is a multipurpose info file for installed apps, devices, etc. It can be used to build menu entries, shortcuts, etc. This dialog implements the &apos;Desktop Entry Standard&apos; of &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Desktop entry file is a text ini-like file with one main section [Desktop Entry] and possible additional sections for each action defined in the main section field &apos;Actions&apos;. All fields are text string pairs: key=value. Value can also be a semicolon separated string list.</source>
        <translation>Une &lt;b&gt;entrée de bureau&lt;/b&gt; est un fichier d&apos;informations polyvalent pour les applications installées, les périphériques, etc. Elle peut servir à construire des éléments de menu, des raccourcis, etc. Cette boîte de dialogue met en œuvre le «&#xa0;Desktop Entry Standard&#xa0;» de &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Le fichier d&apos;une entrée de bureau est un fichier texte de type INI avec une section principale [Desktop Entry] et éventuellement des sections supplémentaires pour chaque action définie dans le champ «&#xa0;Actions&#xa0;» de la section principale. Tous les champs sont des paires de chaînes de texte&#xa0;: clé=valeur. La valeur peut aussi être une liste de chaînes séparées par des points-virgules.</translation>
    </message>
</context>
<context>
    <name>VelDesktopEntryPropsWidgetPrivate</name>
    <message>
        <source>Information about the URL</source>
        <translation>Informations sur l&apos;URL</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Afficher uniquement dans</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Ne pas afficher dans</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Ajouter un environnement de bureau&#xa0;:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Modifier l&apos;environnement de bureau&#xa0;:</translation>
    </message>
    <message>
        <source>MIME type or file name extension:</source>
        <translation>Type MIME ou extension de nom de fichier&#xa0;:</translation>
    </message>
    <message>
        <source>MIME type</source>
        <translation>Type MIME</translation>
    </message>
    <message>
        <source>Add MIME type</source>
        <translation>Ajouter un type MIME</translation>
    </message>
    <message>
        <source>Edit MIME type</source>
        <translation>Modifier le type MIME</translation>
    </message>
    <message>
        <source>Categories</source>
        <translation>Catégories</translation>
    </message>
    <message>
        <source>Add category</source>
        <translation>Ajouter une catégorie</translation>
    </message>
    <message>
        <source>Category:</source>
        <translation>Catégorie&#xa0;:</translation>
    </message>
    <message>
        <source>Edit category</source>
        <translation>Modifier la catégorie</translation>
    </message>
    <message>
        <source>Keywords</source>
        <translation>Mots-clés</translation>
    </message>
    <message>
        <source>Add keyword</source>
        <translation>Ajouter un mot-clé</translation>
    </message>
    <message>
        <source>Keyword:</source>
        <translation>Mot-clé&#xa0;:</translation>
    </message>
    <message>
        <source>Edit keyword</source>
        <translation>Modifier le mot-clé</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Actions</translation>
    </message>
    <message>
        <source>Add action</source>
        <translation>Ajouter une action</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Modifier l&apos;action</translation>
    </message>
    <message>
        <source>Application</source>
        <translation>Application</translation>
    </message>
    <message>
        <source>Link</source>
        <translation>Lien</translation>
    </message>
    <message>
        <source>Directory</source>
        <translation>Dossier</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Attention</translation>
    </message>
    <message>
        <source>Desktop entry type was changed.
Some field values may be lost...
Continue?</source>
        <translation>Le type de l&apos;entrée de bureau a été modifié.
Certaines valeurs de champs risquent d&apos;être perdues...
Continuer&#xa0;?</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>Type</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nom</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Icône</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Commande</translation>
    </message>
    <message>
        <source>Terminal</source>
        <translation>Terminal</translation>
    </message>
    <message>
        <source>Path</source>
        <translation>Dossier de travail</translation>
    </message>
    <message>
        <source>Try exec</source>
        <translation>Commande de test</translation>
    </message>
    <message>
        <source>Url</source>
        <translation>URL</translation>
    </message>
    <message>
        <source>Generic name</source>
        <translation>Nom générique</translation>
    </message>
    <message>
        <source>Comment</source>
        <translation>Commentaire</translation>
    </message>
    <message>
        <source>No display</source>
        <translation>Ne pas afficher</translation>
    </message>
    <message>
        <source>Hidden</source>
        <translation>Masqué</translation>
    </message>
    <message>
        <source>Startup notify</source>
        <translation>Notification de lancement</translation>
    </message>
    <message>
        <source>Startup WM class</source>
        <translation>Classe de fenêtre au lancement</translation>
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
        <translation>Modifier</translation>
    </message>
    <message>
        <source>Send command to vel-wm to update
 edited menu, toolbar, etc.</source>
        <translation>Envoyer à vel-wm la commande de mise à jour
 du menu, de la barre d&apos;outils, etc. modifiés</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Avertissement</translation>
    </message>
    <message>
        <source>Can&apos;t send command to vel-wm</source>
        <translation>Impossible d&apos;envoyer la commande à vel-wm</translation>
    </message>
    <message>
        <source>This menu cannot be changed: the folder %1 does not exist.</source>
        <translation>Ce menu ne peut pas être modifié : le dossier %1 n&apos;existe pas.</translation>
    </message>
    <message>
        <source>This menu cannot be changed: you may not write to the folder %1.</source>
        <translation>Ce menu ne peut pas être modifié : vous n&apos;avez pas le droit d&apos;écrire dans le dossier %1.</translation>
    </message>
    <message>
        <source>Show hidden</source>
        <translation>Afficher les masqués</translation>
    </message>
    <message>
        <source>Filter by name, command or keyword</source>
        <translation>Filtrer par nom, commande ou mot-clé</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtre</translation>
    </message>
    <message>
        <source>Also show the entries that the menu leaves out</source>
        <translation>Afficher aussi les entrées que le menu omet</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erreur</translation>
    </message>
    <message>
        <source>Start menu</source>
        <translation>Menu de démarrage</translation>
    </message>
</context>
<context>
    <name>VelMenuView</name>
    <message>
        <source>Warning</source>
        <translation>Avertissement</translation>
    </message>
    <message>
        <source>Can&apos;t start:
%1 %2</source>
        <translation>Impossible de démarrer&#xa0;:
%1 %2</translation>
    </message>
    <message>
        <source>All previous shortcuts
will be lost. Are you sure?</source>
        <translation>Tous les raccourcis précédents
seront perdus. Voulez-vous vraiment continuer&#xa0;?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Modifier</translation>
    </message>
    <message>
        <source>New folder</source>
        <translation>Nouveau dossier</translation>
    </message>
    <message>
        <source>New entry</source>
        <translation>Nouvelle entrée</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>Execute</source>
        <translation>Exécuter</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>Chercher</translation>
    </message>
    <message>
        <source>Find Next</source>
        <translation>Poursuivre la recherche</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>Couper</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copier</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Coller</translation>
    </message>
    <message>
        <source>Default menu...</source>
        <translation>Menu par défaut...</translation>
    </message>
    <message>
        <source>Up</source>
        <translation>Monter</translation>
    </message>
    <message>
        <source>Down</source>
        <translation>Descendre</translation>
    </message>
    <message>
        <source>Move</source>
        <translation>Déplacer</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Groupe</translation>
    </message>
    <message>
        <source>Shortcut</source>
        <translation>Raccourci</translation>
    </message>
    <message>
        <source>Can&apos;t edit non desktop file</source>
        <translation>Impossible de modifier un fichier qui n&apos;est pas un fichier «&#xa0;desktop&#xa0;»</translation>
    </message>
    <message>
        <source>Desktop Entry %1</source>
        <translation>Entrée de bureau %1</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Attention</translation>
    </message>
    <message>
        <source>Are you sure to delete it?</source>
        <translation>Voulez-vous vraiment supprimer cet élément&#xa0;?</translation>
    </message>
    <message>
        <source>Find string:</source>
        <translation>Chaîne à chercher&#xa0;:</translation>
    </message>
    <message>
        <source>&apos;%1&apos; not found .</source>
        <translation>«&#xa0;%1&#xa0;» est introuvable.</translation>
    </message>
    <message>
        <source>Not in the menu: it is not meant for this desktop.</source>
        <translation>Absent du menu : l&apos;entrée n&apos;est pas destinée à cet environnement.</translation>
    </message>
    <message>
        <source>Not in the menu: it is meant for other desktops only (%1).</source>
        <translation>Absent du menu : l&apos;entrée n&apos;est destinée qu&apos;à d&apos;autres environnements (%1).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked as deleted (Hidden).</source>
        <translation>Absent du menu : l&apos;entrée est marquée comme supprimée (Hidden).</translation>
    </message>
    <message>
        <source>Not in the menu: it is marked not to be displayed (NoDisplay).</source>
        <translation>Absent du menu : l&apos;entrée est marquée comme à ne pas afficher (NoDisplay).</translation>
    </message>
    <message>
        <source>Not in the menu: the program %1 is not installed (TryExec).</source>
        <translation>Absent du menu : le programme %1 n&apos;est pas installé (TryExec).</translation>
    </message>
    <message>
        <source>This file is not a desktop entry, whatever its name says.</source>
        <translation>Ce fichier n&apos;est pas une entrée de bureau, quoi qu&apos;en dise son nom.</translation>
    </message>
    <message>
        <source>This file cannot be read.</source>
        <translation>Ce fichier ne peut pas être lu.</translation>
    </message>
    <message>
        <source>This entry has no name. The name of its file is shown.</source>
        <translation>Cette entrée n&apos;a pas de nom. Le nom de son fichier est affiché.</translation>
    </message>
    <message>
        <source>Taking back what was done...</source>
        <translation>Annulation de ce qui a été fait...</translation>
    </message>
    <message>
        <source>The program that holds the clipboard does not answer. Nothing was pasted.</source>
        <translation>Le programme qui détient le presse-papiers ne répond pas. Rien n&apos;a été collé.</translation>
    </message>
    <message>
        <source>Nothing can be created in %1, because there is no such folder.</source>
        <translation>Rien ne peut être créé dans %1, car ce dossier n&apos;existe pas.</translation>
    </message>
    <message>
        <source>%1 could not be saved. Make sure that the folder %2 may be written and that the disk is not full, then try again.</source>
        <translation>%1 n&apos;a pas pu être enregistré. Assurez-vous que l&apos;écriture dans le dossier %2 est permise et que le disque n&apos;est pas plein, puis réessayez.</translation>
    </message>
    <message>
        <source>%1 could not be deleted: %2. Make sure that the folder that holds it may be written, then try again.</source>
        <translation>%1 n&apos;a pas pu être supprimé : %2. Assurez-vous que l&apos;écriture dans le dossier qui le contient est permise, puis réessayez.</translation>
    </message>
    <message>
        <source>%1 was deleted in part only, because %2 could not be deleted: %3. Make sure that its folder may be written, then delete the rest.</source>
        <translation>%1 n&apos;a été supprimé qu&apos;en partie, car %2 n&apos;a pas pu être supprimé : %3. Assurez-vous que l&apos;écriture dans son dossier est permise, puis supprimez le reste.</translation>
    </message>
    <message>
        <source>Nothing in this menu matches &apos;%1&apos;.</source>
        <translation>Rien dans ce menu ne correspond à « %1 ».</translation>
    </message>
    <message>
        <source>Searching the menu for &apos;%1&apos;...</source>
        <translation>Recherche de « %1 » dans le menu...</translation>
    </message>
    <message>
        <source>The menu is too large to be searched as a whole. Only a part of it was searched.</source>
        <translation>Le menu est trop grand pour être parcouru en entier. Seule une partie l&apos;a été.</translation>
    </message>
    <message>
        <source>Hide</source>
        <translation>Masquer</translation>
    </message>
    <message>
        <source>Show again</source>
        <translation>Afficher de nouveau</translation>
    </message>
    <message>
        <source>&apos;%1&apos; was not changed: the file %2 cannot be written.</source>
        <translation>« %1 » n&apos;a pas été modifié : l&apos;écriture dans le fichier %2 est impossible.</translation>
    </message>
    <message>
        <source>The order of the folder %1 could not be saved. Make sure that the folder may be written and that the disk is not full, then try again.</source>
        <translation>L&apos;ordre du dossier %1 n&apos;a pas pu être enregistré. Assurez-vous que l&apos;écriture dans le dossier est permise et que le disque n&apos;est pas plein, puis réessayez.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1. The menu was left as it is.</source>
        <translation>Le menu par défaut n&apos;a pas pu être construit dans %1. Le menu est resté tel quel.</translation>
    </message>
    <message>
        <source>Menu</source>
        <comment>the tree</comment>
        <translation>Menu</translation>
    </message>
    <message>
        <source>%1 cannot be edited, because the folder %2 may not be written.</source>
        <translation>%1 ne peut pas être édité, car l&apos;écriture dans le dossier %2 n&apos;est pas permise.</translation>
    </message>
    <message>
        <source>Moving files...</source>
        <translation>Déplacement des fichiers...</translation>
    </message>
    <message>
        <source>Copying files...</source>
        <translation>Copie des fichiers...</translation>
    </message>
    <message>
        <source>Deleting files...</source>
        <translation>Suppression des fichiers...</translation>
    </message>
    <message>
        <source>The deletion of %1 was canceled. What was not yet deleted is still there.</source>
        <translation>La suppression de %1 a été interrompue. Ce qui n&apos;était pas encore supprimé est toujours là.</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Recharger</translation>
    </message>
    <message>
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Ce menu est vide. Appuyez sur %1 pour une nouvelle entrée, ou faites ici un clic droit pour voir ce qui peut encore être ajouté.</translation>
    </message>
</context>
<context>
    <name>VelUI::ActionPropsDialog</name>
    <message>
        <source>Id</source>
        <translation>Identifiant</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Nom</translation>
    </message>
    <message>
        <source>Icon</source>
        <translation>Icône</translation>
    </message>
    <message>
        <source>Exec</source>
        <translation>Commande</translation>
    </message>
    <message>
        <source>Only show in</source>
        <translation>Afficher uniquement dans</translation>
    </message>
    <message>
        <source>Add desktop environment:</source>
        <translation>Ajouter un environnement de bureau&#xa0;:</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Modifier l&apos;environnement de bureau&#xa0;:</translation>
    </message>
    <message>
        <source>Not show in</source>
        <translation>Ne pas afficher dans</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsWidget</name>
    <message>
        <source>Add action</source>
        <translation>Ajouter une action</translation>
    </message>
    <message>
        <source>Edit action</source>
        <translation>Modifier l&apos;action</translation>
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
        <translation>Ajouter une chaîne</translation>
    </message>
    <message>
        <source>String:</source>
        <translation>Chaîne&#xa0;:</translation>
    </message>
    <message>
        <source>Edit string</source>
        <translation>Modifier la chaîne</translation>
    </message>
</context>
<context>
    <name>VelUI::FormLayout</name>
    <message>
        <source>Edit %1</source>
        <comment>name of a &quot;...&quot; button</comment>
        <translation>Modifier %1</translation>
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
        <translation>Choisir le chemin de l&apos;exécutable de l&apos;application</translation>
    </message>
</context>
</TS>

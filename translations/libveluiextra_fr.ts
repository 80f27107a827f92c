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
        <translation>Touche par défaut :</translation>
    </message>
    <message>
        <source>Assign key:</source>
        <translation>Affecter une touche :</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>Le raccourci « %1 » est déjà utilisé pour l&apos;action globale « %2 ».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;. Please try another.</source>
        <translation>Le raccourci « %1 » est déjà utilisé pour l&apos;action « %2 ». Veuillez en essayer un autre.</translation>
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
        <translation>Certains raccourcis ont été modifiés. Voulez-vous appliquer les modifications ?</translation>
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
        <translation>Impossible de déplacer %1 : %2</translation>
    </message>
    <message>
        <source>Can&apos;t copy %1: %2</source>
        <translation>Impossible de copier %1 : %2</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Attention</translation>
    </message>
    <message>
        <source>%1 already exists. Overwrite?</source>
        <translation>%1 existe déjà. Voulez-vous l&apos;écraser ?</translation>
    </message>
</context>
<context>
    <name>ShortcutClash</name>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for action &apos;%2&apos;.</source>
        <translation>Le raccourci « %1 » est déjà utilisé pour l&apos;action « %2 ».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; of action &apos;%3&apos; begins with &apos;%1&apos;.</source>
        <translation>Le raccourci « %2 » de l&apos;action « %3 » commence par « %1 ».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%2&apos; begins with &apos;%1&apos;, the shortcut of action &apos;%3&apos;.</source>
        <translation>Le raccourci « %2 » commence par « %1 », le raccourci de l&apos;action « %3 ».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; opens the menu &apos;%2&apos;.</source>
        <translation>Le raccourci « %1 » ouvre le menu « %2 ».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; leads to &apos;%2&apos; in the window.</source>
        <translation>Le raccourci « %1 » mène à « %2 » dans la fenêtre.</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is the standard shortcut for &apos;%2&apos;.</source>
        <translation>Le raccourci « %1 » est le raccourci standard pour « %2 ».</translation>
    </message>
    <message>
        <source>Shortcut &apos;%1&apos; is already used for global action &apos;%2&apos;.</source>
        <translation>Le raccourci « %1 » est déjà utilisé pour l&apos;action globale « %2 ».</translation>
    </message>
    <message>
        <source>With &apos;%1&apos; as a shortcut this key cannot be typed into texts.</source>
        <translation>Avec « %1 » comme raccourci, cette touche ne peut plus être saisie dans les textes.</translation>
    </message>
    <message>
        <source>The current keyboard layout cannot produce &apos;%1&apos;.</source>
        <translation>La disposition de clavier actuelle ne permet pas de produire « %1 ».</translation>
    </message>
</context>
<context>
    <name>ShortcutScheme</name>
    <message>
        <source>The shortcuts could not be saved to %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Impossible d&apos;enregistrer les raccourcis dans %1 : %2</translation>
    </message>
    <message>
        <source>The shortcuts could not be read from %1: %2</source>
        <comment>%2: what the system says</comment>
        <translation>Impossible de lire les raccourcis dans %1 : %2</translation>
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
        <translation>Des raccourcis illisibles dans %1 ont été ignorés : %2</translation>
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
</context>
<context>
    <name>StandardKeyNames</name>
    <message>
        <source>Help</source>
        <translation>Aide</translation>
    </message>
    <message>
        <source>What&apos;s this?</source>
        <translation>Qu&apos;est-ce que c&apos;est ?</translation>
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
        <translation>Une &lt;b&gt;entrée de bureau&lt;/b&gt; est un fichier d&apos;informations polyvalent pour les applications installées, les périphériques, etc. Elle peut servir à construire des éléments de menu, des raccourcis, etc. Cette boîte de dialogue met en œuvre le « Desktop Entry Standard » de &lt;a href=&quot;https://www.freedesktop.org&quot;&gt;https://www.freedesktop.org&lt;/a&gt;.&lt;br&gt;&lt;br&gt;Le fichier d&apos;une entrée de bureau est un fichier texte de type INI avec une section principale [Desktop Entry] et éventuellement des sections supplémentaires pour chaque action définie dans le champ « Actions » de la section principale. Tous les champs sont des paires de chaînes de texte : clé=valeur. La valeur peut aussi être une liste de chaînes séparées par des points-virgules.</translation>
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
        <translation>Ajouter un environnement de bureau :</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Modifier l&apos;environnement de bureau :</translation>
    </message>
    <message>
        <source>MIME type or file name extension:</source>
        <translation>Type MIME ou extension de nom de fichier :</translation>
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
        <translation>Catégorie :</translation>
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
        <translation>Mot-clé :</translation>
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
Continuer ?</translation>
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
        <translation>Impossible de démarrer :
%1 %2</translation>
    </message>
    <message>
        <source>All previous shortcuts
will be lost. Are you sure?</source>
        <translation>Tous les raccourcis précédents
seront perdus. Voulez-vous vraiment continuer ?</translation>
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
        <translation>Impossible de modifier un fichier qui n&apos;est pas un fichier « desktop »</translation>
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
        <translation>Voulez-vous vraiment supprimer cet élément ?</translation>
    </message>
    <message>
        <source>Find string:</source>
        <translation>Chaîne à chercher :</translation>
    </message>
    <message>
        <source>&apos;%1&apos; not found .</source>
        <translation>« %1 » est introuvable.</translation>
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
        <translation>Ajouter un environnement de bureau :</translation>
    </message>
    <message>
        <source>Edit desktop environment:</source>
        <translation>Modifier l&apos;environnement de bureau :</translation>
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
        <translation>Chaîne :</translation>
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

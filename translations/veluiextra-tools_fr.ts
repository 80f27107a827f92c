<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr" sourcelanguage="en">
<context>
    <name>DesktopEntryPages</name>
    <message>
        <source>&amp;Read-only</source>
        <translation>&amp;Lecture seule</translation>
    </message>
    <message>
        <source>&amp;Button beside the address</source>
        <translation>&amp;Bouton à côté de l&apos;adresse</translation>
    </message>
    <message>
        <source>Information requested for %1</source>
        <translation>Informations demandées sur %1</translation>
    </message>
    <message>
        <source>Use the buttons beside the fields to edit commands, files, icons, lists and actions.</source>
        <translation>Les commandes et les fichiers, les icônes, les listes et les actions se modifient avec les boutons de leurs champs.</translation>
    </message>
    <message>
        <source>Properties form</source>
        <translation>Formulaire de propriétés</translation>
    </message>
    <message>
        <source>Desktop entries</source>
        <translation>Entrées de bureau</translation>
    </message>
    <message>
        <source>Paths, icons, lists and actions</source>
        <translation>Chemins, icônes, listes et actions</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Assistance</translation>
    </message>
</context>
<context>
    <name>EditorCommands</name>
    <message>
        <source>Open</source>
        <translation>Ouvrir</translation>
    </message>
    <message>
        <source>Cannot read %1.</source>
        <translation>Impossible de lire %1.</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Enregistrer</translation>
    </message>
    <message>
        <source>Cannot write %1.</source>
        <translation>Impossible d&apos;écrire %1.</translation>
    </message>
    <message>
        <source>Go to line</source>
        <translation>Aller à la ligne</translation>
    </message>
    <message>
        <source>Line:</source>
        <translation>Ligne&#xa0;:</translation>
    </message>
    <message>
        <source>File</source>
        <translation>Fichier</translation>
    </message>
    <message>
        <source>&amp;New</source>
        <translation>&amp;Nouveau</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>&amp;Ouvrir...</translation>
    </message>
    <message>
        <source>&amp;Save...</source>
        <translation>&amp;Enregistrer...</translation>
    </message>
    <message>
        <source>Insert &amp;date</source>
        <translation>Insérer la &amp;date</translation>
    </message>
    <message>
        <source>Insert &amp;time</source>
        <translation>Insérer l&apos;&amp;heure</translation>
    </message>
    <message>
        <source>Insert &amp;rule</source>
        <translation>Insérer une &amp;ligne de séparation</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Édition</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Annuler</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Refaire</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>Co&amp;uper</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Copier</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>C&amp;oller</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>&amp;Tout sélectionner</translation>
    </message>
    <message>
        <source>Select word</source>
        <translation>Sélectionner le mot</translation>
    </message>
    <message>
        <source>Select line</source>
        <translation>Sélectionner la ligne</translation>
    </message>
    <message>
        <source>Select paragraph</source>
        <translation>Sélectionner le paragraphe</translation>
    </message>
    <message>
        <source>Find selected a&amp;gain</source>
        <translation>Chercher la sélection &amp;suivante</translation>
    </message>
    <message>
        <source>Find selected backward</source>
        <translation>Chercher la sélection précédente</translation>
    </message>
    <message>
        <source>Find selected word</source>
        <translation>Chercher le mot sélectionné</translation>
    </message>
    <message>
        <source>Find selected, matching case</source>
        <translation>Chercher la sélection en respectant la casse</translation>
    </message>
    <message>
        <source>Go to &amp;line...</source>
        <translation>Aller à la &amp;ligne...</translation>
    </message>
    <message>
        <source>Go to start</source>
        <translation>Aller au début</translation>
    </message>
    <message>
        <source>Go to end</source>
        <translation>Aller à la fin</translation>
    </message>
    <message>
        <source>Go to next paragraph</source>
        <translation>Aller au paragraphe suivant</translation>
    </message>
    <message>
        <source>Go to previous paragraph</source>
        <translation>Aller au paragraphe précédent</translation>
    </message>
    <message>
        <source>Delete word to the left</source>
        <translation>Supprimer le mot à gauche</translation>
    </message>
    <message>
        <source>Delete word to the right</source>
        <translation>Supprimer le mot à droite</translation>
    </message>
    <message>
        <source>Delete to start of line</source>
        <translation>Supprimer jusqu&apos;au début de la ligne</translation>
    </message>
    <message>
        <source>Delete to end of line</source>
        <translation>Supprimer jusqu&apos;à la fin de la ligne</translation>
    </message>
    <message>
        <source>To upper case</source>
        <translation>Mettre en majuscules</translation>
    </message>
    <message>
        <source>To lower case</source>
        <translation>Mettre en minuscules</translation>
    </message>
    <message>
        <source>Swap case</source>
        <translation>Inverser la casse</translation>
    </message>
    <message>
        <source>Capitalize</source>
        <translation>Mettre une majuscule initiale</translation>
    </message>
    <message>
        <source>Move line up</source>
        <translation>Déplacer la ligne vers le haut</translation>
    </message>
    <message>
        <source>Move line down</source>
        <translation>Déplacer la ligne vers le bas</translation>
    </message>
    <message>
        <source>New line above</source>
        <translation>Nouvelle ligne au-dessus</translation>
    </message>
    <message>
        <source>New line below</source>
        <translation>Nouvelle ligne en dessous</translation>
    </message>
    <message>
        <source>Duplicate lines</source>
        <translation>Dupliquer les lignes</translation>
    </message>
    <message>
        <source>Join lines</source>
        <translation>Fusionner les lignes</translation>
    </message>
    <message>
        <source>Sort lines</source>
        <translation>Trier les lignes</translation>
    </message>
    <message>
        <source>Reverse lines</source>
        <translation>Inverser l&apos;ordre des lignes</translation>
    </message>
    <message>
        <source>Remove duplicate lines</source>
        <translation>Supprimer les lignes en double</translation>
    </message>
    <message>
        <source>Remove empty lines</source>
        <translation>Supprimer les lignes vides</translation>
    </message>
    <message>
        <source>Trim lines</source>
        <translation>Rogner les lignes</translation>
    </message>
    <message>
        <source>Indent lines</source>
        <translation>Indenter les lignes</translation>
    </message>
    <message>
        <source>Unindent lines</source>
        <translation>Désindenter les lignes</translation>
    </message>
    <message>
        <source>Comment lines</source>
        <translation>Commenter les lignes</translation>
    </message>
    <message>
        <source>Uncomment lines</source>
        <translation>Décommenter les lignes</translation>
    </message>
    <message>
        <source>Tabs to spaces</source>
        <translation>Tabulations en espaces</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Affichage</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>&amp;Agrandir</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>&amp;Réduire</translation>
    </message>
    <message>
        <source>&amp;Wrap lines</source>
        <translation>&amp;Couper les lignes</translation>
    </message>
    <message>
        <source>&amp;Fixed-width font</source>
        <translation>Chasse &amp;fixe</translation>
    </message>
    <message>
        <source>&amp;Proportional font</source>
        <translation>Chasse &amp;proportionnelle</translation>
    </message>
    <message>
        <source>O&amp;verwrite</source>
        <translation>&amp;Écraser</translation>
    </message>
    <message>
        <source>&amp;Read only</source>
        <translation>&amp;Lecture seule</translation>
    </message>
    <message>
        <source>Wide cur&amp;sor</source>
        <translation>&amp;Gros curseur</translation>
    </message>
    <message>
        <source>&amp;Center on cursor</source>
        <translation>Ce&amp;ntrer sur le curseur</translation>
    </message>
    <message>
        <source>Scroll &amp;up</source>
        <translation>Défiler vers le &amp;haut</translation>
    </message>
    <message>
        <source>Scroll &amp;down</source>
        <translation>Défiler vers le &amp;bas</translation>
    </message>
    <message>
        <source>Scroll to &amp;top</source>
        <translation>Défiler jusqu&apos;au &amp;début</translation>
    </message>
    <message>
        <source>Scroll to botto&amp;m</source>
        <translation>Défiler jusqu&apos;à la f&amp;in</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Texte</translation>
    </message>
    <message>
        <source>Keys</source>
        <translation>Touches</translation>
    </message>
    <message>
        <source>The file has %1 for %2, but %3 has it, too.</source>
        <translation>Le fichier contient %1 pour %2, mais %3 l&apos;utilise aussi.</translation>
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
        <source>&amp;Export keys...</source>
        <translation>Exporter les &amp;touches...</translation>
    </message>
    <message>
        <source>&amp;Import keys...</source>
        <translation>&amp;Importer les touches...</translation>
    </message>
    <message>
        <source>Save cheat sheet as &amp;HTML...</source>
        <translation>En&amp;registrer l&apos;aide-mémoire en HTML...</translation>
    </message>
    <message>
        <source>Save cheat sheet as te&amp;xt...</source>
        <translation>Enregistrer l&apos;aide-mémoire en te&amp;xte...</translation>
    </message>
    <message>
        <source>&amp;Copy cheat sheet</source>
        <translation>&amp;Copier l&apos;aide-mémoire</translation>
    </message>
</context>
<context>
    <name>EntryWindow</name>
    <message>
        <source>Unsaved changes</source>
        <translation>Modifications non enregistrées</translation>
    </message>
    <message>
        <source>The entry %1 was changed.
Save the changes?</source>
        <translation>L&apos;entrée %1 a été modifiée.
Voulez-vous enregistrer les modifications&#xa0;?</translation>
    </message>
</context>
<context>
    <name>FileIconsPage</name>
    <message>
        <source>File icons</source>
        <translation>Icônes de fichiers</translation>
    </message>
    <message>
        <source>Models</source>
        <translation>Modèles</translation>
    </message>
</context>
<context>
    <name>GalleryWindow</name>
    <message>
        <source>Widget gallery</source>
        <translation>Galerie de composants graphiques</translation>
    </message>
    <message>
        <source>Pages</source>
        <translation>Pages</translation>
    </message>
    <message>
        <source>Code of this page</source>
        <translation>Code de cette page</translation>
    </message>
</context>
<context>
    <name>KeyNamesPage</name>
    <message>
        <source>&amp;Press keys:</source>
        <translation>&amp;Appuyer sur des touches&#xa0;:</translation>
    </message>
    <message>
        <source>In the window manager&apos;s notation:</source>
        <translation>Telles que les écrit le gestionnaire de fenêtres&#xa0;:</translation>
    </message>
    <message>
        <source>Read back:</source>
        <translation>Relu&#xa0;:</translation>
    </message>
    <message>
        <source>Global action with these keys:</source>
        <translation>Action globale avec ces touches&#xa0;:</translation>
    </message>
    <message>
        <source>Key names</source>
        <translation>Noms des touches</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Raccourcis clavier</translation>
    </message>
</context>
<context>
    <name>MenuPages</name>
    <message>
        <source>&amp;Pick an entry...</source>
        <translation>&amp;Choisir une entrée...</translation>
    </message>
    <message>
        <source>Edit the &amp;menu...</source>
        <translation>Modifier le &amp;menu...</translation>
    </message>
    <message>
        <source>Edit an e&amp;ntry...</source>
        <translation>Modifier une e&amp;ntrée...</translation>
    </message>
    <message>
        <source>Menu tree</source>
        <translation>Arborescence de menu</translation>
    </message>
    <message>
        <source>Menus</source>
        <translation>Menus</translation>
    </message>
    <message>
        <source>Menu and entry dialogs</source>
        <translation>Boîtes de dialogue de menu et d&apos;entrée</translation>
    </message>
    <message>
        <source>&amp;Assistance</source>
        <translation>&amp;Assistance</translation>
    </message>
</context>
<context>
    <name>RadioGroupBoxPage</name>
    <message>
        <source>&amp;Automatic configuration</source>
        <translation>Configuration &amp;automatique</translation>
    </message>
    <message>
        <source>Script address:</source>
        <translation>Adresse du script&#xa0;:</translation>
    </message>
    <message>
        <source>Ask again at every start</source>
        <translation>Redemander à chaque démarrage</translation>
    </message>
    <message>
        <source>&amp;Manual configuration</source>
        <translation>Configuration &amp;manuelle</translation>
    </message>
    <message>
        <source>Host:</source>
        <translation>Hôte&#xa0;:</translation>
    </message>
    <message>
        <source>Port:</source>
        <translation>Port&#xa0;:</translation>
    </message>
    <message>
        <source>Protocol:</source>
        <translation>Protocole&#xa0;:</translation>
    </message>
    <message>
        <source>&amp;Direct connection</source>
        <translation>Connexion &amp;directe</translation>
    </message>
    <message>
        <source>There is nothing to set.</source>
        <translation>Il n&apos;y a rien à configurer.</translation>
    </message>
    <message>
        <source>Radio group boxes</source>
        <translation>Boîtes de groupe à bouton radio</translation>
    </message>
    <message>
        <source>Widgets</source>
        <translation>Composants graphiques</translation>
    </message>
</context>
<context>
    <name>SettingsPage</name>
    <message>
        <source>Settings file</source>
        <translation>Fichier de paramètres</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Paramètres</translation>
    </message>
    <message>
        <source>F&amp;lat buttons</source>
        <translation>Boutons &amp;plats</translation>
    </message>
    <message>
        <source>S&amp;ection:</source>
        <translation>&amp;Section&#xa0;:</translation>
    </message>
    <message>
        <source>&amp;Font:</source>
        <translation>P&amp;olice&#xa0;:</translation>
    </message>
    <message>
        <source>&amp;Size:</source>
        <translation>&amp;Taille&#xa0;:</translation>
    </message>
    <message>
        <source>Contents of the file on disk</source>
        <translation>Contenu du fichier sur le disque</translation>
    </message>
    <message>
        <source>Name a settings file on the command line to edit it here.</source>
        <translation>Indiquez un fichier de paramètres sur la ligne de commande pour le modifier ici.</translation>
    </message>
    <message>
        <source>%1 cannot be opened.</source>
        <translation>Impossible d&apos;ouvrir %1.</translation>
    </message>
</context>
<context>
    <name>ShortcutsPage</name>
    <message>
        <source>Delete the whole line</source>
        <translation>Supprimer toute la ligne</translation>
    </message>
    <message>
        <source>Last command: %1</source>
        <translation>Dernière commande&#xa0;: %1</translation>
    </message>
    <message>
        <source>one line
another line
and a third one
</source>
        <translation>une ligne
une autre ligne
et une troisième
</translation>
    </message>
    <message>
        <source>Go to the editor</source>
        <translation>Aller à l&apos;éditeur</translation>
    </message>
    <message>
        <source>View</source>
        <translation>Affichage</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Paramètres</translation>
    </message>
    <message>
        <source>Configure shortcuts...</source>
        <translation>Configurer les raccourcis clavier...</translation>
    </message>
    <message>
        <source>Shortcuts</source>
        <translation>Raccourcis clavier</translation>
    </message>
    <message>
        <source>Configure shortcuts in the plain dialog...</source>
        <translation>Configurer les raccourcis clavier dans la boîte de dialogue simple...</translation>
    </message>
</context>
<context>
    <name>vel-entryedit</name>
    <message>
        <source>Edits a desktop entry.</source>
        <translation>Modifie une entrée de bureau.</translation>
    </message>
    <message>
        <source>Make a new entry when there is no such file.</source>
        <translation>Créer une nouvelle entrée si le fichier n&apos;existe pas.</translation>
    </message>
    <message>
        <source>Begin with the values of the entry &lt;file&gt;.</source>
        <translation>Partir des valeurs de l&apos;entrée &lt;file&gt;.</translation>
    </message>
    <message>
        <source>Show the entry only.</source>
        <translation>Afficher seulement l&apos;entrée.</translation>
    </message>
    <message>
        <source>The entry to edit.</source>
        <translation>L&apos;entrée à modifier.</translation>
    </message>
    <message>
        <source>one file has to be named</source>
        <translation>il faut indiquer un fichier</translation>
    </message>
    <message>
        <source>cannot open %1</source>
        <translation>impossible d&apos;ouvrir %1</translation>
    </message>
    <message>
        <source>cannot open %1: there is no such file, --create makes a new entry</source>
        <translation>impossible d&apos;ouvrir %1&#xa0;: ce fichier n&apos;existe pas, --create crée une nouvelle entrée</translation>
    </message>
    <message>
        <source>cannot open %1: it is no regular file</source>
        <translation>impossible d&apos;ouvrir %1&#xa0;: ce n&apos;est pas un fichier ordinaire</translation>
    </message>
    <message>
        <source>cannot open %1: %2</source>
        <translation>impossible d&apos;ouvrir %1&#xa0;: %2</translation>
    </message>
</context>
<context>
    <name>vel-gallery</name>
    <message>
        <source>the page %1 did not finish loading</source>
        <translation>la page %1 n&apos;a pas pu être préparée</translation>
    </message>
    <message>
        <source>cannot write %1</source>
        <translation>impossible d&apos;écrire %1</translation>
    </message>
    <message>
        <source>cannot make the folder %1</source>
        <translation>impossible de créer le dossier %1</translation>
    </message>
    <message>
        <source>Shows the library&apos;s widgets, dialogs and models in action.</source>
        <translation>Montre les composants graphiques, boîtes de dialogue et modèles de la bibliothèque à l&apos;œuvre.</translation>
    </message>
    <message>
        <source>Start with the page &lt;name&gt;.</source>
        <translation>Commencer par la page &lt;name&gt;.</translation>
    </message>
    <message>
        <source>Write screenshots of every page, or of the page given with --page, to &lt;dir&gt; and exit.</source>
        <translation>Écrire dans &lt;dir&gt; des images de toutes les pages, ou de celle indiquée par --page, puis quitter.</translation>
    </message>
    <message>
        <source>The settings file that the settings page edits.</source>
        <translation>Le fichier de paramètres que modifie la page des paramètres.</translation>
    </message>
    <message>
        <source>Widget gallery</source>
        <translation>Galerie de composants graphiques</translation>
    </message>
    <message>
        <source>there is no page %1</source>
        <translation>il n&apos;y a pas de page %1</translation>
    </message>
</context>
<context>
    <name>vel-menuedit</name>
    <message>
        <source>cannot create the start menu %1</source>
        <translation>impossible de créer le menu de démarrage %1</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>ce dossier n&apos;existe pas&#xa0;: %1</translation>
    </message>
    <message>
        <source>not a directory: %1</source>
        <translation>n&apos;est pas un dossier&#xa0;: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>impossible de lire le dossier %1</translation>
    </message>
    <message>
        <source>Edits the start menu, or picks an entry of it.</source>
        <translation>Modifie le menu de démarrage ou y choisit une entrée.</translation>
    </message>
    <message>
        <source>Show the menu directory &lt;dir&gt; instead of the start menu.</source>
        <translation>Afficher le dossier de menu &lt;dir&gt; au lieu du menu de démarrage.</translation>
    </message>
    <message>
        <source>Show the desktop folder.</source>
        <translation>Afficher le dossier du bureau.</translation>
    </message>
    <message>
        <source>Show the tool bar.</source>
        <translation>Afficher la barre d&apos;outils.</translation>
    </message>
    <message>
        <source>Look only, change nothing.</source>
        <translation>Regarder seulement, ne rien modifier.</translation>
    </message>
    <message>
        <source>Show icons of &lt;pixels&gt; pixels.</source>
        <translation>Afficher des icônes de &lt;pixels&gt; pixels.</translation>
    </message>
    <message>
        <source>Pick an entry and print its path and its command line.</source>
        <translation>Choisir une entrée et afficher son chemin et sa ligne de commande.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>argument inattendu&#xa0;: %1</translation>
    </message>
    <message>
        <source>only one of --dir, --desktop and --toolbar can be given</source>
        <translation>une seule des options --dir, --desktop et --toolbar peut être indiquée</translation>
    </message>
    <message>
        <source>--icon-size needs a number of pixels from 1 to 512, not &quot;%1&quot;</source>
        <translation>--icon-size attend un nombre de pixels de 1 à 512, pas «&#xa0;%1&#xa0;»</translation>
    </message>
</context>
<context>
    <name>vel-menuprint</name>
    <message>
        <source>Prints a menu directory in its order.</source>
        <translation>Affiche un dossier de menu dans son ordre.</translation>
    </message>
    <message>
        <source>The menu directory; the start menu when none is given.</source>
        <translation>Le dossier de menu&#xa0;; le menu de démarrage si aucun n&apos;est indiqué.</translation>
    </message>
    <message>
        <source>unknown format: %1</source>
        <translation>format inconnu&#xa0;: %1</translation>
    </message>
    <message>
        <source>more than one directory</source>
        <translation>plus d&apos;un dossier</translation>
    </message>
    <message>
        <source>no such directory: %1</source>
        <translation>ce dossier n&apos;existe pas&#xa0;: %1</translation>
    </message>
    <message>
        <source>cannot read the directory %1</source>
        <translation>impossible de lire le dossier %1</translation>
    </message>
    <message>
        <source>The menu has more than %1 items or %2 levels, and the rest of it is left out. Look for links that lead into the same folders again.</source>
        <translation>Le menu a plus de %1 éléments ou %2 niveaux&#xa0;; le reste a été omis. Cherchez des liens qui mènent encore et encore aux mêmes dossiers.</translation>
    </message>
    <message>
        <source>What to print: %1. The default is text.</source>
        <translation>Ce qui est affiché&#xa0;: %1. La valeur par défaut est text.</translation>
    </message>
    <message>
        <source>The icon theme to take the files of icons from; the user&apos;s own when none is given.</source>
        <translation>Le thème d&apos;icônes d&apos;où viennent les fichiers des icônes&#xa0;; celui de l&apos;utilisateur si aucun n&apos;est indiqué.</translation>
    </message>
    <message>
        <source>The edge of the icons in pixels, 24 by default.</source>
        <translation>Le côté des icônes en pixels, 24 par défaut.</translation>
    </message>
    <message>
        <source>Reads one of the lines that rofi or dmenu was given from standard input and starts its entry.</source>
        <translation>Lire sur l&apos;entrée standard l&apos;une des lignes données à rofi ou dmenu et démarrer son entrée.</translation>
    </message>
    <message>
        <source>the size of icons is not between 1 and %1</source>
        <translation>la taille des icônes n&apos;est pas comprise entre 1 et %1</translation>
    </message>
    <message>
        <source>The start menu is empty: no application is installed.</source>
        <translation>Le menu de démarrage est vide&#xa0;: aucune application n&apos;est installée.</translation>
    </message>
    <message>
        <source>The start menu %1 cannot be made: %2</source>
        <translation>Le menu de démarrage %1 ne peut pas être créé&#xa0;: %2</translation>
    </message>
    <message>
        <source>%1 is left out, as the line end in its name cannot be written in this format. Rename it.</source>
        <translation>%1 est omis, car la fin de ligne contenue dans son nom ne peut pas être écrite dans ce format. Renommez-le.</translation>
    </message>
    <message>
        <source>The start menu is empty: nothing in %1 is shown.</source>
        <translation>Le menu de démarrage est vide&#xa0;: rien dans %1 n&apos;est affiché.</translation>
    </message>
    <message>
        <source>cannot run vel-open: %1</source>
        <translation>impossible d&apos;exécuter vel-open&#xa0;: %1</translation>
    </message>
    <message>
        <source>There is no &quot;%1&quot; in the menu.</source>
        <translation>Il n&apos;y a pas de «&#xa0;%1&#xa0;» dans le menu.</translation>
    </message>
</context>
<context>
    <name>vel-wmbridge</name>
    <message>
        <source>Owns the window manager&apos;s command channel on a desktop that has none, and runs a command of the shell for each kind of update. The variable VEL_COMMAND holds the line that came.</source>
        <translation>Tient le canal de commandes du gestionnaire de fenêtres sur un bureau qui n&apos;en a pas et exécute une commande du shell pour chaque sorte de mise à jour. La variable VEL_COMMAND contient la ligne reçue.</translation>
    </message>
    <message>
        <source>Run when the start menu has changed.</source>
        <translation>Exécuter quand le menu de démarrage a changé.</translation>
    </message>
    <message>
        <source>Run when the tool bar has changed.</source>
        <translation>Exécuter quand la barre d&apos;outils a changé.</translation>
    </message>
    <message>
        <source>Run when the desktop&apos;s entries have changed.</source>
        <translation>Exécuter quand les entrées du bureau ont changé.</translation>
    </message>
    <message>
        <source>Run for every other line.</source>
        <translation>Exécuter pour toute autre ligne.</translation>
    </message>
    <message>
        <source>Take the channel from the program that has it.</source>
        <translation>Prendre le canal au programme qui le tient.</translation>
    </message>
    <message>
        <source>unexpected argument: %1</source>
        <translation>argument inattendu&#xa0;: %1</translation>
    </message>
    <message>
        <source>cannot run the command for %1</source>
        <translation>impossible d&apos;exécuter la commande pour %1</translation>
    </message>
    <message>
        <source>another program has taken the channel</source>
        <translation>un autre programme a pris le canal</translation>
    </message>
    <message>
        <source>cannot take the channel: there is no display, or another program has it</source>
        <translation>impossible de prendre le canal&#xa0;: il n&apos;y a pas d&apos;affichage ou un autre programme le tient</translation>
    </message>
    <message>
        <source>unknown window manager: %1 (known are %2)</source>
        <translation>gestionnaire de fenêtres inconnu&#xa0;: %1 (sont connus %2)</translation>
    </message>
    <message>
        <source>Do what this window manager needs to show the start menu as it is: %1.</source>
        <translation>Faire ce dont ce gestionnaire de fenêtres a besoin pour afficher le menu de démarrage tel qu&apos;il est&#xa0;: %1.</translation>
    </message>
</context>
</TS>

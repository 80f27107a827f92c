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
    <name>EntryCheck</name>
    <message>
        <source>The condition &apos;%1&apos; needs a file.</source>
        <translation>La condition «&#xa0;%1&#xa0;» a besoin d&apos;un fichier.</translation>
    </message>
    <message>
        <source>The file of the condition &apos;%1&apos; is one in the folder of settings, without &apos;/&apos; before it.</source>
        <translation>Le fichier de la condition «&#xa0;%1&#xa0;» se trouve dans le dossier de configuration et s&apos;écrit sans «&#xa0;/&#xa0;» devant.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a key.</source>
        <translation>La condition «&#xa0;%1&#xa0;» a besoin d&apos;une clé.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs &apos;if-session&apos; or &apos;unless-session&apos; and a session.</source>
        <translation>La condition «&#xa0;%1&#xa0;» a besoin de «&#xa0;if-session&#xa0;» ou «&#xa0;unless-session&#xa0;» et d&apos;une session.</translation>
    </message>
    <message>
        <source>The condition &apos;%1&apos; needs a schema and a key.</source>
        <translation>La condition «&#xa0;%1&#xa0;» a besoin d&apos;un schéma et d&apos;une clé.</translation>
    </message>
    <message>
        <source>There is no condition &apos;%1&apos;.</source>
        <translation>La condition «&#xa0;%1&#xa0;» n&apos;existe pas.</translation>
    </message>
    <message>
        <source>A category is empty.</source>
        <translation>Une catégorie est vide.</translation>
    </message>
    <message>
        <source>There is no registered category &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Il n&apos;y a pas de catégorie enregistrée «&#xa0;%1&#xa0;»&#xa0;; une catégorie personnelle doit commencer par «&#xa0;X-&#xa0;».</translation>
    </message>
    <message>
        <source>Change it to &apos;%1&apos;</source>
        <translation>Changer en «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; also needs: %2.</source>
        <translation>La catégorie «&#xa0;%1&#xa0;» demande aussi&#xa0;: %2.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; goes with one of these: %2.</source>
        <translation>La catégorie «&#xa0;%1&#xa0;» va avec l&apos;une de celles-ci&#xa0;: %2.</translation>
    </message>
    <message>
        <source>Add &apos;%1&apos;</source>
        <translation>Ajouter «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Remove it</source>
        <translation>Retirer</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is out of use.</source>
        <translation>La catégorie «&#xa0;%1&#xa0;» n&apos;est plus utilisée.</translation>
    </message>
    <message>
        <source>The category &apos;%1&apos; is only for entries that list desktops in &apos;Only show in&apos;.</source>
        <translation>La catégorie «&#xa0;%1&#xa0;» est réservée aux entrées qui indiquent des environnements dans «&#xa0;Afficher uniquement dans&#xa0;».</translation>
    </message>
    <message>
        <source>No main category is among them, so menus may not know where to show the entry.</source>
        <translation>Aucune n&apos;est une catégorie principale&#xa0;: les menus risquent de ne pas savoir où afficher l&apos;entrée.</translation>
    </message>
    <message>
        <source>Several main categories are among them, so the entry may be shown more than once.</source>
        <translation>Plusieurs sont des catégories principales&#xa0;: l&apos;entrée risque d&apos;apparaître plus d&apos;une fois.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; stands more than once.</source>
        <translation>«&#xa0;%1&#xa0;» figure plus d&apos;une fois.</translation>
    </message>
    <message>
        <source>Keep the first</source>
        <translation>Garder le premier</translation>
    </message>
    <message>
        <source>The application has no command.</source>
        <translation>L&apos;application n&apos;a pas de commande.</translation>
    </message>
    <message>
        <source>The link leads nowhere.</source>
        <translation>Le lien ne mène nulle part.</translation>
    </message>
    <message>
        <source>A quote is not closed.</source>
        <translation>Des guillemets ne sont pas fermés.</translation>
    </message>
    <message>
        <source>In quotes, a backslash has to stand before &apos;%1&apos;.</source>
        <translation>Entre guillemets, «&#xa0;%1&#xa0;» doit être précédé d&apos;une barre oblique inverse.</translation>
    </message>
    <message>
        <source>The command ends in a single backslash, which stands for nothing.</source>
        <translation>La commande se termine par une barre oblique inverse isolée, qui ne représente rien.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to stand in double quotes.</source>
        <translation>«&#xa0;%1&#xa0;» doit être entre guillemets doubles.</translation>
    </message>
    <message>
        <source>Close the quote</source>
        <translation>Fermer les guillemets</translation>
    </message>
    <message>
        <source>Put it in quotes</source>
        <translation>Mettre entre guillemets</translation>
    </message>
    <message>
        <source>Have a shell run it</source>
        <translation>Faire exécuter par un shell</translation>
    </message>
    <message>
        <source>Write &apos;%&apos; as &apos;%%&apos;</source>
        <translation>Écrire «&#xa0;%&#xa0;» sous la forme «&#xa0;%%&#xa0;»</translation>
    </message>
    <message>
        <source>A field code is not complete: &apos;%&apos; ends the command.</source>
        <translation>Un code de champ est incomplet&#xa0;: «&#xa0;%&#xa0;» termine la commande.</translation>
    </message>
    <message>
        <source>There is no field code &apos;%%1&apos;.</source>
        <translation>Le code de champ «&#xa0;%%1&#xa0;» n&apos;existe pas.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; is out of use; nothing is put in its place.</source>
        <translation>Le code de champ «&#xa0;%%1&#xa0;» n&apos;est plus utilisé&#xa0;; rien ne prend sa place.</translation>
    </message>
    <message>
        <source>Only one of &apos;%f&apos;, &apos;%F&apos;, &apos;%u&apos; and &apos;%U&apos; may stand in a command, and once.</source>
        <translation>Une commande ne peut contenir qu&apos;un seul des codes «&#xa0;%f&#xa0;», «&#xa0;%F&#xa0;», «&#xa0;%u&#xa0;» et «&#xa0;%U&#xa0;», et une seule fois.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; stands more than once.</source>
        <translation>Le code de champ «&#xa0;%%1&#xa0;» figure plus d&apos;une fois.</translation>
    </message>
    <message>
        <source>The field code &apos;%%1&apos; has to be an argument of its own, not in quotes.</source>
        <translation>Le code de champ «&#xa0;%%1&#xa0;» doit être un argument à part, sans guillemets.</translation>
    </message>
    <message>
        <source>The path of the program has a blank: it has to stand in quotes.</source>
        <translation>Le chemin du programme contient un espace&#xa0;: il doit être entre guillemets.</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;.</source>
        <translation>Le programme «&#xa0;%1&#xa0;» n&apos;existe pas.</translation>
    </message>
    <message>
        <source>The command has to begin with a program.</source>
        <translation>La commande doit commencer par un programme.</translation>
    </message>
    <message>
        <source>&apos;Try exec&apos; takes the program alone, without quotes and arguments.</source>
        <translation>«&#xa0;Commande de test&#xa0;» n&apos;accepte que le programme, sans guillemets ni arguments.</translation>
    </message>
    <message>
        <source>Keep the program</source>
        <translation>Garder le programme</translation>
    </message>
    <message>
        <source>There is no program &apos;%1&apos;, so the entry is not shown.</source>
        <translation>Le programme «&#xa0;%1&#xa0;» n&apos;existe pas, l&apos;entrée n&apos;est donc pas affichée.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is missing.</source>
        <translation>«&#xa0;%1&#xa0;» manque.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has translations only, and nothing for all other languages.</source>
        <translation>«&#xa0;%1&#xa0;» n&apos;a que des traductions, et rien pour toutes les autres langues.</translation>
    </message>
    <message>
        <source>Take &apos;%1&apos;</source>
        <translation>Prendre «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is only for entries of the type &apos;%2&apos;.</source>
        <translation>«&#xa0;%1&#xa0;» est réservé aux entrées de type «&#xa0;%2&#xa0;».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here.</source>
        <translation>«&#xa0;%1&#xa0;» n&apos;est plus utilisé ici.</translation>
    </message>
    <message>
        <source>No key can be called &apos;%1&apos;.</source>
        <translation>Aucune clé ne peut s&apos;appeler «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>There is no key &apos;%1&apos; here; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>La clé «&#xa0;%1&#xa0;» n&apos;existe pas ici&#xa0;; une clé personnelle doit commencer par «&#xa0;X-&#xa0;».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; cannot be translated.</source>
        <translation>«&#xa0;%1&#xa0;» ne peut pas être traduit.</translation>
    </message>
    <message>
        <source>&apos;Only show in&apos; and &apos;Not show in&apos; exclude each other.</source>
        <translation>«&#xa0;Afficher uniquement dans&#xa0;» et «&#xa0;Ne pas afficher dans&#xa0;» s&apos;excluent.</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>Le fichier est vide.</translation>
    </message>
    <message>
        <source>The first group of the file is not &apos;[Desktop Entry]&apos;.</source>
        <translation>Le premier groupe du fichier n&apos;est pas «&#xa0;[Desktop Entry]&#xa0;».</translation>
    </message>
    <message>
        <source>The name of the file has to end in &apos;.%1&apos;.</source>
        <translation>Le nom du fichier doit se terminer par «&#xa0;.%1&#xa0;».</translation>
    </message>
    <message>
        <source>Lines of the file end in a carriage return.</source>
        <translation>Des lignes du fichier se terminent par un retour chariot.</translation>
    </message>
    <message>
        <source>A line of the file says nothing: %1</source>
        <translation>Une ligne du fichier ne dit rien&#xa0;: %1</translation>
    </message>
    <message>
        <source>A line of the file stands before all groups: %1</source>
        <translation>Une ligne du fichier se trouve avant tous les groupes&#xa0;: %1</translation>
    </message>
    <message>
        <source>A line of the file begins with a blank: %1</source>
        <translation>Une ligne du fichier commence par un espace&#xa0;: %1</translation>
    </message>
    <message>
        <source>A blank stands behind a group: %1</source>
        <translation>Un groupe est suivi d&apos;un espace&#xa0;: %1</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; stands more than once.</source>
        <translation>Le groupe «&#xa0;%1&#xa0;» figure plus d&apos;une fois.</translation>
    </message>
    <message>
        <source>No group can be called &apos;%1&apos;.</source>
        <translation>Aucun groupe ne peut s&apos;appeler «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>The group &apos;%1&apos; is out of use.</source>
        <translation>Le groupe «&#xa0;%1&#xa0;» n&apos;est plus utilisé.</translation>
    </message>
    <message>
        <source>There is no group &apos;%1&apos;; one of your own has to begin with &apos;X-&apos;.</source>
        <translation>Le groupe «&#xa0;%1&#xa0;» n&apos;existe pas&#xa0;; un groupe personnel doit commencer par «&#xa0;X-&#xa0;».</translation>
    </message>
    <message>
        <source>The id &apos;%1&apos; of an action may only have letters A to Z, digits and &apos;-&apos;.</source>
        <translation>L&apos;identifiant «&#xa0;%1&#xa0;» d&apos;une action ne peut contenir que des lettres de A à Z, des chiffres et «&#xa0;-&#xa0;».</translation>
    </message>
    <message>
        <source>The action &apos;%1&apos; is described, but &apos;Actions&apos; does not name it.</source>
        <translation>L&apos;action «&#xa0;%1&#xa0;» est décrite, mais «&#xa0;Actions&#xa0;» ne la mentionne pas.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has no &apos;/&apos;.</source>
        <translation>«&#xa0;%1&#xa0;» n&apos;est pas un type MIME&#xa0;: il n&apos;a pas de «&#xa0;/&#xa0;».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: nothing stands behind the &apos;/&apos;.</source>
        <translation>«&#xa0;%1&#xa0;» n&apos;est pas un type MIME&#xa0;: rien ne suit le «&#xa0;/&#xa0;».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: there is no kind &apos;%2&apos;.</source>
        <translation>«&#xa0;%1&#xa0;» n&apos;est pas un type MIME&#xa0;: la famille «&#xa0;%2&#xa0;» n&apos;existe pas.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no MIME type: it has a character that none has.</source>
        <translation>«&#xa0;%1&#xa0;» n&apos;est pas un type MIME&#xa0;: il contient un caractère interdit.</translation>
    </message>
    <message>
        <source>MIME types like &apos;%1&apos; are not used for files.</source>
        <translation>Les types MIME comme «&#xa0;%1&#xa0;» ne s&apos;utilisent pas pour des fichiers.</translation>
    </message>
    <message>
        <source>This computer does not know the MIME type &apos;%1&apos;.</source>
        <translation>Cet ordinateur ne connaît pas le type MIME «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>An action has no id.</source>
        <translation>Une action n&apos;a pas d&apos;identifiant.</translation>
    </message>
    <message>
        <source>Nothing says what the action &apos;%1&apos; is.</source>
        <translation>Rien ne dit ce qu&apos;est l&apos;action «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>There is no registered desktop &apos;%1&apos;; others have to begin with &apos;X-&apos;.</source>
        <translation>Il n&apos;y a pas d&apos;environnement enregistré «&#xa0;%1&#xa0;»&#xa0;; les autres doivent commencer par «&#xa0;X-&#xa0;».</translation>
    </message>
    <message>
        <source>In your language the entry is shown as &apos;%1&apos;.</source>
        <translation>Dans votre langue, l&apos;entrée s&apos;affiche sous le nom «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>The comment says no more than the name.</source>
        <translation>Le commentaire n&apos;en dit pas plus que le nom.</translation>
    </message>
    <message>
        <source>The comment says no more than the generic name.</source>
        <translation>Le commentaire n&apos;en dit pas plus que le nom générique.</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is out of use here; it has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>«&#xa0;%1&#xa0;» n&apos;est plus utilisé ici&#xa0;; ce doit être «&#xa0;true&#xa0;» ou «&#xa0;false&#xa0;».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; has to be &apos;true&apos; or &apos;false&apos;.</source>
        <translation>«&#xa0;%1&#xa0;» doit être «&#xa0;true&#xa0;» ou «&#xa0;false&#xa0;».</translation>
    </message>
    <message>
        <source>Change it to &apos;true&apos;</source>
        <translation>Changer en «&#xa0;true&#xa0;»</translation>
    </message>
    <message>
        <source>The name of an icon has no suffix like &apos;%1&apos;.</source>
        <translation>Le nom d&apos;une icône n&apos;a pas d&apos;extension comme «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>Remove the suffix</source>
        <translation>Retirer l&apos;extension</translation>
    </message>
    <message>
        <source>No icon theme has an icon &apos;%1&apos;.</source>
        <translation>Aucun thème d&apos;icônes n&apos;a d&apos;icône «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>Write the folder in full</source>
        <translation>Écrire le dossier en entier</translation>
    </message>
    <message>
        <source>The address does not say how to reach it, as &apos;https:&apos; and &apos;file:&apos; do.</source>
        <translation>L&apos;adresse ne dit pas comment l&apos;atteindre, comme le font «&#xa0;https:&#xa0;» et «&#xa0;file:&#xa0;».</translation>
    </message>
    <message>
        <source>The text is not encoded in UTF-8.</source>
        <translation>Le texte n&apos;est pas codé en UTF-8.</translation>
    </message>
    <message>
        <source>A control character or tab may not stand here.</source>
        <translation>Un caractère de contrôle ou une tabulation n&apos;a pas sa place ici.</translation>
    </message>
    <message>
        <source>The type has to be &apos;Application&apos;, &apos;Link&apos; or &apos;Directory&apos;, not &apos;%1&apos;.</source>
        <translation>Le type doit être «&#xa0;Application&#xa0;», «&#xa0;Link&#xa0;» ou «&#xa0;Directory&#xa0;», pas «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>There is no version &apos;%1&apos; of the standard.</source>
        <translation>La version «&#xa0;%1&#xa0;» du standard n&apos;existe pas.</translation>
    </message>
    <message>
        <source>There is no encoding &apos;%1&apos;.</source>
        <translation>Le codage «&#xa0;%1&#xa0;» n&apos;existe pas.</translation>
    </message>
    <message>
        <source>There is no picture &apos;%1&apos;.</source>
        <translation>L&apos;image «&#xa0;%1&#xa0;» n&apos;existe pas.</translation>
    </message>
    <message>
        <source>An icon has a name or a path that begins with &apos;/&apos;.</source>
        <translation>Une icône a un nom, ou un chemin qui commence par «&#xa0;/&#xa0;».</translation>
    </message>
    <message>
        <source>The path of a folder begins with &apos;/&apos;.</source>
        <translation>Le chemin d&apos;un dossier commence par «&#xa0;/&#xa0;».</translation>
    </message>
    <message>
        <source>There is no folder &apos;%1&apos;.</source>
        <translation>Le dossier «&#xa0;%1&#xa0;» n&apos;existe pas.</translation>
    </message>
    <message>
        <source>There is no file &apos;%1&apos;.</source>
        <translation>Le fichier «&#xa0;%1&#xa0;» n&apos;existe pas.</translation>
    </message>
    <message>
        <source>D-Bus cannot start &apos;%1&apos;: a file of a name like &apos;org.example.Program.desktop&apos; is needed.</source>
        <translation>D-Bus ne peut pas démarrer «&#xa0;%1&#xa0;»&#xa0;: il faut un fichier dont le nom ressemble à «&#xa0;org.example.Program.desktop&#xa0;».</translation>
    </message>
    <message>
        <source>&apos;%1&apos; is no name of an interface; such names are like &apos;org.example.Viewer&apos;.</source>
        <translation>«&#xa0;%1&#xa0;» n&apos;est pas un nom d&apos;interface&#xa0;; de tels noms ressemblent à «&#xa0;org.example.Viewer&#xa0;».</translation>
    </message>
</context>
<context>
    <name>EntryTrial</name>
    <message>
        <source>The entry could not be written to a temporary file.</source>
        <translation>L&apos;entrée n&apos;a pas pu être écrite dans un fichier temporaire.</translation>
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
    <name>KeyDescription</name>
    <message>
        <source>Whether the entry starts a program, opens an address or describes a folder of the menu.</source>
        <translation>Indique si l&apos;entrée démarre un programme, ouvre une adresse ou décrit un dossier du menu.</translation>
    </message>
    <message>
        <source>The name that menus show.</source>
        <translation>Le nom affiché par les menus.</translation>
    </message>
    <message>
        <source>The icon that menus show: a name from the icon theme, or the full path of a picture.</source>
        <translation>L&apos;icône affichée par les menus&#xa0;: un nom du thème d&apos;icônes ou le chemin complet d&apos;une image.</translation>
    </message>
    <message>
        <source>The command that starts the program, with codes such as %f for the files that it opens.</source>
        <translation>La commande qui démarre le programme, avec des codes comme %f pour les fichiers qu&apos;il ouvre.</translation>
    </message>
    <message>
        <source>Whether the program needs a terminal window.</source>
        <translation>Indique si le programme a besoin d&apos;une fenêtre de terminal.</translation>
    </message>
    <message>
        <source>The folder in which the program starts.</source>
        <translation>Le dossier dans lequel le programme démarre.</translation>
    </message>
    <message>
        <source>A program that has to be installed; without it menus leave the entry out.</source>
        <translation>Un programme qui doit être installé&#xa0;; sans lui, les menus omettent l&apos;entrée.</translation>
    </message>
    <message>
        <source>The address that the entry opens.</source>
        <translation>L&apos;adresse que l&apos;entrée ouvre.</translation>
    </message>
    <message>
        <source>What kind of program it is, such as: Web browser.</source>
        <translation>Le genre de programme, par exemple&#xa0;: Navigateur web.</translation>
    </message>
    <message>
        <source>A sentence about the program, which menus show as a tip.</source>
        <translation>Une phrase sur le programme, que les menus affichent en infobulle.</translation>
    </message>
    <message>
        <source>Whether menus leave the entry out although the program can be used.</source>
        <translation>Indique si les menus omettent l&apos;entrée bien que le programme soit utilisable.</translation>
    </message>
    <message>
        <source>Whether the entry counts as deleted.</source>
        <translation>Indique si l&apos;entrée est considérée comme supprimée.</translation>
    </message>
    <message>
        <source>The desktop environments that alone show the entry; none means all.</source>
        <translation>Les seuls environnements de bureau qui affichent l&apos;entrée&#xa0;; si aucun n&apos;est indiqué, tous l&apos;affichent.</translation>
    </message>
    <message>
        <source>The desktop environments that do not show the entry.</source>
        <translation>Les environnements de bureau qui n&apos;affichent pas l&apos;entrée.</translation>
    </message>
    <message>
        <source>The types of files that the program opens.</source>
        <translation>Les types de fichiers que le programme ouvre.</translation>
    </message>
    <message>
        <source>The groups of the menu that the program belongs to.</source>
        <translation>Les groupes du menu auxquels le programme appartient.</translation>
    </message>
    <message>
        <source>Words by which a search finds the program beside its name.</source>
        <translation>Des mots qui, en plus de son nom, permettent à une recherche de trouver le programme.</translation>
    </message>
    <message>
        <source>Whether the program tells when it has started, so that the pointer shows it until then.</source>
        <translation>Indique si le programme signale qu&apos;il a démarré, pour que le pointeur le montre jusque-là.</translation>
    </message>
    <message>
        <source>The class of the window by which the desktop knows that the program has started.</source>
        <translation>La classe de la fenêtre à laquelle le bureau reconnaît que le programme a démarré.</translation>
    </message>
    <message>
        <source>Further things that the program can be started for, such as: New window.</source>
        <translation>D&apos;autres usages pour lesquels le programme peut être démarré, par exemple&#xa0;: Nouvelle fenêtre.</translation>
    </message>
    <message>
        <source>The version of the standard for entries that this one follows.</source>
        <translation>La version du standard des entrées que suit celle-ci.</translation>
    </message>
    <message>
        <source>%1 Only for users of one language.</source>
        <comment>%1 is a sentence about a key</comment>
        <translation>%1 Seulement pour les utilisateurs d&apos;une langue.</translation>
    </message>
</context>
<context>
    <name>LanguageNote</name>
    <message>
        <source>Users of %1 see these texts.</source>
        <translation>En %1, ces textes sont affichés.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those of %2 where one is missing.</source>
        <translation>En %1, ces textes sont affichés et, là où il en manque un, celui en %2.</translation>
    </message>
    <message>
        <source>Users of %1 see these texts, and those without a language where one is missing.</source>
        <translation>En %1, ces textes sont affichés et, là où il en manque un, celui qui est sans langue.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts of %2.</source>
        <translation>En %1, les textes en %2 sont affichés.</translation>
    </message>
    <message>
        <source>Users of %1 see the texts without a language.</source>
        <translation>En %1, les textes sans langue sont affichés.</translation>
    </message>
    <message>
        <source>%1 Texts of their own have: %2.</source>
        <comment>%1 is a sentence, %2 a list of languages</comment>
        <translation>%1 Ont leurs propres textes&#xa0;: %2.</translation>
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
    <message numerus="yes">
        <source>The deletion was canceled. %n items are still there, in whole or in part.</source>
        <translation>
            <numerusform>La suppression a été interrompue. %n élément est toujours là, en tout ou en partie.</numerusform>
            <numerusform>La suppression a été interrompue. %n éléments sont toujours là, en tout ou en partie.</numerusform>
        </translation>
    </message>
    <message>
        <source>The deletion was canceled. Still there, in whole or in part: %1.</source>
        <translation>La suppression a été interrompue. Toujours là, en tout ou en partie&#xa0;: %1.</translation>
    </message>
</context>
<context>
    <name>MenuDrop</name>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;. Keep both gives the new one another file name, Replace puts the old one into the trash, Skip leaves the new one where it is; Cancel leaves everything as it is.</source>
        <translation>Le dossier «&#xa0;%1&#xa0;» contient déjà «&#xa0;%2&#xa0;». Conserver les deux donne au nouveau un autre nom de fichier, Remplacer met l&apos;ancien à la corbeille, Ignorer laisse le nouveau où il est&#xa0;; Annuler laisse tout tel quel.</translation>
    </message>
    <message>
        <source>The folder &apos;%1&apos; already has &apos;%2&apos;, which the new one comes from. Keep both gives the new one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>Le dossier «&#xa0;%1&#xa0;» contient déjà «&#xa0;%2&#xa0;», dont le nouveau provient. Conserver les deux donne au nouveau un autre nom de fichier, Ignorer le laisse où il est&#xa0;; Annuler laisse tout tel quel.</translation>
    </message>
    <message>
        <source>Another one that comes to the folder &apos;%1&apos; has the same file name as &apos;%2&apos;. Keep both gives this one another file name, Skip leaves it where it is; Cancel leaves everything as it is.</source>
        <translation>Un autre élément destiné au dossier «&#xa0;%1&#xa0;» a le même nom de fichier que «&#xa0;%2&#xa0;». Conserver les deux donne à celui-ci un autre nom de fichier, Ignorer le laisse où il est&#xa0;; Annuler laisse tout tel quel.</translation>
    </message>
    <message>
        <source>Name already taken</source>
        <translation>Nom déjà utilisé</translation>
    </message>
    <message>
        <source>&amp;Keep both</source>
        <translation>&amp;Conserver les deux</translation>
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
        <translation>&amp;Faire de même pour tous les suivants</translation>
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
    <message numerus="yes">
        <source>Undo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Annuler la suppression de %1 éléments (%n entrée)</numerusform>
            <numerusform>Annuler la suppression de %1 éléments (%n entrées)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo deletion of %1 items (%n entries)</source>
        <translation>
            <numerusform>Rétablir la suppression de %1 éléments (%n entrée)</numerusform>
            <numerusform>Rétablir la suppression de %1 éléments (%n entrées)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 items were deleted (%n entries).</source>
        <translation>
            <numerusform>%1 éléments ont été supprimés (%n entrée).</numerusform>
            <numerusform>%1 éléments ont été supprimés (%n entrées).</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo reordering of %n items</source>
        <translation>
            <numerusform>Annuler le réordonnancement de %n élément</numerusform>
            <numerusform>Annuler le réordonnancement de %n éléments</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo reordering of %n items</source>
        <translation>
            <numerusform>Rétablir le réordonnancement de %n élément</numerusform>
            <numerusform>Rétablir le réordonnancement de %n éléments</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items have other places.</source>
        <translation>
            <numerusform>%n élément a changé de place.</numerusform>
            <numerusform>%n éléments ont changé de place.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo hiding of %n items</source>
        <translation>
            <numerusform>Annuler le masquage de %n élément</numerusform>
            <numerusform>Annuler le masquage de %n éléments</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo hiding of %n items</source>
        <translation>
            <numerusform>Rétablir le masquage de %n élément</numerusform>
            <numerusform>Rétablir le masquage de %n éléments</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items are hidden: the menu no longer shows them.</source>
        <translation>
            <numerusform>%n élément est masqué&#xa0;: le menu ne l&apos;affiche plus.</numerusform>
            <numerusform>%n éléments sont masqués&#xa0;: le menu ne les affiche plus.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Undo showing %n items again</source>
        <translation>
            <numerusform>Annuler le réaffichage de %n élément</numerusform>
            <numerusform>Annuler le réaffichage de %n éléments</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo showing %n items again</source>
        <translation>
            <numerusform>Rétablir le réaffichage de %n élément</numerusform>
            <numerusform>Rétablir le réaffichage de %n éléments</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The menu shows %n items again.</source>
        <translation>
            <numerusform>Le menu affiche de nouveau %n élément.</numerusform>
            <numerusform>Le menu affiche de nouveau %n éléments.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo sorting of folder %1</source>
        <translation>Annuler le tri du dossier %1</translation>
    </message>
    <message>
        <source>Redo sorting of folder %1</source>
        <translation>Rétablir le tri du dossier %1</translation>
    </message>
    <message>
        <source>The folder %1 was sorted by name.</source>
        <translation>Le dossier %1 a été trié par nom.</translation>
    </message>
    <message>
        <source>Undo duplication of %1</source>
        <translation>Annuler la duplication de %1</translation>
    </message>
    <message>
        <source>Redo duplication of %1</source>
        <translation>Rétablir la duplication de %1</translation>
    </message>
    <message>
        <source>%1 was duplicated. The copy is selected.</source>
        <translation>%1 a été dupliqué. La copie est sélectionnée.</translation>
    </message>
    <message numerus="yes">
        <source>Undo duplication of %n items</source>
        <translation>
            <numerusform>Annuler la duplication de %n élément</numerusform>
            <numerusform>Annuler la duplication de %n éléments</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Redo duplication of %n items</source>
        <translation>
            <numerusform>Rétablir la duplication de %n élément</numerusform>
            <numerusform>Rétablir la duplication de %n éléments</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n items were duplicated. The copies are selected.</source>
        <translation>
            <numerusform>%n élément a été dupliqué. La copie est sélectionnée.</numerusform>
            <numerusform>%n éléments ont été dupliqués. Les copies sont sélectionnées.</numerusform>
        </translation>
    </message>
    <message>
        <source>Undo deletion of %1 items (1 entry)</source>
        <translation>Annuler la suppression de %1 éléments (1 entrée)</translation>
    </message>
    <message>
        <source>Redo deletion of %1 items (1 entry)</source>
        <translation>Rétablir la suppression de %1 éléments (1 entrée)</translation>
    </message>
    <message>
        <source>%1 items were deleted (1 entry).</source>
        <translation>%1 éléments ont été supprimés (1 entrée).</translation>
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
    <message>
        <source>Can&apos;t link %1: %2</source>
        <translation>Impossible de créer un lien vers %1&#xa0;: %2</translation>
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
    <message>
        <source>The file %1 is not a desktop entry: it has no group [Desktop Entry].</source>
        <translation>Le fichier %1 n&apos;est pas une entrée de bureau&#xa0;: il n&apos;a pas de groupe [Desktop Entry].</translation>
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
        <source>This menu is empty. Press %1 for a new entry, or right-click here for what else can be added.</source>
        <translation>Ce menu est vide. Appuyez sur %1 pour une nouvelle entrée, ou faites ici un clic droit pour voir ce qui peut encore être ajouté.</translation>
    </message>
    <message>
        <source>the program %1 ended with an error</source>
        <translation>le programme %1 s&apos;est terminé par une erreur</translation>
    </message>
    <message>
        <source>the program %1 cannot be run</source>
        <translation>le programme %1 ne peut pas être exécuté</translation>
    </message>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>Et %n autre.</numerusform>
            <numerusform>Et %n autres.</numerusform>
        </translation>
    </message>
    <message>
        <source>Open containin&amp;g folder</source>
        <translation>Ouvr&amp;ir le dossier parent</translation>
    </message>
    <message>
        <source>The folder %1 was not opened: %2.</source>
        <translation>Le dossier %1 n&apos;a pas été ouvert&#xa0;: %2.</translation>
    </message>
    <message>
        <source>New &amp;folder</source>
        <translation>&amp;Nouveau dossier</translation>
    </message>
    <message>
        <source>New entr&amp;y</source>
        <translation>Nou&amp;velle entrée</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Modifier</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Supprimer</translation>
    </message>
    <message>
        <source>E&amp;xecute</source>
        <translation>E&amp;xécuter</translation>
    </message>
    <message>
        <source>F&amp;ind</source>
        <translation>C&amp;hercher</translation>
    </message>
    <message>
        <source>Find &amp;Next</source>
        <translation>&amp;Poursuivre la recherche</translation>
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
        <translation>Co&amp;ller</translation>
    </message>
    <message>
        <source>Default &amp;menu...</source>
        <translation>Menu par &amp;défaut...</translation>
    </message>
    <message>
        <source>&amp;Up</source>
        <translation>M&amp;onter</translation>
    </message>
    <message>
        <source>D&amp;own</source>
        <translation>D&amp;escendre</translation>
    </message>
    <message>
        <source>Dup&amp;licate</source>
        <translation>Dupli&amp;quer</translation>
    </message>
    <message>
        <source>&amp;Hide</source>
        <translation>M&amp;asquer</translation>
    </message>
    <message>
        <source>Sho&amp;w again</source>
        <translation>A&amp;fficher de nouveau</translation>
    </message>
    <message>
        <source>&amp;Reload</source>
        <translation>&amp;Recharger</translation>
    </message>
    <message>
        <source>&amp;Sort by name</source>
        <translation>&amp;Trier par nom</translation>
    </message>
    <message>
        <source>The folder %1 is sorted by name already.</source>
        <translation>Le dossier %1 est déjà trié par nom.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1, because no application is installed. The menu was left as it is.</source>
        <translation>Le menu par défaut n&apos;a pas pu être construit dans %1, car aucune application n&apos;est installée. Le menu est resté tel quel.</translation>
    </message>
    <message>
        <source>The default menu could not be built in %1: %2. The menu was left as it is.</source>
        <translation>Le menu par défaut n&apos;a pas pu être construit dans %1&#xa0;: %2. Le menu est resté tel quel.</translation>
    </message>
    <message>
        <source>%1 is no file on this computer. Nothing was moved or copied.</source>
        <translation>%1 n&apos;est pas un fichier de cet ordinateur. Rien n&apos;a été déplacé ni copié.</translation>
    </message>
    <message>
        <source>%1 was not started: %2.</source>
        <translation>%1 n&apos;a pas été démarré&#xa0;: %2.</translation>
    </message>
    <message>
        <source>This menu is empty. Right-click here and choose &apos;%2&apos; to fill it with the applications that are installed, or press %1 for a new entry.</source>
        <translation>Ce menu est vide. Faites ici un clic droit et choisissez «&#xa0;%2&#xa0;» pour le remplir avec les applications installées, ou appuyez sur %1 pour une nouvelle entrée.</translation>
    </message>
    <message>
        <source>This menu is empty, because no application was found that is installed. Once there is one, right-click here and choose &apos;%2&apos;. Until then, press %1 for an entry of your own.</source>
        <translation>Ce menu est vide, car aucune application installée n&apos;a été trouvée. Dès qu&apos;il y en aura une, faites ici un clic droit et choisissez «&#xa0;%2&#xa0;». D&apos;ici là, appuyez sur %1 pour une entrée à vous.</translation>
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
    <name>VelUI::CategoryChooser</name>
    <message>
        <source>Main category</source>
        <translation>Catégorie principale</translation>
    </message>
    <message>
        <source>Goes with %1</source>
        <translation>Va avec %1</translation>
    </message>
    <message>
        <source>Only beside &quot;Only show in&quot;</source>
        <translation>Seulement avec «&#xa0;Afficher uniquement dans&#xa0;»</translation>
    </message>
    <message>
        <source>Deprecated</source>
        <translation>Obsolète</translation>
    </message>
    <message>
        <source>Extension</source>
        <comment>a category of somebody&apos;s own, X-...</comment>
        <translation>Extension</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Non enregistrée</translation>
    </message>
    <message>
        <source>Choose categories</source>
        <translation>Choisir des catégories</translation>
    </message>
    <message>
        <source>Name</source>
        <comment>title of a column</comment>
        <translation>Nom</translation>
    </message>
    <message>
        <source>Category</source>
        <comment>title of a column</comment>
        <translation>Catégorie</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Remarque</translation>
    </message>
</context>
<context>
    <name>VelUI::CategoryNames</name>
    <message>
        <source>Audio and video</source>
        <translation>Audio et vidéo</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>Audio</translation>
    </message>
    <message>
        <source>Video</source>
        <translation>Vidéo</translation>
    </message>
    <message>
        <source>Software development</source>
        <translation>Développement de logiciels</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>Éducation</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>Jeux</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>Graphisme</translation>
    </message>
    <message>
        <source>Internet and network</source>
        <translation>Internet et réseau</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>Bureautique</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>Sciences</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Paramètres</translation>
    </message>
    <message>
        <source>System tools</source>
        <translation>Outils système</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Accessoires</translation>
    </message>
    <message>
        <source>Build tools</source>
        <translation>Outils de construction</translation>
    </message>
    <message>
        <source>Debuggers</source>
        <translation>Débogueurs</translation>
    </message>
    <message>
        <source>Development environments</source>
        <translation>Environnements de développement</translation>
    </message>
    <message>
        <source>Designers of user interfaces</source>
        <translation>Concepteurs d&apos;interfaces utilisateur</translation>
    </message>
    <message>
        <source>Profilers</source>
        <translation>Profileurs</translation>
    </message>
    <message>
        <source>Revision control</source>
        <translation>Gestion de versions</translation>
    </message>
    <message>
        <source>Translation tools</source>
        <translation>Outils de traduction</translation>
    </message>
    <message>
        <source>Calendars</source>
        <translation>Agendas</translation>
    </message>
    <message>
        <source>Address books</source>
        <translation>Carnets d&apos;adresses</translation>
    </message>
    <message>
        <source>Databases</source>
        <translation>Bases de données</translation>
    </message>
    <message>
        <source>Dictionaries</source>
        <translation>Dictionnaires</translation>
    </message>
    <message>
        <source>Charts</source>
        <translation>Graphiques</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>Courrier électronique</translation>
    </message>
    <message>
        <source>Finances</source>
        <translation>Finances</translation>
    </message>
    <message>
        <source>Flow charts</source>
        <translation>Organigrammes</translation>
    </message>
    <message>
        <source>Handheld devices</source>
        <translation>Appareils de poche</translation>
    </message>
    <message>
        <source>Project management</source>
        <translation>Gestion de projets</translation>
    </message>
    <message>
        <source>Presentations</source>
        <translation>Présentations</translation>
    </message>
    <message>
        <source>Spreadsheets</source>
        <translation>Tableurs</translation>
    </message>
    <message>
        <source>Word processors</source>
        <translation>Traitements de texte</translation>
    </message>
    <message>
        <source>Two-dimensional graphics</source>
        <translation>Graphisme en deux dimensions</translation>
    </message>
    <message>
        <source>Vector graphics</source>
        <translation>Graphisme vectoriel</translation>
    </message>
    <message>
        <source>Raster graphics</source>
        <translation>Graphisme matriciel</translation>
    </message>
    <message>
        <source>Three-dimensional graphics</source>
        <translation>Graphisme en trois dimensions</translation>
    </message>
    <message>
        <source>Scanning</source>
        <translation>Numérisation</translation>
    </message>
    <message>
        <source>Text recognition</source>
        <translation>Reconnaissance de texte</translation>
    </message>
    <message>
        <source>Photography</source>
        <translation>Photographie</translation>
    </message>
    <message>
        <source>Desktop publishing</source>
        <translation>Publication assistée par ordinateur</translation>
    </message>
    <message>
        <source>Viewers</source>
        <translation>Visionneuses</translation>
    </message>
    <message>
        <source>Text tools</source>
        <translation>Outils de texte</translation>
    </message>
    <message>
        <source>Desktop settings</source>
        <translation>Paramètres du bureau</translation>
    </message>
    <message>
        <source>Hardware settings</source>
        <translation>Paramètres du matériel</translation>
    </message>
    <message>
        <source>Printing</source>
        <translation>Impression</translation>
    </message>
    <message>
        <source>Package managers</source>
        <translation>Gestionnaires de paquets</translation>
    </message>
    <message>
        <source>Dial-up connections</source>
        <translation>Connexions par modem</translation>
    </message>
    <message>
        <source>Instant messaging</source>
        <translation>Messagerie instantanée</translation>
    </message>
    <message>
        <source>Chat</source>
        <translation>Discussion en ligne</translation>
    </message>
    <message>
        <source>IRC</source>
        <translation>IRC</translation>
    </message>
    <message>
        <source>News feeds</source>
        <translation>Flux d&apos;actualités</translation>
    </message>
    <message>
        <source>File transfer</source>
        <translation>Transfert de fichiers</translation>
    </message>
    <message>
        <source>Amateur radio</source>
        <translation>Radioamateur</translation>
    </message>
    <message>
        <source>Newsgroups</source>
        <translation>Groupes de discussion</translation>
    </message>
    <message>
        <source>File sharing</source>
        <translation>Partage de fichiers</translation>
    </message>
    <message>
        <source>Remote access</source>
        <translation>Accès à distance</translation>
    </message>
    <message>
        <source>Telephony</source>
        <translation>Téléphonie</translation>
    </message>
    <message>
        <source>Telephony tools</source>
        <translation>Outils de téléphonie</translation>
    </message>
    <message>
        <source>Video conferences</source>
        <translation>Visioconférences</translation>
    </message>
    <message>
        <source>Web browsers</source>
        <translation>Navigateurs web</translation>
    </message>
    <message>
        <source>Web development</source>
        <translation>Développement web</translation>
    </message>
    <message>
        <source>MIDI</source>
        <translation>MIDI</translation>
    </message>
    <message>
        <source>Mixers</source>
        <translation>Tables de mixage</translation>
    </message>
    <message>
        <source>Sequencers</source>
        <translation>Séquenceurs</translation>
    </message>
    <message>
        <source>Tuners</source>
        <translation>Accordeurs</translation>
    </message>
    <message>
        <source>Television</source>
        <translation>Télévision</translation>
    </message>
    <message>
        <source>Audio and video editing</source>
        <translation>Montage audio et vidéo</translation>
    </message>
    <message>
        <source>Players</source>
        <translation>Lecteurs</translation>
    </message>
    <message>
        <source>Recorders</source>
        <translation>Enregistreurs</translation>
    </message>
    <message>
        <source>Disc burning</source>
        <translation>Gravure de disques</translation>
    </message>
    <message>
        <source>Action games</source>
        <translation>Jeux d&apos;action</translation>
    </message>
    <message>
        <source>Adventure games</source>
        <translation>Jeux d&apos;aventure</translation>
    </message>
    <message>
        <source>Arcade games</source>
        <translation>Jeux d&apos;arcade</translation>
    </message>
    <message>
        <source>Board games</source>
        <translation>Jeux de plateau</translation>
    </message>
    <message>
        <source>Falling blocks games</source>
        <translation>Jeux de blocs</translation>
    </message>
    <message>
        <source>Card games</source>
        <translation>Jeux de cartes</translation>
    </message>
    <message>
        <source>Games for children</source>
        <translation>Jeux pour enfants</translation>
    </message>
    <message>
        <source>Logic games</source>
        <translation>Jeux de logique</translation>
    </message>
    <message>
        <source>Role-playing games</source>
        <translation>Jeux de rôle</translation>
    </message>
    <message>
        <source>Shooters</source>
        <translation>Jeux de tir</translation>
    </message>
    <message>
        <source>Simulations</source>
        <translation>Simulations</translation>
    </message>
    <message>
        <source>Sports games</source>
        <translation>Jeux de sport</translation>
    </message>
    <message>
        <source>Strategy games</source>
        <translation>Jeux de stratégie</translation>
    </message>
    <message>
        <source>Art</source>
        <translation>Art</translation>
    </message>
    <message>
        <source>Construction</source>
        <translation>Bâtiment</translation>
    </message>
    <message>
        <source>Music</source>
        <translation>Musique</translation>
    </message>
    <message>
        <source>Languages</source>
        <translation>Langues</translation>
    </message>
    <message>
        <source>Artificial intelligence</source>
        <translation>Intelligence artificielle</translation>
    </message>
    <message>
        <source>Astronomy</source>
        <translation>Astronomie</translation>
    </message>
    <message>
        <source>Biology</source>
        <translation>Biologie</translation>
    </message>
    <message>
        <source>Chemistry</source>
        <translation>Chimie</translation>
    </message>
    <message>
        <source>Computer science</source>
        <translation>Informatique</translation>
    </message>
    <message>
        <source>Data visualization</source>
        <translation>Visualisation de données</translation>
    </message>
    <message>
        <source>Economics</source>
        <translation>Économie</translation>
    </message>
    <message>
        <source>Electricity</source>
        <translation>Électricité</translation>
    </message>
    <message>
        <source>Geography</source>
        <translation>Géographie</translation>
    </message>
    <message>
        <source>Geology</source>
        <translation>Géologie</translation>
    </message>
    <message>
        <source>Earth sciences</source>
        <translation>Sciences de la Terre</translation>
    </message>
    <message>
        <source>History</source>
        <translation>Histoire</translation>
    </message>
    <message>
        <source>Humanities</source>
        <translation>Sciences humaines</translation>
    </message>
    <message>
        <source>Image processing</source>
        <translation>Traitement d&apos;images</translation>
    </message>
    <message>
        <source>Literature</source>
        <translation>Littérature</translation>
    </message>
    <message>
        <source>Maps</source>
        <translation>Cartes</translation>
    </message>
    <message>
        <source>Mathematics</source>
        <translation>Mathématiques</translation>
    </message>
    <message>
        <source>Numerical analysis</source>
        <translation>Analyse numérique</translation>
    </message>
    <message>
        <source>Medicine</source>
        <translation>Médecine</translation>
    </message>
    <message>
        <source>Physics</source>
        <translation>Physique</translation>
    </message>
    <message>
        <source>Robotics</source>
        <translation>Robotique</translation>
    </message>
    <message>
        <source>Spirituality</source>
        <translation>Spiritualité</translation>
    </message>
    <message>
        <source>Sports</source>
        <translation>Sports</translation>
    </message>
    <message>
        <source>Parallel computing</source>
        <translation>Calcul parallèle</translation>
    </message>
    <message>
        <source>Amusement</source>
        <translation>Divertissement</translation>
    </message>
    <message>
        <source>Archiving</source>
        <translation>Archivage</translation>
    </message>
    <message>
        <source>Compression</source>
        <translation>Compression</translation>
    </message>
    <message>
        <source>Electronics</source>
        <translation>Électronique</translation>
    </message>
    <message>
        <source>Emulators</source>
        <translation>Émulateurs</translation>
    </message>
    <message>
        <source>Engineering</source>
        <translation>Ingénierie</translation>
    </message>
    <message>
        <source>File tools</source>
        <translation>Outils de fichiers</translation>
    </message>
    <message>
        <source>File managers</source>
        <translation>Gestionnaires de fichiers</translation>
    </message>
    <message>
        <source>Terminals</source>
        <translation>Terminaux</translation>
    </message>
    <message>
        <source>File systems</source>
        <translation>Systèmes de fichiers</translation>
    </message>
    <message>
        <source>Monitors</source>
        <translation>Surveillance du système</translation>
    </message>
    <message>
        <source>Security</source>
        <translation>Sécurité</translation>
    </message>
    <message>
        <source>Accessibility</source>
        <translation>Accessibilité</translation>
    </message>
    <message>
        <source>Calculators</source>
        <translation>Calculatrices</translation>
    </message>
    <message>
        <source>Clocks</source>
        <translation>Horloges</translation>
    </message>
    <message>
        <source>Text editors</source>
        <translation>Éditeurs de texte</translation>
    </message>
    <message>
        <source>Documentation</source>
        <translation>Documentation</translation>
    </message>
    <message>
        <source>For adults</source>
        <translation>Pour adultes</translation>
    </message>
    <message>
        <source>Core of the desktop</source>
        <translation>Cœur du bureau</translation>
    </message>
    <message>
        <source>Made with KDE</source>
        <translation>Basées sur KDE</translation>
    </message>
    <message>
        <source>Made with GNOME</source>
        <translation>Basées sur GNOME</translation>
    </message>
    <message>
        <source>Made with Xfce</source>
        <translation>Basées sur Xfce</translation>
    </message>
    <message>
        <source>Made with GTK</source>
        <translation>Basées sur GTK</translation>
    </message>
    <message>
        <source>Made with Qt</source>
        <translation>Basées sur Qt</translation>
    </message>
    <message>
        <source>Made with Motif</source>
        <translation>Basées sur Motif</translation>
    </message>
    <message>
        <source>Made with Java</source>
        <translation>Basées sur Java</translation>
    </message>
    <message>
        <source>For the console</source>
        <translation>Pour la console</translation>
    </message>
    <message>
        <source>Screen savers</source>
        <translation>Économiseurs d&apos;écran</translation>
    </message>
    <message>
        <source>Icons of the system tray</source>
        <translation>Icônes de la zone de notification</translation>
    </message>
    <message>
        <source>Applets of a panel</source>
        <translation>Applets de tableau de bord</translation>
    </message>
    <message>
        <source>Desktop shells</source>
        <translation>Shells de bureau</translation>
    </message>
    <message>
        <source>Applications</source>
        <translation>Applications</translation>
    </message>
</context>
<context>
    <name>VelUI::ChoiceDialog</name>
    <message>
        <source>Filter</source>
        <translation>Filtre</translation>
    </message>
    <message>
        <source>Type to filter</source>
        <translation>Tapez pour filtrer</translation>
    </message>
    <message>
        <source>Reading...</source>
        <translation>Lecture...</translation>
    </message>
    <message>
        <source>No match</source>
        <translation>Aucune correspondance</translation>
    </message>
    <message numerus="yes">
        <source>%n chosen</source>
        <translation>
            <numerusform>%n choisi</numerusform>
            <numerusform>%n choisis</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::DesktopChooser</name>
    <message>
        <source>Desktop environment</source>
        <translation>Environnement de bureau</translation>
    </message>
    <message>
        <source>Remark</source>
        <comment>title of a column</comment>
        <translation>Remarque</translation>
    </message>
    <message>
        <source>This session</source>
        <translation>Cette session</translation>
    </message>
    <message>
        <source>Not registered</source>
        <translation>Non enregistré</translation>
    </message>
</context>
<context>
    <name>VelUI::EditActionsDialog</name>
    <message>
        <source>An action has no id. It can have &quot;%1&quot;.</source>
        <translation>Une action n&apos;a pas d&apos;identifiant. Elle peut avoir «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>Two actions have the id &quot;%1&quot;. The second one can have &quot;%2&quot;.</source>
        <translation>Deux actions ont l&apos;identifiant «&#xa0;%1&#xa0;». La seconde peut avoir «&#xa0;%2&#xa0;».</translation>
    </message>
    <message>
        <source>No entry can hold the id &quot;%1&quot;. It can be &quot;%2&quot;.</source>
        <translation>Aucune entrée ne peut contenir l&apos;identifiant «&#xa0;%1&#xa0;». Ce peut être «&#xa0;%2&#xa0;».</translation>
    </message>
    <message>
        <source>The id &quot;%1&quot; should have only A to Z, a to z, 0 to 9 and &quot;-&quot; in it, as &quot;%2&quot; has.</source>
        <translation>L&apos;identifiant «&#xa0;%1&#xa0;» ne devrait contenir que A à Z, a à z, 0 à 9 et «&#xa0;-&#xa0;», comme «&#xa0;%2&#xa0;».</translation>
    </message>
    <message numerus="yes">
        <source>%n more id(s) should be changed.</source>
        <translation>
            <numerusform>%n autre identifiant devrait être modifié.</numerusform>
            <numerusform>%n autres identifiants devraient être modifiés.</numerusform>
        </translation>
    </message>
    <message>
        <source>Use &quot;%1&quot;</source>
        <translation>Utiliser «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Use the proposed ids</source>
        <translation>Utiliser les identifiants proposés</translation>
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
    <name>VelUI::EditStringsDialog</name>
    <message>
        <source>The &quot;;&quot; in &quot;%1&quot; does not separate items, it becomes part of one item.</source>
        <translation>Le «&#xa0;;&#xa0;» dans «&#xa0;%1&#xa0;» ne sépare pas d&apos;éléments, il devient une partie d&apos;un élément.</translation>
    </message>
    <message numerus="yes">
        <source>Make %n item(s) of it</source>
        <translation>
            <numerusform>En faire %n élément</numerusform>
            <numerusform>En faire %n éléments</numerusform>
        </translation>
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
    <name>VelUI::EntryFormAssistance</name>
    <message>
        <source>Te&amp;xt</source>
        <comment>button: shows the file of the entry</comment>
        <translation>Te&amp;xte</translation>
    </message>
    <message>
        <source>Shows the file as it would be saved</source>
        <translation>Affiche le fichier tel qu&apos;il serait enregistré</translation>
    </message>
</context>
<context>
    <name>VelUI::EntryTextDialog</name>
    <message>
        <source>Text of the entry</source>
        <translation>Texte de l&apos;entrée</translation>
    </message>
    <message>
        <source>The file as it would be saved</source>
        <translation>Le fichier tel qu&apos;il serait enregistré</translation>
    </message>
    <message>
        <source>Nothing is changed.</source>
        <translation>Rien n&apos;est modifié.</translation>
    </message>
    <message>
        <source>≠ changed lines: %1, + new lines: %2, removed lines: %3</source>
        <translation>≠ lignes modifiées&#xa0;: %1, + nouvelles lignes&#xa0;: %2, lignes retirées&#xa0;: %3</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldChoosers</name>
    <message>
        <source>Choose %1</source>
        <comment>name of a &quot;Choose...&quot; button</comment>
        <translation>Choisir %1</translation>
    </message>
    <message>
        <source>Choose...</source>
        <translation>Choisir...</translation>
    </message>
    <message>
        <source>Chooses from all that are known (Alt+Down)</source>
        <translation>Choisit parmi tout ce qui est connu (Alt+Bas)</translation>
    </message>
    <message>
        <source>Chooses an installed program (Alt+Down)</source>
        <translation>Choisit un programme installé (Alt+Bas)</translation>
    </message>
    <message>
        <source>Insert</source>
        <comment>button: a field code</comment>
        <translation>Insérer</translation>
    </message>
    <message>
        <source>Insert a field code</source>
        <translation>Insérer un code de champ</translation>
    </message>
    <message>
        <source>Inserts a code that stands for the files to open, or for a part of this entry</source>
        <translation>Insère un code qui représente les fichiers à ouvrir ou une partie de cette entrée</translation>
    </message>
</context>
<context>
    <name>VelUI::FieldCodes</name>
    <message>
        <source>%f: one file; for several files the program is started several times</source>
        <translation>%f&#xa0;: un fichier&#xa0;; pour plusieurs fichiers, le programme est démarré plusieurs fois</translation>
    </message>
    <message>
        <source>%F: all files, each as a word of its own</source>
        <translation>%F&#xa0;: tous les fichiers, chacun comme un mot à part</translation>
    </message>
    <message>
        <source>%u: one address (URL) or file; for several the program is started several times</source>
        <translation>%u&#xa0;: une adresse (URL) ou un fichier&#xa0;; pour plusieurs, le programme est démarré plusieurs fois</translation>
    </message>
    <message>
        <source>%U: all addresses (URLs) or files, each as a word of its own</source>
        <translation>%U&#xa0;: toutes les adresses (URL) ou tous les fichiers, chacun comme un mot à part</translation>
    </message>
    <message>
        <source>%i: --icon and the icon of this entry, if it has one</source>
        <translation>%i&#xa0;: --icon et l&apos;icône de cette entrée, si elle en a une</translation>
    </message>
    <message>
        <source>%c: the name of this entry, translated</source>
        <translation>%c&#xa0;: le nom de cette entrée, traduit</translation>
    </message>
    <message>
        <source>%k: where the file of this entry lies</source>
        <translation>%k&#xa0;: l&apos;emplacement du fichier de cette entrée</translation>
    </message>
    <message>
        <source>%%: a percent sign</source>
        <translation>%%&#xa0;: un signe pour cent</translation>
    </message>
</context>
<context>
    <name>VelUI::FindingLine</name>
    <message>
        <source>Fix</source>
        <translation>Corriger</translation>
    </message>
    <message>
        <source>Fix: %1</source>
        <comment>on a button; %1 is what it does</comment>
        <translation>Corriger&#xa0;: %1</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>how bad something is, and what it is</comment>
        <translation>%1&#xa0;: %2</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erreur</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Avertissement</translation>
    </message>
    <message>
        <source>Hint</source>
        <translation>Suggestion</translation>
    </message>
</context>
<context>
    <name>VelUI::FormFindings</name>
    <message>
        <source>%1: %2</source>
        <comment>a key or an action of an entry, and what is wrong with it</comment>
        <translation>%1&#xa0;: %2</translation>
    </message>
</context>
<context>
    <name>VelUI::FormHistory</name>
    <message>
        <source>Undo change of %1</source>
        <translation>Annuler la modification de %1</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Redo change of %1</source>
        <translation>Rétablir la modification de %1</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Rétablir</translation>
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
    <name>VelUI::LanguageBar</name>
    <message>
        <source>&amp;Language:</source>
        <translation>&amp;Langue&#xa0;:</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Langue</translation>
    </message>
    <message>
        <source>Another language...</source>
        <translation>Autre langue...</translation>
    </message>
    <message>
        <source>Another language</source>
        <translation>Autre langue</translation>
    </message>
    <message>
        <source>Unknown language</source>
        <translation>Langue inconnue</translation>
    </message>
    <message>
        <source>%1 (%2), yours: %3 of %4 texts</source>
        <translation>%1 (%2), la vôtre&#xa0;: %3 textes sur %4</translation>
    </message>
    <message>
        <source>%1 (%2), yours: no text yet</source>
        <translation>%1 (%2), la vôtre&#xa0;: encore aucun texte</translation>
    </message>
    <message>
        <source>%1 (%2): %3 of %4 texts</source>
        <translation>%1 (%2)&#xa0;: %3 textes sur %4</translation>
    </message>
    <message>
        <source>%1 (%2): no text yet</source>
        <translation>%1 (%2)&#xa0;: encore aucun texte</translation>
    </message>
</context>
<context>
    <name>VelUI::LanguageDialog</name>
    <message>
        <source>Another language</source>
        <translation>Autre langue</translation>
    </message>
    <message>
        <source>&amp;Language or its code, such as pt_BR:</source>
        <translation>&amp;Langue ou son code, par exemple pt_BR&#xa0;:</translation>
    </message>
    <message>
        <source>Language or its code</source>
        <translation>Langue ou son code</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>a language and its code</comment>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>No language has such a code: it is like de, pt_BR or sr@latin.</source>
        <translation>Aucune langue n&apos;a un tel code&#xa0;: il ressemble à de, pt_BR ou sr@latin.</translation>
    </message>
    <message>
        <source>The code %1 is well-formed, but no language of this name is known.</source>
        <translation>Le code %1 est bien formé, mais aucune langue de ce nom n&apos;est connue.</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeChooser</name>
    <message>
        <source>Choose MIME types</source>
        <translation>Choisir des types MIME</translation>
    </message>
</context>
<context>
    <name>VelUI::MimeTypeSource</name>
    <message>
        <source>MIME type</source>
        <translation>Type MIME</translation>
    </message>
    <message>
        <source>Description</source>
        <translation>Description</translation>
    </message>
    <message>
        <source>File names</source>
        <translation>Noms de fichiers</translation>
    </message>
    <message>
        <source>Not in the database</source>
        <translation>Absent de la base de données</translation>
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
<context>
    <name>VelUI::ProgramChooser</name>
    <message>
        <source>Choose a program</source>
        <translation>Choisir un programme</translation>
    </message>
</context>
<context>
    <name>VelUI::ProgramSource</name>
    <message>
        <source>Program</source>
        <comment>title of a column</comment>
        <translation>Programme</translation>
    </message>
    <message>
        <source>Folder</source>
        <comment>title of a column</comment>
        <translation>Dossier</translation>
    </message>
</context>
<context>
    <name>VelUI::RowFindings</name>
    <message numerus="yes">
        <source>And %n more.</source>
        <translation>
            <numerusform>Et %n autre.</numerusform>
            <numerusform>Et %n autres.</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>VelUI::TrialLine</name>
    <message>
        <source>Stop</source>
        <comment>button: ends the trial of an entry</comment>
        <translation>Arrêter</translation>
    </message>
    <message>
        <source>T&amp;ry</source>
        <comment>button: runs the entry</comment>
        <translation>Ess&amp;ayer</translation>
    </message>
    <message>
        <source>Stops the trial</source>
        <translation>Arrête l&apos;essai</translation>
    </message>
    <message>
        <source>Runs the entry as it is now, without saving it</source>
        <translation>Exécute l&apos;entrée telle qu&apos;elle est maintenant, sans l&apos;enregistrer</translation>
    </message>
    <message>
        <source>The program vel-open, which runs entries, could not be started: %1</source>
        <translation>Le programme vel-open, qui exécute les entrées, n&apos;a pas pu être démarré&#xa0;: %1</translation>
    </message>
    <message>
        <source>The trial was stopped.</source>
        <translation>L&apos;essai a été arrêté.</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0).</source>
        <translation>L&apos;entrée a été démarrée (code de sortie 0).</translation>
    </message>
    <message>
        <source>The entry was started (exit status 0): %1</source>
        <translation>L&apos;entrée a été démarrée (code de sortie 0)&#xa0;: %1</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1).</source>
        <translation>L&apos;entrée n&apos;a pas pu être démarrée (code de sortie %1).</translation>
    </message>
    <message>
        <source>The entry could not be started (exit status %1): %2</source>
        <translation>L&apos;entrée n&apos;a pas pu être démarrée (code de sortie %1)&#xa0;: %2</translation>
    </message>
</context>
</TS>

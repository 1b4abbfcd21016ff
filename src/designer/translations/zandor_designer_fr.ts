<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr" sourcelanguage="en">
<context>
    <name>ControlFlags</name>
    <message>
        <source>Show join definition</source>
        <translation>Définir la jointure</translation>
    </message>
    <message>
        <source>Delete join</source>
        <translation>Supprimer la jointure</translation>
    </message>
    <message>
        <source>Copy column</source>
        <translation>Copier la colonne</translation>
    </message>
    <message>
        <source>Create join</source>
        <translation>Créer une jointure</translation>
    </message>
    <message>
        <source>Delete table</source>
        <translation>Supprimer la table</translation>
    </message>
    <message>
        <source>Paste column</source>
        <translation>Coller la colonne</translation>
    </message>
    <message>
        <source>Delete output column</source>
        <translation>Supprimer la colonne de sortie</translation>
    </message>
    <message>
        <source>Separator below the join entries</source>
        <translation>Séparateur sous les entrées des jointures</translation>
    </message>
    <message>
        <source>Separator below the table entries</source>
        <translation>Séparateur sous les entrées des tables</translation>
    </message>
    <message>
        <source>Type and operator of a join can be changed</source>
        <translation>Le type et l’opérateur d’une jointure sont modifiables</translation>
    </message>
    <message>
        <source>Tables and joins only, no output columns</source>
        <translation>Tables et jointures seulement, sans colonnes de sortie</translation>
    </message>
    <message>
        <source>Normal: only rows that match</source>
        <translation>Normale&#xa0;: seulement les lignes qui correspondent</translation>
    </message>
    <message>
        <source>Left outer: all rows of the left table</source>
        <translation>Externe gauche&#xa0;: toutes les lignes de la table de gauche</translation>
    </message>
    <message>
        <source>Right outer: all rows of the right table</source>
        <translation>Externe droite&#xa0;: toutes les lignes de la table de droite</translation>
    </message>
    <message>
        <source>Both outer: all rows of both tables</source>
        <translation>Externe des deux côtés&#xa0;: toutes les lignes des deux tables</translation>
    </message>
    <message>
        <source>=  equal</source>
        <translation>=  égal</translation>
    </message>
    <message>
        <source>&lt;&gt;  not equal</source>
        <translation>&lt;&gt;  différent</translation>
    </message>
    <message>
        <source>&lt;  less</source>
        <translation>&lt;  inférieur</translation>
    </message>
    <message>
        <source>&gt;  greater</source>
        <translation>&gt;  supérieur</translation>
    </message>
    <message>
        <source>&lt;=  less or equal</source>
        <translation>&lt;=  inférieur ou égal</translation>
    </message>
    <message>
        <source>&gt;=  greater or equal</source>
        <translation>&gt;=  supérieur ou égal</translation>
    </message>
    <message>
        <source>Show a box at each step of the control</source>
        <translation>Afficher un message à chaque étape du contrôle</translation>
    </message>
</context>
<context>
    <name>ControlTextUses</name>
    <message>
        <source>Join dialog: title</source>
        <translation>Fenêtre de jointure&#xa0;: titre</translation>
    </message>
    <message>
        <source>Join dialog: left table</source>
        <translation>Fenêtre de jointure&#xa0;: table de gauche</translation>
    </message>
    <message>
        <source>Join dialog: left column</source>
        <translation>Fenêtre de jointure&#xa0;: colonne de gauche</translation>
    </message>
    <message>
        <source>Join dialog: right table</source>
        <translation>Fenêtre de jointure&#xa0;: table de droite</translation>
    </message>
    <message>
        <source>Join dialog: right column</source>
        <translation>Fenêtre de jointure&#xa0;: colonne de droite</translation>
    </message>
    <message>
        <source>Join dialog: join type</source>
        <translation>Fenêtre de jointure&#xa0;: type de jointure</translation>
    </message>
    <message>
        <source>Join type: only rows that match</source>
        <translation>Type de jointure&#xa0;: seulement les lignes qui correspondent</translation>
    </message>
    <message>
        <source>Join type: all rows of the left table</source>
        <translation>Type de jointure&#xa0;: toutes les lignes de la table de gauche</translation>
    </message>
    <message>
        <source>Join type: all rows of the right table</source>
        <translation>Type de jointure&#xa0;: toutes les lignes de la table de droite</translation>
    </message>
    <message>
        <source>Join type: all rows of both tables</source>
        <translation>Type de jointure&#xa0;: toutes les lignes des deux tables</translation>
    </message>
    <message>
        <source>Join dialog: button that takes the changes over</source>
        <translation>Fenêtre de jointure&#xa0;: bouton qui valide les modifications</translation>
    </message>
    <message>
        <source>Join dialog: button that drops the changes</source>
        <translation>Fenêtre de jointure&#xa0;: bouton qui abandonne les modifications</translation>
    </message>
    <message>
        <source>Menu: open the join dialog</source>
        <translation>Menu&#xa0;: ouvrir la fenêtre de jointure</translation>
    </message>
    <message>
        <source>Menu: delete a join</source>
        <translation>Menu&#xa0;: supprimer une jointure</translation>
    </message>
    <message>
        <source>Menu: copy the selected columns</source>
        <translation>Menu&#xa0;: copier les colonnes sélectionnées</translation>
    </message>
    <message>
        <source>Menu: join the copied column to the selected one</source>
        <translation>Menu&#xa0;: joindre la colonne copiée à celle sélectionnée</translation>
    </message>
    <message>
        <source>Menu: take a table out of the query</source>
        <translation>Menu&#xa0;: retirer une table de la requête</translation>
    </message>
    <message>
        <source>Menu: make output columns of the copied columns</source>
        <translation>Menu&#xa0;: faire des colonnes copiées des colonnes de sortie</translation>
    </message>
    <message>
        <source>Menu: delete an output column</source>
        <translation>Menu&#xa0;: supprimer une colonne de sortie</translation>
    </message>
    <message>
        <source>Grid: the column</source>
        <translation>Grille&#xa0;: la colonne</translation>
    </message>
    <message>
        <source>Grid: the name that the column comes out under</source>
        <translation>Grille&#xa0;: le nom sous lequel la colonne est produite</translation>
    </message>
    <message>
        <source>Grid: sort order</source>
        <translation>Grille&#xa0;: ordre de tri</translation>
    </message>
    <message>
        <source>Grid: whether the column comes out</source>
        <translation>Grille&#xa0;: si la colonne est produite</translation>
    </message>
    <message>
        <source>Grid: the first row of criteria</source>
        <translation>Grille&#xa0;: la première ligne de critères</translation>
    </message>
    <message>
        <source>Grid: further rows of criteria</source>
        <translation>Grille&#xa0;: les autres lignes de critères</translation>
    </message>
</context>
<context>
    <name>ControlTexts</name>
    <message>
        <source>Left Table:</source>
        <translation>Table de gauche&#xa0;:</translation>
    </message>
    <message>
        <source>Left Column:</source>
        <translation>Colonne de gauche&#xa0;:</translation>
    </message>
    <message>
        <source>Right Table:</source>
        <translation>Table de droite&#xa0;:</translation>
    </message>
    <message>
        <source>Right Column:</source>
        <translation>Colonne de droite&#xa0;:</translation>
    </message>
    <message>
        <source>Join Type</source>
        <translation>Type de jointure</translation>
    </message>
    <message>
        <source>Normal</source>
        <translation>Normale</translation>
    </message>
    <message>
        <source>Left Outer</source>
        <translation>Externe gauche</translation>
    </message>
    <message>
        <source>Right Outer</source>
        <translation>Externe droite</translation>
    </message>
    <message>
        <source>Both Outer</source>
        <translation>Externe des deux côtés</translation>
    </message>
    <message>
        <source>&amp;Ok</source>
        <translation>&amp;OK</translation>
    </message>
    <message>
        <source>&amp;Cancel</source>
        <translation>&amp;Annuler</translation>
    </message>
    <message>
        <source>Field:</source>
        <translation>Champ&#xa0;:</translation>
    </message>
    <message>
        <source>Synonym:</source>
        <translation>Synonyme&#xa0;:</translation>
    </message>
    <message>
        <source>Sort:</source>
        <translation>Tri&#xa0;:</translation>
    </message>
    <message>
        <source>Visible:</source>
        <translation>Visible&#xa0;:</translation>
    </message>
    <message>
        <source>Criteria:</source>
        <translation>Critères&#xa0;:</translation>
    </message>
    <message>
        <source>Or:</source>
        <translation>Ou&#xa0;:</translation>
    </message>
    <message>
        <source>Join Definition</source>
        <translation>Définition de la jointure</translation>
    </message>
    <message>
        <source>Show &amp;Join Definition</source>
        <translation>Définir la &amp;jointure</translation>
    </message>
    <message>
        <source>Delete Jo&amp;in</source>
        <translation>Supprimer la jo&amp;inture</translation>
    </message>
    <message>
        <source>&amp;Copy Column</source>
        <translation>&amp;Copier la colonne</translation>
    </message>
    <message>
        <source>C&amp;reate Join</source>
        <translation>C&amp;réer une jointure</translation>
    </message>
    <message>
        <source>Delete &amp;Table</source>
        <translation>Supprimer la &amp;table</translation>
    </message>
    <message>
        <source>&amp;Paste Column</source>
        <translation>Co&amp;ller la colonne</translation>
    </message>
    <message>
        <source>&amp;Delete Column</source>
        <translation>&amp;Supprimer la colonne</translation>
    </message>
</context>
<context>
    <name>Model</name>
    <message>
        <source>The query has no tables: add one first.</source>
        <translation>La requête n’a aucune table&#xa0;: ajoutez-en d’abord une.</translation>
    </message>
    <message>
        <source>%1: At character %2: %3.</source>
        <translation>%1&#xa0;: au caractère %2&#xa0;: %3.</translation>
    </message>
    <message>
        <source>a text</source>
        <translation>un texte</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>un nombre</translation>
    </message>
    <message>
        <source>a date (2024-12-31)</source>
        <translation>une date (2024-12-31)</translation>
    </message>
    <message>
        <source>a time (23:59)</source>
        <translation>une heure (23:59)</translation>
    </message>
    <message>
        <source>a date and time (2024-12-31 23:59)</source>
        <translation>une date et une heure (2024-12-31 23:59)</translation>
    </message>
    <message>
        <source>true or false</source>
        <translation>true ou false</translation>
    </message>
    <message>
        <source>There is no file &quot;%1&quot;; check the path.</source>
        <translation>Il n’y a pas de fichier «&#xa0;%1&#xa0;»&#xa0;; vérifiez le chemin.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is a folder; choose a database file in it.</source>
        <translation>«&#xa0;%1&#xa0;» est un dossier&#xa0;; choisissez-y un fichier de base de données.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is a device, not a file; choose a database file.</source>
        <translation>«&#xa0;%1&#xa0;» est un périphérique, pas un fichier&#xa0;; choisissez un fichier de base de données.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be read (%2); ask its owner for permission.</source>
        <translation>Le fichier «&#xa0;%1&#xa0;» ne peut pas être lu (%2)&#xa0;; demandez l’autorisation à son propriétaire.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; is empty; choose a file that holds a database.</source>
        <translation>Le fichier «&#xa0;%1&#xa0;» est vide&#xa0;; choisissez un fichier qui contient une base de données.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; is not an SQLite database, or it is encrypted; choose another file.</source>
        <translation>Le fichier «&#xa0;%1&#xa0;» n’est pas une base de données SQLite, ou il est chiffré&#xa0;; choisissez-en un autre.</translation>
    </message>
    <message>
        <source>The Qt driver for %1 is missing; install it (Debian: apt install %2).</source>
        <translation>Le pilote Qt pour %1 manque&#xa0;; installez-le (Debian&#xa0;: apt install %2).</translation>
    </message>
    <message>
        <source>The list of tables cannot be read (the connection is closed): open the database afresh.</source>
        <translation>La liste des tables ne peut pas être lue (la connexion est fermée)&#xa0;: rouvrez la base de données.</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; is not in the database; read the list of tables afresh.</source>
        <translation>La table «&#xa0;%1&#xa0;» n’est pas dans la base de données&#xa0;; relisez la liste des tables.</translation>
    </message>
    <message>
        <source>The address has an unknown option &quot;%1&quot;; known are %2 and host.</source>
        <translation>L’adresse contient une option inconnue «&#xa0;%1&#xa0;»&#xa0;; sont connues %2 et host.</translation>
    </message>
    <message>
        <source>The option %1 of the address has a semicolon in it; use a value without one.</source>
        <translation>L’option %1 de l’adresse contient un point-virgule&#xa0;; utilisez une valeur sans.</translation>
    </message>
    <message>
        <source>The address of the database cannot be read; write it like %1, with %XX for a character that means something else there.</source>
        <translation>L’adresse de la base de données est illisible&#xa0;; écrivez-la comme %1, avec %XX pour un caractère qui a un autre sens à cet endroit.</translation>
    </message>
    <message>
        <source>There is no kind of database &quot;%1&quot;; write it like %2.</source>
        <translation>Il n’y a pas de type de base de données «&#xa0;%1&#xa0;»&#xa0;; écrivez comme %2.</translation>
    </message>
    <message>
        <source>%1 (%2): %3.</source>
        <translation>%1 (%2)&#xa0;: %3.</translation>
    </message>
    <message>
        <source>The database %1 cannot be opened</source>
        <translation>La base de données %1 ne peut pas être ouverte</translation>
    </message>
    <message>
        <source>The list of tables cannot be read</source>
        <translation>La liste des tables ne peut pas être lue</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; cannot be read</source>
        <translation>La table «&#xa0;%1&#xa0;» ne peut pas être lue</translation>
    </message>
    <message>
        <source>The primary key of &quot;%1&quot; cannot be read</source>
        <translation>La clé primaire de «&#xa0;%1&#xa0;» ne peut pas être lue</translation>
    </message>
    <message>
        <source>The foreign keys of &quot;%1&quot; cannot be read</source>
        <translation>Les clés étrangères de «&#xa0;%1&#xa0;» ne peuvent pas être lues</translation>
    </message>
    <message>
        <source>give a password</source>
        <translation>donnez un mot de passe</translation>
    </message>
    <message>
        <source>check the user name and the password</source>
        <translation>vérifiez le nom d’utilisateur et le mot de passe</translation>
    </message>
    <message>
        <source>ask the server&apos;s administrator to let you in</source>
        <translation>demandez l’accès à l’administrateur du serveur</translation>
    </message>
    <message>
        <source>check the name of the host</source>
        <translation>vérifiez le nom du serveur</translation>
    </message>
    <message>
        <source>see that the server runs, and check host and port</source>
        <translation>assurez-vous que le serveur fonctionne, et vérifiez le serveur et le port</translation>
    </message>
    <message>
        <source>see that the server can be reached, and check host and port</source>
        <translation>assurez-vous que le serveur est accessible, et vérifiez le serveur et le port</translation>
    </message>
    <message>
        <source>check the name of the database</source>
        <translation>vérifiez le nom de la base de données</translation>
    </message>
    <message>
        <source>ask the owner for permission</source>
        <translation>demandez l’autorisation au propriétaire</translation>
    </message>
    <message>
        <source>check the user name</source>
        <translation>vérifiez le nom d’utilisateur</translation>
    </message>
    <message>
        <source>open the database afresh</source>
        <translation>rouvrez la base de données</translation>
    </message>
    <message>
        <source>another program is writing to it; try again in a moment</source>
        <translation>un autre programme y écrit&#xa0;; réessayez dans un instant</translation>
    </message>
    <message>
        <source>see that you may read the file and its folder; a database in WAL mode also needs permission to write to the folder</source>
        <translation>assurez-vous de pouvoir lire le fichier et son dossier&#xa0;; une base de données en mode WAL exige aussi le droit d’écrire dans le dossier</translation>
    </message>
    <message>
        <source>the file is damaged; restore it from a copy</source>
        <translation>le fichier est endommagé&#xa0;; restaurez-le à partir d’une copie</translation>
    </message>
    <message>
        <source>it is damaged or encrypted; choose another file</source>
        <translation>il est endommagé ou chiffré&#xa0;; choisissez un autre fichier</translation>
    </message>
    <message>
        <source>put And or Or between two conditions, or quotes around a text</source>
        <translation>mettez And ou Or entre deux conditions, ou des guillemets autour d’un texte</translation>
    </message>
    <message>
        <source>this is nested too deep, 100 levels are the most</source>
        <translation>l’imbrication est trop profonde, 100 niveaux au plus</translation>
    </message>
    <message>
        <source>a closing %1 is missing</source>
        <translation>il manque un %1 fermant</translation>
    </message>
    <message>
        <source>after In comes a list in parentheses, as in In (1, 2)</source>
        <translation>après In, écrivez une liste entre parenthèses, comme dans In (1, 2)</translation>
    </message>
    <message>
        <source>after Is comes Null or Not Null, and a text that begins so needs quotes</source>
        <translation>après Is, écrivez Null ou Not Null, et mettez entre guillemets un texte qui commence ainsi</translation>
    </message>
    <message>
        <source>Like works only on columns that hold text, use =, &lt; or &gt; here</source>
        <translation>Like ne s’applique qu’aux colonnes de texte, utilisez ici =, &lt; ou &gt;</translation>
    </message>
    <message>
        <source>after Like comes a pattern, as in Like &apos;A*&apos;, not a column</source>
        <translation>après Like, écrivez un motif, comme dans Like &apos;A*&apos;, et non une colonne</translation>
    </message>
    <message>
        <source>after Like comes a pattern, as in Like &apos;A*&apos;</source>
        <translation>après Like, écrivez un motif, comme dans Like &apos;A*&apos;</translation>
    </message>
    <message>
        <source>Between needs And and a second value, as in Between 1 And 5</source>
        <translation>Between a besoin de And et d’une seconde valeur, comme dans Between 1 And 5</translation>
    </message>
    <message>
        <source>a comma or a closing ) is missing</source>
        <translation>il manque une virgule ou un ) fermant</translation>
    </message>
    <message>
        <source>nothing is equal to Null, write Is Null for a missing value or &apos;Null&apos; for the word</source>
        <translation>rien n’est égal à Null, écrivez Is Null pour une valeur manquante ou &apos;Null&apos; pour le mot</translation>
    </message>
    <message>
        <source>a parameter needs a name, as in :year</source>
        <translation>un paramètre a besoin d’un nom, comme dans :an</translation>
    </message>
    <message>
        <source>the name of a column is missing behind the point</source>
        <translation>il manque le nom d’une colonne après le point</translation>
    </message>
    <message>
        <source>the query has no column %1</source>
        <translation>la requête n’a pas de colonne %1</translation>
    </message>
    <message>
        <source>the table of this column was deleted from the query</source>
        <translation>la table de cette colonne a été supprimée de la requête</translation>
    </message>
    <message>
        <source>several tables have this column, write the table too, as in %1</source>
        <translation>plusieurs tables ont cette colonne, écrivez aussi la table, comme dans %1</translation>
    </message>
    <message>
        <source>compare it with a column that holds %1</source>
        <translation>comparez avec une colonne qui contient %1</translation>
    </message>
    <message>
        <source>half a character stands here, type it afresh</source>
        <translation>il y a ici un demi-caractère, saisissez-le à nouveau</translation>
    </message>
    <message>
        <source>a [ before this ] is missing</source>
        <translation>il manque un [ avant ce ]</translation>
    </message>
    <message>
        <source>write &lt;&gt; for unequal</source>
        <translation>écrivez &lt;&gt; pour différent</translation>
    </message>
    <message>
        <source>a name is missing between the brackets</source>
        <translation>il manque un nom entre les crochets</translation>
    </message>
    <message>
        <source>a text is missing</source>
        <translation>il manque un texte</translation>
    </message>
    <message>
        <source>a number is missing</source>
        <translation>il manque un nombre</translation>
    </message>
    <message>
        <source>a date (2024-12-31) is missing</source>
        <translation>il manque une date (2024-12-31)</translation>
    </message>
    <message>
        <source>a time (23:59) is missing</source>
        <translation>il manque une heure (23:59)</translation>
    </message>
    <message>
        <source>a date and time (2024-12-31 23:59) is missing</source>
        <translation>il manque une date et une heure (2024-12-31 23:59)</translation>
    </message>
    <message>
        <source>true or false is missing</source>
        <translation>il manque true ou false</translation>
    </message>
    <message>
        <source>a value is missing</source>
        <translation>il manque une valeur</translation>
    </message>
    <message>
        <source>this is no number, write it like 12 or 1.5</source>
        <translation>ce n’est pas un nombre, écrivez-le comme 12 ou 1.5</translation>
    </message>
    <message>
        <source>decimals are written with a point, as in 1.5</source>
        <translation>les décimales s’écrivent avec un point, comme dans 1.5</translation>
    </message>
    <message>
        <source>this is no date, write it like 2024-12-31</source>
        <translation>ce n’est pas une date, écrivez-la comme 2024-12-31</translation>
    </message>
    <message>
        <source>this is no time, write it like 23:59</source>
        <translation>ce n’est pas une heure, écrivez-la comme 23:59</translation>
    </message>
    <message>
        <source>write true or false here</source>
        <translation>écrivez ici true ou false</translation>
    </message>
    <message>
        <source>only dates and times stand between two #</source>
        <translation>n’écrivez entre deux # que des dates et des heures</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a file; choose another name.</source>
        <translation>«&#xa0;%1&#xa0;» n’est pas un fichier&#xa0;; choisissez un autre nom.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a file; choose a query file.</source>
        <translation>«&#xa0;%1&#xa0;» n’est pas un fichier&#xa0;; choisissez un fichier de requête.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; is write-protected; save under another name.</source>
        <translation>Le fichier «&#xa0;%1&#xa0;» est protégé en écriture&#xa0;; enregistrez sous un autre nom.</translation>
    </message>
    <message>
        <source>%1 (%2); %3.</source>
        <translation>%1 (%2)&#xa0;; %3.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be saved</source>
        <translation>Le fichier «&#xa0;%1&#xa0;» ne peut pas être enregistré</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be read</source>
        <translation>Le fichier «&#xa0;%1&#xa0;» ne peut pas être lu</translation>
    </message>
    <message>
        <source>The output cannot be written</source>
        <translation>La sortie ne peut pas être écrite</translation>
    </message>
    <message>
        <source>check the path</source>
        <translation>vérifiez le chemin</translation>
    </message>
    <message>
        <source>ask the owner for permission, or choose another folder</source>
        <translation>demandez l’autorisation au propriétaire, ou choisissez un autre dossier</translation>
    </message>
    <message>
        <source>make room on the disk, or choose another one</source>
        <translation>faites de la place sur le disque, ou choisissez-en un autre</translation>
    </message>
    <message>
        <source>choose another disk</source>
        <translation>choisissez un autre disque</translation>
    </message>
    <message>
        <source>choose a folder on another disk</source>
        <translation>choisissez un dossier sur un autre disque</translation>
    </message>
    <message>
        <source>try again, or choose another folder</source>
        <translation>réessayez, ou choisissez un autre dossier</translation>
    </message>
    <message>
        <source>choose a shorter name</source>
        <translation>choisissez un nom plus court</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be used: %2</source>
        <translation>Le fichier «&#xa0;%1&#xa0;» ne peut pas être utilisé&#xa0;: %2</translation>
    </message>
    <message>
        <source>%1. %2.</source>
        <translation>%1. %2.</translation>
    </message>
    <message>
        <source>Mend the file there, or restore it from a copy</source>
        <translation>Corrigez le fichier à cet endroit, ou restaurez-le à partir d’une copie</translation>
    </message>
    <message>
        <source>Choose a query file</source>
        <translation>Choisissez un fichier de requête</translation>
    </message>
    <message>
        <source>Open the file with a newer version of this program</source>
        <translation>Ouvrez le fichier avec une version plus récente de ce programme</translation>
    </message>
    <message>
        <source>Type that text afresh and save again</source>
        <translation>Saisissez ce texte à nouveau, puis réessayez d’enregistrer</translation>
    </message>
    <message>
        <source>The query could not be read again: %1</source>
        <translation>La requête n’a pas pu être relue&#xa0;: %1</translation>
    </message>
    <message>
        <source>The query would not be the same when read again. Report this, please.</source>
        <translation>La requête ne serait plus la même une fois relue. Merci de signaler ce problème.</translation>
    </message>
    <message>
        <source>The file</source>
        <translation>Le fichier</translation>
    </message>
    <message>
        <source>Line %1, column %2: %3</source>
        <translation>Ligne %1, colonne %2&#xa0;: %3</translation>
    </message>
    <message>
        <source>a number is too large</source>
        <translation>un nombre est trop grand</translation>
    </message>
    <message>
        <source>%1 stands there twice</source>
        <translation>%1 y figure deux fois</translation>
    </message>
    <message>
        <source>%1 is longer than %2 characters</source>
        <translation>%1 dépasse %2 caractères</translation>
    </message>
    <message>
        <source>%1 has a NUL character in it</source>
        <translation>%1 contient un caractère NUL</translation>
    </message>
    <message>
        <source>%1 is nested more than %2 levels deep</source>
        <translation>%1 est imbriqué sur plus de %2 niveaux</translation>
    </message>
    <message>
        <source>%1 is one value too many: a file may have %2</source>
        <translation>%1 est une valeur de trop&#xa0;: un fichier peut en contenir %2</translation>
    </message>
    <message>
        <source>%1 is larger than %2 MiB</source>
        <translation>%1 dépasse %2 Mio</translation>
    </message>
    <message>
        <source>%1 is not an object</source>
        <translation>%1 n’est pas un objet</translation>
    </message>
    <message>
        <source>%1 is not a text</source>
        <translation>%1 n’est pas un texte</translation>
    </message>
    <message>
        <source>%1 is neither a text nor null</source>
        <translation>%1 n’est ni un texte ni null</translation>
    </message>
    <message>
        <source>%1 is not true or false</source>
        <translation>%1 n’est ni true ni false</translation>
    </message>
    <message>
        <source>%1 is not a list</source>
        <translation>%1 n’est pas une liste</translation>
    </message>
    <message>
        <source>%1 has more than %2 entries</source>
        <translation>%1 a plus de %2 entrées</translation>
    </message>
    <message>
        <source>%1 is missing</source>
        <translation>%1 manque</translation>
    </message>
    <message>
        <source>%1 is not a whole number from %2 to %3</source>
        <translation>%1 n’est pas un nombre entier de %2 à %3</translation>
    </message>
    <message>
        <source>%1 is &quot;%2&quot; and none of %3</source>
        <translation>%1 vaut «&#xa0;%2&#xa0;», et non l’un des mots %3</translation>
    </message>
    <message>
        <source>%1 makes the columns of all tables more than %2</source>
        <translation>%1 porte le nombre total de colonnes des tables à plus de %2</translation>
    </message>
    <message>
        <source>%1 is no length of a name in the text</source>
        <translation>%1 n’est pas la longueur d’un nom du texte</translation>
    </message>
    <message>
        <source>%1 is not &quot;%2&quot;</source>
        <translation>%1 n’est pas «&#xa0;%2&#xa0;»</translation>
    </message>
    <message>
        <source>%1 is less than 1</source>
        <translation>%1 est inférieur à 1</translation>
    </message>
    <message>
        <source>%1 is %2 and newer than %3, the newest that can be read here</source>
        <translation>%1 vaut %2, une version plus récente que %3, la dernière qui peut être lue ici</translation>
    </message>
    <message>
        <source>%1 has half a character in it (an unpaired surrogate)</source>
        <translation>%1 contient un demi-caractère (un substitut Unicode isolé)</translation>
    </message>
    <message>
        <source>%1</source>
        <translation>%1</translation>
    </message>
    <message>
        <source>The table of an output column is no longer in the query: delete the output column, or choose another field for it.</source>
        <translation>La table d’une colonne de sortie n’est plus dans la requête&#xa0;: supprimez la colonne de sortie, ou choisissez-lui un autre champ.</translation>
    </message>
    <message>
        <source>%1.* stands for all columns and cannot be sorted by: add the column that is to decide, and sort by that.</source>
        <translation>%1.* représente toutes les colonnes et ne peut pas servir au tri&#xa0;: ajoutez la colonne qui doit décider de l’ordre, et triez selon celle-ci.</translation>
    </message>
    <message>
        <source>%1.* stands for all columns and cannot have a criterion: add the column that is meant, and write the criterion there.</source>
        <translation>%1.* représente toutes les colonnes et ne peut pas avoir de critère&#xa0;: ajoutez la colonne voulue, et écrivez-y le critère.</translation>
    </message>
    <message>
        <source>Two output columns are named %1, so that nobody can tell them apart: give one of them a synonym.</source>
        <translation>Deux colonnes de sortie s’appellent %1, si bien que rien ne les distingue&#xa0;: donnez un synonyme à l’une d’elles.</translation>
    </message>
    <message>
        <source>%1 and %2 hold different kinds of values, so that their join finds nothing or fails: join columns that hold the same.</source>
        <translation>%1 et %2 contiennent des valeurs de types différents, si bien que leur jointure ne trouve rien ou échoue&#xa0;: reliez des colonnes qui contiennent le même type de valeurs.</translation>
    </message>
    <message>
        <source>The outer join between %1 and %2 keeps no more rows than a normal one, for normal joins connect these tables too: make it a normal join, or make the others outer ones.</source>
        <translation>La jointure externe entre %1 et %2 ne garde pas plus de lignes qu’une jointure normale, car des jointures normales relient aussi ces tables&#xa0;: faites-en une jointure normale, ou rendez les autres externes.</translation>
    </message>
    <message>
        <source>The outer joins around %1 and %2 contradict each other, and the one drawn first decides which rows are kept: let all of them keep the rows of the same table.</source>
        <translation>Les jointures externes autour de %1 et de %2 se contredisent, et la première dessinée décide des lignes gardées&#xa0;: faites en sorte que toutes gardent les lignes de la même table.</translation>
    </message>
    <message>
        <source>The outer joins around %1 can be read in several ways, each with other rows: change the type of one of them.</source>
        <translation>Les jointures externes autour de %1 peuvent se lire de plusieurs façons, chacune donnant d’autres lignes&#xa0;: changez le type de l’une d’elles.</translation>
    </message>
    <message>
        <source>No join connects %1 with %2, so that every row of one comes with every row of the other: draw a join between them, add the table that lies between, or delete one.</source>
        <translation>Aucune jointure ne relie %1 et %2, si bien que chaque ligne de l’une est combinée avec chaque ligne de l’autre&#xa0;: dessinez une jointure entre elles, ajoutez la table qui se trouve entre les deux, ou supprimez l’une d’elles.</translation>
    </message>
    <message>
        <source>Standard SQL</source>
        <translation>SQL standard</translation>
    </message>
    <message>
        <source>MySQL/MariaDB has no join that keeps all rows of both tables: let this one keep those of one table.</source>
        <translation>MySQL/MariaDB n’a pas de jointure qui garde toutes les lignes des deux tables&#xa0;: faites en sorte que celle-ci garde celles d’une seule table.</translation>
    </message>
    <message>
        <source>PostgreSQL keeps all rows of both tables only where a join asks for equal values: choose the operator =, or let the join keep the rows of one table.</source>
        <translation>PostgreSQL ne garde toutes les lignes des deux tables que si la jointure demande des valeurs égales&#xa0;: choisissez l’opérateur =, ou faites en sorte que la jointure garde les lignes d’une seule table.</translation>
    </message>
    <message>
        <source>These are more conditions than SQLite takes, which is about 900: write a long list of values as In (1, 2, 3).</source>
        <translation>Ces conditions sont plus nombreuses que SQLite ne l’accepte, soit environ 900&#xa0;: écrivez une longue liste de valeurs sous la forme In (1, 2, 3).</translation>
    </message>
    <message>
        <source>%1 takes no name that is empty: write one.</source>
        <translation>%1 n’accepte pas de nom vide&#xa0;: écrivez un nom.</translation>
    </message>
    <message>
        <source>%1 takes no name with the character zero in it: choose another one.</source>
        <translation>%1 n’accepte pas de nom qui contient le caractère zéro&#xa0;: choisissez un autre nom.</translation>
    </message>
    <message>
        <source>%1 takes no name with half a character in it: type it afresh.</source>
        <translation>%1 n’accepte pas de nom qui contient un demi-caractère&#xa0;: saisissez le nom à nouveau.</translation>
    </message>
    <message>
        <source>The name &quot;%1&quot; is too long for %2, which takes %3 bytes (one for a letter from A to Z, more for most others): choose a shorter one.</source>
        <translation>Le nom «&#xa0;%1&#xa0;» est trop long pour %2, qui accepte %3 octets (un pour une lettre de A à Z, plus pour la plupart des autres caractères)&#xa0;: choisissez un nom plus court.</translation>
    </message>
    <message>
        <source>The name &quot;%1&quot; is too long for %2, which takes %3 characters: choose a shorter one.</source>
        <translation>Le nom «&#xa0;%1&#xa0;» est trop long pour %2, qui accepte %3 caractères&#xa0;: choisissez un nom plus court.</translation>
    </message>
    <message>
        <source>The name &quot;%1&quot; has a rare character in it that %2 does not take, such as an emoji: write it without.</source>
        <translation>Le nom «&#xa0;%1&#xa0;» contient un caractère rare que %2 n’accepte pas, comme un emoji&#xa0;: écrivez le nom sans ce caractère.</translation>
    </message>
    <message>
        <source>The name &quot;%1&quot; ends with a blank, which %2 does not take: write it without.</source>
        <translation>Le nom «&#xa0;%1&#xa0;» se termine par un espace, ce que %2 n’accepte pas&#xa0;: écrivez le nom sans cet espace.</translation>
    </message>
    <message>
        <source>* and % are ordinary characters here, write Like before a pattern, or quotes around a text</source>
        <translation>* et % sont ici des caractères ordinaires, écrivez Like devant un motif, ou mettez des guillemets autour d’un texte</translation>
    </message>
    <message>
        <source>a value</source>
        <translation>une valeur</translation>
    </message>
    <message>
        <source>this is no date and time, write it like 2024-12-31 or 2024-12-31 23:59</source>
        <translation>ce n’est pas une date et une heure, écrivez-les comme 2024-12-31 ou 2024-12-31 23:59</translation>
    </message>
    <message>
        <source>%1 is not from %2 to %3</source>
        <translation>%1 n’est pas compris entre %2 et %3</translation>
    </message>
    <message>
        <source>%1 is not the letter %2 and a number from 1 to %3</source>
        <translation>%1 n’est pas la lettre %2 suivie d’un nombre de 1 à %3</translation>
    </message>
    <message>
        <source>%1 is beyond the last key %2 of its kind</source>
        <translation>%1 dépasse %2, la dernière clé de son genre</translation>
    </message>
    <message>
        <source>%1 is used before already</source>
        <translation>%1 est déjà utilisé plus haut</translation>
    </message>
    <message>
        <source>%1 is empty</source>
        <translation>%1 est vide</translation>
    </message>
    <message>
        <source>%1 is the name of another table too</source>
        <translation>%1 est aussi le nom d’une autre table</translation>
    </message>
    <message>
        <source>%1 does not begin with the entry &quot;*&quot;</source>
        <translation>%1 ne commence pas par l’entrée «&#xa0;*&#xa0;»</translation>
    </message>
    <message>
        <source>%1 is the key of no table</source>
        <translation>%1 n’est la clé d’aucune table</translation>
    </message>
    <message>
        <source>%1 is the key of no column</source>
        <translation>%1 n’est la clé d’aucune colonne</translation>
    </message>
    <message>
        <source>%1 is the key of no column of that table</source>
        <translation>%1 n’est la clé d’aucune colonne de cette table</translation>
    </message>
    <message>
        <source>%1 is no type of join</source>
        <translation>%1 n’est pas un type de jointure</translation>
    </message>
    <message>
        <source>%1 is no comparison</source>
        <translation>%1 n’est pas une comparaison</translation>
    </message>
    <message>
        <source>%1 is no sort order</source>
        <translation>%1 n’est pas un ordre de tri</translation>
    </message>
    <message>
        <source>%1 is less than the first row, %2</source>
        <translation>%1 est inférieur à la première ligne, %2</translation>
    </message>
    <message>
        <source>%1 does not come behind the row before it</source>
        <translation>%1 ne vient pas après la ligne précédente</translation>
    </message>
    <message>
        <source>%1 is no place in the text behind the name before it</source>
        <translation>%1 n’est pas un endroit du texte situé après le nom précédent</translation>
    </message>
    <message>
        <source>%1.* stands for all columns: count the rows with the total &quot;count&quot;, or add the columns that are meant.</source>
        <translation>%1.* représente toutes les colonnes : comptez les lignes avec le total « count », ou ajoutez les colonnes voulues.</translation>
    </message>
    <message>
        <source>%1 holds no numbers, for which alone there is the total &quot;%2&quot;: choose another total.</source>
        <translation>%1 ne contient pas de nombres, pour lesquels seuls existe le total « %2 » : choisissez un autre total.</translation>
    </message>
    <message>
        <source>%1 holds values that have no order, so that there is no total &quot;%2&quot; of them: choose another total.</source>
        <translation>%1 contient des valeurs sans ordre, pour lesquelles il n’y a pas de total « %2 » : choisissez un autre total.</translation>
    </message>
    <message>
        <source>Where criteria stand in several rows, some of a total and some of a column that is only a condition, the latter must be the same in every row: repeat it, or make two queries of this one.</source>
        <translation>Là où des critères figurent sur plusieurs lignes, les uns d’un total, les autres d’une colonne qui n’est qu’une condition, ces derniers doivent être les mêmes à chaque ligne : répétez-les, ou faites-en deux requêtes.</translation>
    </message>
    <message>
        <source>This criterion is asked of rows that were put together, and %1 has many values there: add it as a column of its own, or write a value.</source>
        <translation>Ce critère porte sur des lignes regroupées, et %1 y a plusieurs valeurs : ajoutez-le comme colonne à part, ou écrivez une valeur.</translation>
    </message>
    <message>
        <source>%1 sorts the rows and does not come out with them, which different rows need: show it, or take its sort away.</source>
        <translation>%1 trie les lignes sans sortir avec elles, ce qu’exigent des lignes différentes : affichez-la, ou retirez son tri.</translation>
    </message>
    <message>
        <source>%1 is only a condition, so that nothing can be sorted by it: choose another total, or take its sort away.</source>
        <translation>%1 n’est qu’une condition, on ne peut donc rien trier selon elle : choisissez un autre total, ou retirez son tri.</translation>
    </message>
    <message>
        <source>The first %1 rows are any %1 as long as nothing is sorted: sort by what is to decide.</source>
        <translation>Les %1 premières lignes sont %1 lignes quelconques tant que rien n’est trié : triez selon ce qui doit décider.</translation>
    </message>
    <message>
        <source>%2 has nothing that says %1: leave it out, or calculate it from what was found.</source>
        <translation>%2 n’a rien qui dise %1 : laissez-le, ou calculez-le à partir de ce qui est trouvé.</translation>
    </message>
    <message>
        <source>The parameter %1 stands in an expression that rows are put together by: show that column, or write a value in the place of the parameter.</source>
        <translation>Le paramètre %1 se trouve dans une expression selon laquelle des lignes sont regroupées : affichez cette colonne, ou écrivez une valeur à la place du paramètre.</translation>
    </message>
    <message>
        <source>at most 10000 characters can stand here</source>
        <translation>il peut y avoir ici 10000 caractères au plus</translation>
    </message>
    <message>
        <source>the character zero cannot stand here</source>
        <translation>le caractère zéro ne peut pas figurer ici</translation>
    </message>
    <message>
        <source>%1 means nothing here</source>
        <translation>%1 ne signifie rien ici</translation>
    </message>
    <message>
        <source>put an operator between two values, such as + or &amp;</source>
        <translation>mettez un opérateur entre deux valeurs, tel que + ou &amp;</translation>
    </message>
    <message>
        <source>compare it with %1</source>
        <translation>comparez-le à %1</translation>
    </message>
    <message>
        <source>a condition is needed here, as in [price] &gt; 5</source>
        <translation>il faut ici une condition, comme dans [price] &gt; 5</translation>
    </message>
    <message>
        <source>a number is needed here</source>
        <translation>il faut ici un nombre</translation>
    </message>
    <message>
        <source>a whole number is needed here</source>
        <translation>il faut ici un nombre entier</translation>
    </message>
    <message>
        <source>the number of decimals is needed here, from 0 to 15</source>
        <translation>il faut ici le nombre de décimales, de 0 à 15</translation>
    </message>
    <message>
        <source>a date is needed here, as in #2024-12-31#</source>
        <translation>il faut ici une date, comme dans #2024-12-31#</translation>
    </message>
    <message>
        <source>texts are joined by &amp;</source>
        <translation>les textes sont joints par &amp;</translation>
    </message>
    <message>
        <source>the query has no column %1, and a text stands in quotes</source>
        <translation>la requête n’a pas de colonne %1, et un texte se met entre guillemets</translation>
    </message>
    <message>
        <source>there is no function %1</source>
        <translation>il n’y a pas de fonction %1</translation>
    </message>
    <message>
        <source>a total is no function: write what is to be put together, and choose the total of the output column</source>
        <translation>un total n’est pas une fonction : écrivez ce qui doit être regroupé, et choisissez le total de la colonne de sortie</translation>
    </message>
    <message>
        <source>this is written %1</source>
        <translation>cela s’écrit %1</translation>
    </message>
    <message>
        <source>%1 is no total</source>
        <translation>%1 n’est pas un total</translation>
    </message>
    <message>
        <source>%1 stands beside an expression, which takes its place</source>
        <translation>%1 se trouve à côté d’une expression, qui prend sa place</translation>
    </message>
    <message>
        <source>This is nested deeper than SQLite takes, which is about 30 levels of parentheses: divide it among several columns or rows of criteria.</source>
        <translation>C’est imbriqué plus profondément que SQLite ne l’accepte, soit environ 30 niveaux de parenthèses : répartissez-le sur plusieurs colonnes ou lignes de critères.</translation>
    </message>
    <message>
        <source>This is a statement of more than a million characters: put fewer functions into each other, or divide it among several columns.</source>
        <translation>Cela donne une instruction de plus d’un million de caractères : imbriquez moins de fonctions, ou répartissez-la sur plusieurs colonnes.</translation>
    </message>
    <message>
        <source>%1 is no format of values</source>
        <translation>%1 n’est pas un format de valeurs</translation>
    </message>
    <message>
        <source>The query &quot;%1&quot; would read from itself, by itself or by way of the saved queries in it: choose another one, or take one out.</source>
        <translation>La requête « %1 » lirait dans elle-même, directement ou par les requêtes enregistrées qu’elle contient : choisissez-en une autre, ou retirez-en une.</translation>
    </message>
    <message>
        <source>In %1: %2</source>
        <translation>Dans %1 : %2</translation>
    </message>
    <message>
        <source>No column comes out of that query, so that it cannot stand as a table: give it output columns, and save it.</source>
        <translation>Aucune colonne ne sort de cette requête, elle ne peut donc pas servir de table : donnez-lui des colonnes de sortie, et enregistrez-la.</translation>
    </message>
    <message>
        <source>Saved queries stand more than %1 deep in each other then: make one query of some of them.</source>
        <translation>Des requêtes enregistrées seraient alors imbriquées sur plus de %1 niveaux : faites-en une seule de quelques-unes.</translation>
    </message>
    <message>
        <source>%1 gives no column %2 any more, which is used here: take it out of this query, or give it back to that one.</source>
        <translation>%1 ne donne plus de colonne %2, qui est utilisée ici : retirez-la de cette requête, ou rendez-la à l’autre.</translation>
    </message>
    <message>
        <source>%1 has other columns here than its query gives: read it again from its file.</source>
        <translation>%1 a ici d’autres colonnes que celles que sa requête donne : relisez-la depuis son fichier.</translation>
    </message>
    <message>
        <source>%1 has saved queries more than %2 deep in each other</source>
        <translation>%1 a des requêtes enregistrées imbriquées sur plus de %2 niveaux</translation>
    </message>
    <message>
        <source>this cannot be read as SQL (%1); mend it here or before.</source>
        <translation>ceci ne peut être lu comme du SQL (%1) ; corrigez-le ici ou avant.</translation>
    </message>
    <message>
        <source>what begins here has no end; close it with %1.</source>
        <translation>ce qui commence ici n&apos;a pas de fin ; fermez-le par %1.</translation>
    </message>
    <message>
        <source>there is no statement; write a SELECT.</source>
        <translation>il n&apos;y a pas d&apos;instruction ; écrivez un SELECT.</translation>
    </message>
    <message>
        <source>a drawing holds one statement; leave out all but one.</source>
        <translation>un dessin contient une seule instruction ; n&apos;en gardez qu&apos;une.</translation>
    </message>
    <message>
        <source>a drawing holds a SELECT and nothing else.</source>
        <translation>un dessin contient un SELECT et rien d&apos;autre.</translation>
    </message>
    <message>
        <source>this name is too long to be read.</source>
        <translation>ce nom est trop long pour être lu.</translation>
    </message>
    <message>
        <source>the text is too long to be drawn; at most %1 characters are read.</source>
        <translation>le texte est trop long pour être dessiné ; on lit %1 caractères au plus.</translation>
    </message>
    <message>
        <source>too much stands within each other here to be drawn.</source>
        <translation>il y a trop d&apos;imbrications ici pour un dessin.</translation>
    </message>
    <message>
        <source>a drawing has no place for %1; it can be run as it is.</source>
        <translation>un dessin n&apos;a pas de place pour %1 ; on peut l&apos;exécuter tel quel.</translation>
    </message>
    <message>
        <source>a window function</source>
        <translation>une fonction de fenêtrage</translation>
    </message>
    <message>
        <source>UNION, INTERSECT or EXCEPT</source>
        <translation>UNION, INTERSECT ou EXCEPT</translation>
    </message>
    <message>
        <source>WITH RECURSIVE</source>
        <translation>WITH RECURSIVE</translation>
    </message>
    <message>
        <source>a LATERAL source</source>
        <translation>une source LATERAL</translation>
    </message>
    <message>
        <source>a sub-select within a condition or value</source>
        <translation>un sous-SELECT dans une condition ou une valeur</translation>
    </message>
    <message>
        <source>rows left out by OFFSET</source>
        <translation>des lignes sautées par OFFSET</translation>
    </message>
    <message>
        <source>a limit that is no number from 1 to %1</source>
        <translation>une limite qui n&apos;est pas un nombre de 1 à %1</translation>
    </message>
    <message>
        <source>PERCENT or WITH TIES</source>
        <translation>PERCENT ou WITH TIES</translation>
    </message>
    <message>
        <source>a lock</source>
        <translation>un verrou</translation>
    </message>
    <message>
        <source>DISTINCT ON</source>
        <translation>DISTINCT ON</translation>
    </message>
    <message>
        <source>NULLS FIRST or NULLS LAST</source>
        <translation>NULLS FIRST ou NULLS LAST</translation>
    </message>
    <message>
        <source>grouping sets</source>
        <translation>des ensembles de regroupement</translation>
    </message>
    <message>
        <source>a function in the place of a table</source>
        <translation>une fonction à la place d&apos;une table</translation>
    </message>
    <message>
        <source>new names for the columns of a table</source>
        <translation>de nouveaux noms pour les colonnes d&apos;une table</translation>
    </message>
    <message>
        <source>a SELECT that reads from no table</source>
        <translation>un SELECT qui ne lit aucune table</translation>
    </message>
    <message>
        <source>a SELECT of no columns</source>
        <translation>un SELECT sans colonnes</translation>
    </message>
    <message>
        <source>a column that a FULL JOIN shares by USING or NATURAL</source>
        <translation>une colonne qu&apos;un FULL JOIN partage par USING ou NATURAL</translation>
    </message>
    <message>
        <source>a total within a calculation</source>
        <translation>un total dans un calcul</translation>
    </message>
    <message>
        <source>this (%1)</source>
        <translation>ceci (%1)</translation>
    </message>
    <message>
        <source>a drawing does not know the function %1 as it stands here; the statement can be run as it is.</source>
        <translation>un dessin ne connaît pas la fonction %1 sous cette forme ; on peut exécuter l&apos;instruction telle quelle.</translation>
    </message>
    <message>
        <source>a drawing does not know this cast; the statement can be run as it is.</source>
        <translation>un dessin ne connaît pas cette conversion ; on peut exécuter l&apos;instruction telle quelle.</translation>
    </message>
    <message>
        <source>a drawing does not know the operator %1; the statement can be run as it is.</source>
        <translation>un dessin ne connaît pas l&apos;opérateur %1 ; on peut exécuter l&apos;instruction telle quelle.</translation>
    </message>
    <message>
        <source>this division may give whole numbers or stop at 0, which one of a drawing does not; write %1.</source>
        <translation>cette division peut donner des nombres entiers ou s&apos;arrêter à 0, ce que celle d&apos;un dessin ne fait pas ; écrivez %1.</translation>
    </message>
    <message>
        <source>a drawing writes this as &apos;%1&apos;, which compares otherwise here; write it so.</source>
        <translation>un dessin écrit ceci &apos;%1&apos;, ce qui se compare autrement ici ; écrivez-le ainsi.</translation>
    </message>
    <message>
        <source>LIKE tells capitals from small letters here, which a drawing does not; write ILIKE if that is meant.</source>
        <translation>LIKE distingue ici les majuscules des minuscules, un dessin non ; écrivez ILIKE si c&apos;est voulu.</translation>
    </message>
    <message>
        <source>a drawing has no NULL as a value; write IS NULL or leave it out.</source>
        <translation>un dessin n&apos;a pas de NULL comme valeur ; écrivez IS NULL ou omettez-le.</translation>
    </message>
    <message>
        <source>this column is neither grouped nor a total; write it into GROUP BY.</source>
        <translation>cette colonne n&apos;est ni groupée ni un total ; mettez-la dans GROUP BY.</translation>
    </message>
    <message>
        <source>a drawing cannot hold this: %1</source>
        <translation>un dessin ne peut contenir ceci : %1</translation>
    </message>
    <message>
        <source>the condition of an outer join can compare columns of its two sides and nothing else in a drawing.</source>
        <translation>dans un dessin, la condition d&apos;une jointure externe compare des colonnes de ses deux côtés et rien d&apos;autre.</translation>
    </message>
    <message>
        <source>this condition has no place in the rows of a drawing.</source>
        <translation>cette condition n&apos;a pas de place dans les lignes d&apos;un dessin.</translation>
    </message>
    <message>
        <source>drawn, this would not say the same (%1); it can be run as it is.</source>
        <translation>dessiné, ceci ne dirait pas la même chose (%1) ; on peut l&apos;exécuter tel quel.</translation>
    </message>
    <message>
        <source>the order of its joins</source>
        <translation>l&apos;ordre de ses jointures</translation>
    </message>
    <message>
        <source>its conditions</source>
        <translation>ses conditions</translation>
    </message>
    <message>
        <source>its columns</source>
        <translation>ses colonnes</translation>
    </message>
    <message>
        <source>its groups</source>
        <translation>ses groupes</translation>
    </message>
    <message>
        <source>its order</source>
        <translation>son tri</translation>
    </message>
    <message>
        <source>the database has no table &quot;%1&quot;.</source>
        <translation>la base de données n&apos;a pas de table « %1 ».</translation>
    </message>
    <message>
        <source>the database has no table &quot;%1&quot;; is &quot;%2&quot; meant?</source>
        <translation>la base de données n&apos;a pas de table « %1 » ; s&apos;agit-il de « %2 » ?</translation>
    </message>
    <message>
        <source>there is no table &quot;%1&quot; in the statement.</source>
        <translation>il n&apos;y a pas de table « %1 » dans l&apos;instruction.</translation>
    </message>
    <message>
        <source>no table has a column &quot;%1&quot;.</source>
        <translation>aucune table n&apos;a de colonne « %1 ».</translation>
    </message>
    <message>
        <source>no table has a column &quot;%1&quot;; is &quot;%2&quot; meant?</source>
        <translation>aucune table n&apos;a de colonne « %1 » ; s&apos;agit-il de « %2 » ?</translation>
    </message>
    <message>
        <source>several tables have a column &quot;%1&quot;; write its table before it.</source>
        <translation>plusieurs tables ont une colonne « %1 » ; écrivez sa table devant.</translation>
    </message>
    <message>
        <source>two tables are called &quot;%1&quot; here; give one of them another name.</source>
        <translation>deux tables s&apos;appellent « %1 » ici ; donnez un autre nom à l&apos;une d&apos;elles.</translation>
    </message>
    <message>
        <source>two columns come out as &quot;%1&quot;.</source>
        <translation>deux colonnes sortent sous le nom « %1 ».</translation>
    </message>
    <message>
        <source>there is no output column %1.</source>
        <translation>il n&apos;y a pas de colonne de sortie %1.</translation>
    </message>
    <message>
        <source>a comment that is run</source>
        <translation>un commentaire qui est exécuté</translation>
    </message>
    <message>
        <source>no more than %1 comments can be kept; leave some out.</source>
        <translation>pas plus de %1 commentaires ne peuvent être conservés ; enlevez-en.</translation>
    </message>
    <message>
        <source>the database takes these operators together in another order than they are read; write parentheses.</source>
        <translation>la base de données regroupe ces opérateurs dans un autre ordre que celui de la lecture ; mettez des parenthèses.</translation>
    </message>
    <message>
        <source>a drawing takes a date for a moment beside one, which the database does not; the statement can be run as it is.</source>
        <translation>à côté d’un horodatage, un dessin prend une date pour un horodatage, ce que la base de données ne fait pas ; l’instruction peut être exécutée telle quelle.</translation>
    </message>
    <message>
        <source>a drawing takes &apos;%1&apos; for no text here, which the database does; write it without quotes.</source>
        <translation>un dessin ne prend pas &apos;%1&apos; pour un texte ici, ce que la base de données fait ; écrivez-le sans guillemets.</translation>
    </message>
</context>
<context>
    <name>ZandorWidget</name>
    <message>
        <source>Join %1 %2 %3</source>
        <translation>Jointure %1 %2 %3</translation>
    </message>
    <message>
        <source>Query designer</source>
        <translation>Éditeur de requêtes</translation>
    </message>
    <message>
        <source>all</source>
        <comment>the rows of a table, at the end of a line</comment>
        <translation>toutes</translation>
    </message>
    <message>
        <source>the rows of %1 and %2 that match</source>
        <translation>les lignes de %1 et de %2 qui correspondent</translation>
    </message>
    <message>
        <source>all rows of %1, and those of %2 that match</source>
        <translation>toutes les lignes de %1, et celles de %2 qui correspondent</translation>
    </message>
    <message>
        <source>all rows of %1 and of %2, side by side where they match</source>
        <translation>toutes les lignes de %1 et de %2, côte à côte là où elles correspondent</translation>
    </message>
    <message>
        <source>Re&amp;name…</source>
        <translation>Re&amp;nommer…</translation>
    </message>
    <message>
        <source>(None)</source>
        <comment>no sort order</comment>
        <translation>(Aucun)</translation>
    </message>
    <message>
        <source>Ascending</source>
        <translation>Croissant</translation>
    </message>
    <message>
        <source>Descending</source>
        <translation>Décroissant</translation>
    </message>
    <message>
        <source>Visible</source>
        <comment>an output column</comment>
        <translation>Visible</translation>
    </message>
    <message>
        <source>Not Visible</source>
        <translation>Non visible</translation>
    </message>
    <message>
        <source>Invisible</source>
        <translation>Invisible</translation>
    </message>
    <message>
        <source>&amp;Set</source>
        <comment>the button of a cell&apos;s editor</comment>
        <translation>&amp;OK</translation>
    </message>
    <message>
        <source>Remove the table</source>
        <translation>Retirer la table</translation>
    </message>
    <message>
        <source>key column</source>
        <comment>an entry of a table</comment>
        <translation>colonne clé</translation>
    </message>
    <message>
        <source>comes out</source>
        <comment>an entry of a table, in the rows</comment>
        <translation>colonne de sortie</translation>
    </message>
    <message>
        <source>Add field…</source>
        <translation>Ajouter…</translation>
    </message>
    <message>
        <source>Type to find a field</source>
        <translation>Tapez pour trouver un champ</translation>
    </message>
    <message>
        <source>Field</source>
        <translation>Champ</translation>
    </message>
    <message>
        <source>Fields</source>
        <translation>Champs</translation>
    </message>
    <message>
        <source>column %1</source>
        <translation>colonne %1</translation>
    </message>
    <message>
        <source>Tables and joins</source>
        <translation>Tables et jointures</translation>
    </message>
    <message>
        <source>Output columns</source>
        <translation>Colonnes de sortie</translation>
    </message>
    <message>
        <source>Scroll across</source>
        <translation>Défilement horizontal</translation>
    </message>
    <message>
        <source>Scroll down</source>
        <translation>Défilement vertical</translation>
    </message>
    <message>
        <source>Back to the origin</source>
        <translation>Retour à l’origine</translation>
    </message>
    <message>
        <source>Divider of canvas and grid</source>
        <translation>Séparateur entre la zone de dessin et la grille</translation>
    </message>
    <message>
        <source>Drag to give the canvas or the grid more room</source>
        <translation>Faites glisser pour donner plus de place à la zone de dessin ou à la grille</translation>
    </message>
</context>
<context>
    <name>zandor::designer</name>
    <message>
        <source>There is nothing to draw; add a table first.</source>
        <translation>Il n’y a rien à dessiner&#xa0;; ajoutez d’abord une table.</translation>
    </message>
    <message>
        <source>A picture ends in .png, .svg or .pdf; &quot;%1&quot; does not.</source>
        <translation>Une image se termine par .png, .svg ou .pdf&#xa0;; ce n’est pas le cas de «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>The printer cannot be reached; choose another one.</source>
        <translation>L’imprimante est inaccessible&#xa0;; choisissez-en une autre.</translation>
    </message>
    <message>
        <source>The page could not be printed; see the printer&apos;s own messages.</source>
        <translation>La page n’a pas pu être imprimée&#xa0;; consultez les messages de l’imprimante.</translation>
    </message>
    <message>
        <source>%1 tables are too many; the canvas takes %2.</source>
        <translation>%1 tables, c’est trop&#xa0;; la zone de dessin en accepte %2.</translation>
    </message>
    <message>
        <source>There is no table &quot;%1&quot; in %2.</source>
        <translation>Il n’y a pas de table «&#xa0;%1&#xa0;» dans %2.</translation>
    </message>
    <message>
        <source>These tables have %1 joins, and the canvas takes %2; choose fewer tables with --tables.</source>
        <translation>Ces tables ont %1 jointures, la zone de dessin en accepte %2&#xa0;; choisissez moins de tables avec --tables.</translation>
    </message>
    <message>
        <source>The drawing is too large for &quot;%1&quot;; choose a name that ends in .svg.</source>
        <translation>Le dessin est trop grand pour «&#xa0;%1&#xa0;»&#xa0;; choisissez un nom qui se termine par .svg.</translation>
    </message>
    <message>
        <source>Picture (*.png)</source>
        <translation>Image (*.png)</translation>
    </message>
    <message>
        <source>Scalable drawing (*.svg)</source>
        <translation>Dessin vectoriel (*.svg)</translation>
    </message>
    <message>
        <source>Document (*.pdf)</source>
        <translation>Document (*.pdf)</translation>
    </message>
    <message>
        <source>The drawing takes %1 tables, and the statement has %2.</source>
        <translation>Le dessin accepte %1 tables, et l’instruction en a %2.</translation>
    </message>
    <message>
        <source>The drawing takes %1 joins, and the statement has %2.</source>
        <translation>Le dessin accepte %1 jointures, et l’instruction en a %2.</translation>
    </message>
    <message>
        <source>The grid takes %1 columns, and the statement has %2.</source>
        <translation>La grille accepte %1 colonnes, et l’instruction en a %2.</translation>
    </message>
    <message>
        <source>There is no file &quot;%1&quot;; check the path.</source>
        <translation>Il n’y a pas de fichier «&#xa0;%1&#xa0;»&#xa0;; vérifiez le chemin.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is a folder; name a file with a statement.</source>
        <translation>«&#xa0;%1&#xa0;» est un dossier&#xa0;; indiquez un fichier avec une instruction.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; cannot be read: %2.</source>
        <translation>Le fichier «&#xa0;%1&#xa0;» ne peut pas être lu&#xa0;: %2.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is too large for a statement.</source>
        <translation>«&#xa0;%1&#xa0;» est trop grand pour une instruction.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no text in UTF-8; save it as such.</source>
        <translation>«&#xa0;%1&#xa0;» n’est pas un texte en UTF-8&#xa0;; enregistrez-le ainsi.</translation>
    </message>
    <message>
        <source>A text that is not drawn is not run on this database, which nothing would keep from writing: go back to the drawing.</source>
        <translation>Un texte qui n’est pas dessiné n’est pas exécuté sur cette base, que rien n’empêcherait d’écrire&#xa0;: revenez au dessin.</translation>
    </message>
    <message>
        <source>The text is in %1, and the database speaks %2: choose that above the text.</source>
        <translation>Le texte est en %1, et la base parle %2&#xa0;: choisissez-le au-dessus du texte.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Autosave</name>
    <message>
        <source>The changes cannot be kept safe in &quot;%1&quot; (%2); save the query yourself.</source>
        <translation>Les modifications ne peuvent pas être mises en sûreté dans «&#xa0;%1&#xa0;» (%2)&#xa0;; enregistrez vous-même la requête.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Banner</name>
    <message>
        <source>Close</source>
        <translation>Fermer</translation>
    </message>
</context>
<context>
    <name>zandor::designer::CellFormat</name>
    <message>
        <source>%1%</source>
        <comment>of hundred</comment>
        <translation>%1&#x202f;%</translation>
    </message>
</context>
<context>
    <name>zandor::designer::CellReader</name>
    <message>
        <source>(outside the calendar)</source>
        <translation>(hors calendrier)</translation>
    </message>
</context>
<context>
    <name>zandor::designer::CellTally</name>
    <message>
        <source>Cells: %1</source>
        <translation>Cellules : %1</translation>
    </message>
    <message>
        <source>Empty: %1</source>
        <translation>Vides : %1</translation>
    </message>
    <message>
        <source>Numbers: %1</source>
        <translation>Nombres : %1</translation>
    </message>
    <message>
        <source>Sum: %1</source>
        <translation>Somme : %1</translation>
    </message>
    <message>
        <source>Average: %1</source>
        <translation>Moyenne : %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>Plus petit : %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>Plus grand : %1</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ChartData</name>
    <message>
        <source>Drawn are the first %1 of %2 rows.</source>
        <translation>Sont dessinées les %1 premières lignes sur %2.</translation>
    </message>
    <message>
        <source>Rows left out because they have no date: %1.</source>
        <translation>Lignes omises faute de date : %1.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ChartPanel</name>
    <message>
        <source>Cop&amp;y</source>
        <translation>Cop&amp;ier</translation>
    </message>
    <message>
        <source>Copy the chart as a picture</source>
        <translation>Copier le graphique comme image</translation>
    </message>
    <message>
        <source>E&amp;xport…</source>
        <translation>E&amp;xporter…</translation>
    </message>
    <message>
        <source>Export the chart as PNG, SVG or PDF</source>
        <translation>Exporter le graphique en PNG, SVG ou PDF</translation>
    </message>
    <message>
        <source>&amp;Kind:</source>
        <translation>&amp;Type :</translation>
    </message>
    <message>
        <source>Columns</source>
        <translation>Colonnes</translation>
    </message>
    <message>
        <source>Lines</source>
        <translation>Lignes</translation>
    </message>
    <message>
        <source>&amp;Axis:</source>
        <translation>A&amp;xe :</translation>
    </message>
    <message>
        <source>The column whose values stand below</source>
        <translation>La colonne dont les valeurs figurent en bas</translation>
    </message>
    <message>
        <source>Val&amp;ues</source>
        <translation>Vale&amp;urs</translation>
    </message>
    <message>
        <source>The columns that are drawn</source>
        <translation>Les colonnes qui sont dessinées</translation>
    </message>
    <message>
        <source>There are no rows to draw.</source>
        <translation>Il n’y a pas de lignes à dessiner.</translation>
    </message>
    <message>
        <source>A chart needs a column of numbers, and these rows have none.</source>
        <translation>Un graphique a besoin d’une colonne de nombres, et ces lignes n’en ont pas.</translation>
    </message>
    <message>
        <source>A chart needs a column of texts or dates beside the numbers, and these rows have none.</source>
        <translation>Un graphique a besoin d’une colonne de textes ou de dates à côté des nombres, et ces lignes n’en ont pas.</translation>
    </message>
    <message>
        <source>Choose under &quot;Values&quot; what is to be drawn.</source>
        <translation>Choisissez sous « Valeurs » ce qui doit être dessiné.</translation>
    </message>
    <message>
        <source>Export chart</source>
        <translation>Exporter le graphique</translation>
    </message>
    <message>
        <source>chart.png</source>
        <translation>graphique.png</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ChartView</name>
    <message>
        <source>Chart</source>
        <translation>Graphique</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ColumnPanel</name>
    <message>
        <source>A column, or an expression such as price * (1 - discount)</source>
        <translation>Une colonne, ou une expression telle que price * (1 - discount)</translation>
    </message>
    <message>
        <source>What becomes of the values when rows are put together</source>
        <translation>Ce que deviennent les valeurs quand des lignes sont regroupées</translation>
    </message>
    <message>
        <source>What the column is called in the rows</source>
        <translation>Le nom de la colonne dans les lignes</translation>
    </message>
    <message>
        <source>Not sorted</source>
        <translation>Non trié</translation>
    </message>
    <message>
        <source>Ascending</source>
        <translation>Croissant</translation>
    </message>
    <message>
        <source>Descending</source>
        <translation>Décroissant</translation>
    </message>
    <message>
        <source>as it stands</source>
        <translation>comme elle est placée</translation>
    </message>
    <message>
        <source>Which column sorts first: 1 before 2, and both before those that sort as they stand, from left to right</source>
        <translation>Quelle colonne trie d’abord : 1 avant 2, et les deux avant celles qui trient comme elles sont placées, de gauche à droite</translation>
    </message>
    <message>
        <source>Sho&amp;wn in the rows</source>
        <translation>Affi&amp;chée dans les lignes</translation>
    </message>
    <message>
        <source>&amp;Total:</source>
        <translation>&amp;Total :</translation>
    </message>
    <message>
        <source>&amp;Name:</source>
        <translation>&amp;Nom :</translation>
    </message>
    <message>
        <source>&amp;Sort:</source>
        <translation>Or&amp;dre :</translation>
    </message>
    <message>
        <source>&amp;Priority:</source>
        <translation>Pri&amp;orité :</translation>
    </message>
    <message>
        <source>a column or an expression</source>
        <translation>une colonne ou une expression</translation>
    </message>
    <message>
        <source>How the values look in the rows; sorting, criteria and exported files go by the values themselves</source>
        <translation>Comment les valeurs se présentent dans les lignes ; le tri, les critères et les fichiers exportés suivent les valeurs elles-mêmes</translation>
    </message>
    <message>
        <source>as many as there are</source>
        <translation>autant que présentes</translation>
    </message>
    <message>
        <source>So many digits stand behind the point</source>
        <translation>Nombre de chiffres après la virgule</translation>
    </message>
    <message>
        <source>For&amp;mat:</source>
        <translation>For&amp;mat :</translation>
    </message>
    <message>
        <source>De&amp;cimals:</source>
        <translation>Décima&amp;les :</translation>
    </message>
    <message>
        <source>Fie&amp;ld:</source>
        <translation>Cham&amp;p :</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ConnectionBanner</name>
    <message>
        <source>&amp;Reconnect</source>
        <translation>&amp;Reconnecter</translation>
    </message>
    <message>
        <source>The connection to %1 is lost. Your query is kept.</source>
        <translation>La connexion à %1 est perdue. Votre requête est conservée.</translation>
    </message>
    <message>
        <source>The file of %1 is no longer there. Your query is kept.</source>
        <translation>Le fichier de %1 n’existe plus. Votre requête est conservée.</translation>
    </message>
    <message>
        <source>%1 has been replaced by another file since it was opened.</source>
        <translation>Un autre fichier a pris la place de %1 depuis son ouverture.</translation>
    </message>
    <message>
        <source>The tables of %1 have been changed by another program.</source>
        <translation>Les tables de %1 ont été modifiées par un autre programme.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ConnectionDialog</name>
    <message>
        <source>Open database</source>
        <translation>Ouvrir une base de données</translation>
    </message>
    <message>
        <source>usual</source>
        <translation>habituel</translation>
    </message>
    <message>
        <source>Port</source>
        <translation>Port</translation>
    </message>
    <message>
        <source>SQLite file</source>
        <translation>Fichier SQLite</translation>
    </message>
    <message>
        <source>PostgreSQL</source>
        <translation>PostgreSQL</translation>
    </message>
    <message>
        <source>MySQL or MariaDB</source>
        <translation>MySQL ou MariaDB</translation>
    </message>
    <message>
        <source>ODBC</source>
        <translation>ODBC</translation>
    </message>
    <message>
        <source>%1 (install the package %2)</source>
        <translation>%1 (installez le paquet %2)</translation>
    </message>
    <message>
        <source>&amp;Browse…</source>
        <translation>Pa&amp;rcourir…</translation>
    </message>
    <message>
        <source>P&amp;ort:</source>
        <translation>P&amp;ort&#xa0;:</translation>
    </message>
    <message>
        <source>&amp;Kind:</source>
        <translation>T&amp;ype&#xa0;:</translation>
    </message>
    <message>
        <source>&amp;File:</source>
        <translation>&amp;Fichier&#xa0;:</translation>
    </message>
    <message>
        <source>&amp;Host:</source>
        <translation>&amp;Serveur&#xa0;:</translation>
    </message>
    <message>
        <source>Data &amp;source:</source>
        <translation>Sour&amp;ce de données&#xa0;:</translation>
    </message>
    <message>
        <source>&amp;Database:</source>
        <translation>&amp;Base de données&#xa0;:</translation>
    </message>
    <message>
        <source>&amp;User:</source>
        <translation>&amp;Utilisateur&#xa0;:</translation>
    </message>
    <message>
        <source>&amp;Password:</source>
        <translation>&amp;Mot de passe&#xa0;:</translation>
    </message>
    <message>
        <source>&amp;Address:</source>
        <translation>&amp;Adresse&#xa0;:</translation>
    </message>
    <message>
        <source>SQLite databases (*.sqlite *.sqlite3 *.db *.db3);;All files (*)</source>
        <translation>Bases de données SQLite (*.sqlite *.sqlite3 *.db *.db3);;Tous les fichiers (*)</translation>
    </message>
</context>
<context>
    <name>zandor::designer::DatabaseCommands</name>
    <message>
        <source>Open SQLite &amp;file…</source>
        <translation>Ouvrir un &amp;fichier SQLite…</translation>
    </message>
    <message>
        <source>&amp;Connect to a server…</source>
        <translation>Se &amp;connecter à un serveur…</translation>
    </message>
    <message>
        <source>Open database</source>
        <translation>Ouvrir une base de données</translation>
    </message>
    <message>
        <source>The database was not opened.</source>
        <translation>La base de données n’a pas été ouverte.</translation>
    </message>
    <message>
        <source>Open SQLite file</source>
        <translation>Ouvrir un fichier SQLite</translation>
    </message>
    <message>
        <source>SQLite databases (*.sqlite *.sqlite3 *.db *.db3);;All files (*)</source>
        <translation>Bases de données SQLite (*.sqlite *.sqlite3 *.db *.db3);;Tous les fichiers (*)</translation>
    </message>
    <message>
        <source>Reconnect</source>
        <translation>Reconnecter</translation>
    </message>
    <message>
        <source>The query is open, but not its database. %1</source>
        <translation>La requête est ouverte, mais pas sa base de données. %1</translation>
    </message>
    <message>
        <source>&amp;Choose database…</source>
        <translation>&amp;Choisir une base de données…</translation>
    </message>
    <message>
        <source>Reco&amp;nnect</source>
        <translation>Reco&amp;nnecter</translation>
    </message>
    <message>
        <source>&amp;Try again</source>
        <translation>&amp;Réessayer</translation>
    </message>
</context>
<context>
    <name>zandor::designer::DesignerWindow</name>
    <message>
        <source>Tables</source>
        <translation>Tables</translation>
    </message>
    <message>
        <source>SQL</source>
        <translation>SQL</translation>
    </message>
    <message>
        <source>Rows</source>
        <translation>Lignes</translation>
    </message>
    <message>
        <source>Events</source>
        <translation>Événements</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Fichier</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>&amp;Quitter</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Édition</translation>
    </message>
    <message>
        <source>Copy &amp;SQL</source>
        <translation>Copier le &amp;SQL</translation>
    </message>
    <message>
        <source>&amp;Options…</source>
        <translation>&amp;Options…</translation>
    </message>
    <message>
        <source>&amp;Database</source>
        <translation>&amp;Base de données</translation>
    </message>
    <message>
        <source>&amp;Query</source>
        <translation>&amp;Requête</translation>
    </message>
    <message>
        <source>&amp;Arrange tables</source>
        <translation>&amp;Disposer les tables</translation>
    </message>
    <message>
        <source>Re&amp;name table…</source>
        <translation>Re&amp;nommer la table…</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>&amp;Affichage</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>A&amp;ide</translation>
    </message>
    <message>
        <source>&amp;About</source>
        <translation>À &amp;propos</translation>
    </message>
    <message>
        <source>Add tables</source>
        <translation>Ajouter des tables</translation>
    </message>
    <message>
        <source>Output columns</source>
        <translation>Colonnes de sortie</translation>
    </message>
    <message>
        <source>The grid shows %1 output columns and is full. Delete one before you add another; it would take the place of the last.</source>
        <translation>La grille affiche %1 colonnes de sortie et est pleine. Supprimez-en une avant d’en ajouter une autre&#xa0;; elle prendrait la place de la dernière.</translation>
    </message>
    <message>
        <source>About Zandor Designer</source>
        <translation>À propos de Zandor Designer</translation>
    </message>
    <message>
        <source>Zandor Designer %1

Draw a query, read its SQL, run it. The database is only read.</source>
        <translation>Zandor Designer %1

Dessinez une requête, lisez son SQL, exécutez-la. La base de données est seulement lue.</translation>
    </message>
    <message>
        <source>&amp;New query</source>
        <translation>&amp;Nouvelle requête</translation>
    </message>
    <message>
        <source>&amp;Open query…</source>
        <translation>&amp;Ouvrir une requête…</translation>
    </message>
    <message>
        <source>&amp;Save</source>
        <translation>&amp;Enregistrer</translation>
    </message>
    <message>
        <source>Save &amp;as…</source>
        <translation>Enregistrer &amp;sous…</translation>
    </message>
    <message>
        <source>Tables: %1   Joins: %2</source>
        <translation>Tables&#xa0;: %1   Jointures&#xa0;: %2</translation>
    </message>
    <message>
        <source>&amp;Dark colours</source>
        <translation>Couleurs &amp;sombres</translation>
    </message>
    <message>
        <source>&amp;Find table</source>
        <translation>&amp;Chercher une table</translation>
    </message>
    <message>
        <source>&amp;Tables</source>
        <translation>&amp;Tables</translation>
    </message>
    <message>
        <source>&amp;SQL</source>
        <translation>S&amp;QL</translation>
    </message>
    <message>
        <source>&amp;Rows</source>
        <translation>&amp;Lignes</translation>
    </message>
    <message>
        <source>&amp;Events</source>
        <translation>&amp;Événements</translation>
    </message>
    <message>
        <source>&amp;Go to</source>
        <translation>&amp;Aller à</translation>
    </message>
    <message>
        <source>&amp;Drawing</source>
        <translation>&amp;Dessin</translation>
    </message>
    <message>
        <source>&amp;Criteria</source>
        <translation>&amp;Critères</translation>
    </message>
    <message>
        <source>&amp;Keys</source>
        <translation>&amp;Touches</translation>
    </message>
    <message>
        <source>&amp;Try again</source>
        <translation>Réessa&amp;yer</translation>
    </message>
    <message>
        <source>Saved as %1.</source>
        <translation>Enregistré sous %1.</translation>
    </message>
    <message>
        <source>&amp;Chart</source>
        <translation>&amp;Graphique</translation>
    </message>
    <message>
        <source>Column</source>
        <translation>Colonne</translation>
    </message>
    <message>
        <source>Query</source>
        <translation>Requête</translation>
    </message>
    <message>
        <source>C&amp;olumn</source>
        <translation>C&amp;olonne</translation>
    </message>
    <message>
        <source>Total of the output column that the grid is in (Ctrl+T)</source>
        <translation>Total de la colonne de sortie où se trouve la grille (Ctrl+T)</translation>
    </message>
    <message>
        <source>Total</source>
        <translation>Total</translation>
    </message>
    <message>
        <source>Add saved query</source>
        <translation>Ajouter une requête enregistrée</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Document</name>
    <message>
        <source>&amp;Undo</source>
        <translation>&amp;Annuler</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>&amp;Rétablir</translation>
    </message>
</context>
<context>
    <name>zandor::designer::EventPanel</name>
    <message>
        <source>Time</source>
        <translation>Heure</translation>
    </message>
    <message>
        <source>No.</source>
        <translation>N°</translation>
    </message>
    <message>
        <source>Event</source>
        <translation>Événement</translation>
    </message>
    <message>
        <source>Arguments</source>
        <translation>Arguments</translation>
    </message>
    <message>
        <source>Events of the control</source>
        <translation>Événements du contrôle</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>Vider</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copier</translation>
    </message>
    <message>
        <source>Copy the selected events, or all of them</source>
        <translation>Copier les événements sélectionnés, ou tous</translation>
    </message>
    <message>
        <source>DeletedTable: %1</source>
        <translation>DeletedTable&#xa0;: %1</translation>
    </message>
    <message>
        <source>%1 (number %2)</source>
        <translation>%1 (numéro %2)</translation>
    </message>
    <message>
        <source>wParam %1: the menu opens</source>
        <translation>wParam %1&#xa0;: le menu s’ouvre</translation>
    </message>
    <message>
        <source>wParam %1: the menu is closed</source>
        <translation>wParam %1&#xa0;: le menu est fermé</translation>
    </message>
</context>
<context>
    <name>zandor::designer::EventWords</name>
    <message>
        <source>(gone)</source>
        <translation>(supprimé)</translation>
    </message>
</context>
<context>
    <name>zandor::designer::FileDialogs</name>
    <message>
        <source>Zandor queries (*.json)</source>
        <translation>Requêtes Zandor (*.json)</translation>
    </message>
    <message>
        <source>All files (*)</source>
        <translation>Tous les fichiers (*)</translation>
    </message>
    <message>
        <source>Open query</source>
        <translation>Ouvrir une requête</translation>
    </message>
    <message>
        <source>Save query</source>
        <translation>Enregistrer la requête</translation>
    </message>
    <message>
        <source>query.json</source>
        <translation>requete.json</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>Enregistrer les modifications de «&#xa0;%1&#xa0;»&#xa0;?</translation>
    </message>
    <message>
        <source>Changes that are not saved are lost.</source>
        <translation>Les modifications non enregistrées seront perdues.</translation>
    </message>
    <message>
        <source>To save your query overwrites these changes.</source>
        <translation>Enregistrer votre requête écrase ces modifications.</translation>
    </message>
    <message>
        <source>&amp;Overwrite them</source>
        <translation>&amp;Les écraser</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; is no longer there; save the query to have one.</source>
        <translation>Le fichier «&#xa0;%1&#xa0;» n’existe plus&#xa0;; enregistrez la requête pour en avoir un.</translation>
    </message>
    <message>
        <source>To load it gives up your own changes.</source>
        <translation>Le charger abandonne vos propres modifications.</translation>
    </message>
    <message>
        <source>You have not changed it since.</source>
        <translation>Vous ne l’avez pas modifié depuis.</translation>
    </message>
    <message>
        <source>&amp;Keep mine</source>
        <translation>&amp;Garder ma version</translation>
    </message>
    <message>
        <source>&amp;Decide later</source>
        <translation>&amp;Décider plus tard</translation>
    </message>
    <message>
        <source>Changed file</source>
        <translation>Fichier modifié</translation>
    </message>
    <message>
        <source>Another program has changed &quot;%1&quot; since you opened it.</source>
        <translation>Un autre programme a modifié «&#xa0;%1&#xa0;» depuis que vous l’avez ouvert.</translation>
    </message>
    <message>
        <source>&amp;Load the file</source>
        <translation>&amp;Charger le fichier</translation>
    </message>
    <message>
        <source>Save &amp;as…</source>
        <translation>Enregistrer &amp;sous…</translation>
    </message>
</context>
<context>
    <name>zandor::designer::FindBar</name>
    <message>
        <source>Find in the statement</source>
        <translation>Rechercher dans l’instruction</translation>
    </message>
    <message>
        <source>Previous (Shift+Enter)</source>
        <translation>Précédent (Maj+Entrée)</translation>
    </message>
    <message>
        <source>Next (Enter)</source>
        <translation>Suivant (Entrée)</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Fermer</translation>
    </message>
</context>
<context>
    <name>zandor::designer::FlagsPage</name>
    <message>
        <source>Join types offered</source>
        <translation>Types de jointure proposés</translation>
    </message>
    <message>
        <source>Operators offered</source>
        <translation>Opérateurs proposés</translation>
    </message>
    <message>
        <source>The join dialog counts what it offers: with one left out, each behind it counts as the one before. Leave out only from the end.</source>
        <translation>La fenêtre de jointure compte ce qu’elle propose&#xa0;: s’il manque une entrée, chacune des suivantes vaut la précédente. N’en retirez qu’à la fin.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Format</name>
    <message>
        <source>As it is</source>
        <translation>Telle quelle</translation>
    </message>
    <message>
        <source>Whole number</source>
        <translation>Nombre entier</translation>
    </message>
    <message>
        <source>Decimals</source>
        <translation>Décimales</translation>
    </message>
    <message>
        <source>Thousands</source>
        <translation>Milliers</translation>
    </message>
    <message>
        <source>Percent</source>
        <translation>Pourcentage</translation>
    </message>
    <message>
        <source>Short date</source>
        <translation>Date courte</translation>
    </message>
    <message>
        <source>Long date</source>
        <translation>Date longue</translation>
    </message>
    <message>
        <source>Date and time</source>
        <translation>Date et heure</translation>
    </message>
    <message>
        <source>ISO date</source>
        <translation>Date ISO</translation>
    </message>
    <message>
        <source>Year and month</source>
        <translation>Année et mois</translation>
    </message>
    <message>
        <source>Weekday</source>
        <translation>Jour de la semaine</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>Heure</translation>
    </message>
</context>
<context>
    <name>zandor::designer::GridHint</name>
    <message>
        <source>Double-click a column of a table, or drag it here, to choose what comes out. Until then all columns do.</source>
        <translation>Double-cliquez sur une colonne d’une table, ou faites-la glisser ici, pour choisir les colonnes de sortie. D’ici là, toutes les colonnes sont produites.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::HelpWindow</name>
    <message>
        <source>Help</source>
        <translation>Aide</translation>
    </message>
    <message>
        <source>&amp;Criteria</source>
        <translation>&amp;Critères</translation>
    </message>
    <message>
        <source>&amp;Keys</source>
        <translation>&amp;Touches</translation>
    </message>
    <message>
        <source>Find on this page</source>
        <translation>Chercher dans cette page</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Invitation</name>
    <message>
        <source>Drag a table here from the list of tables, or double-click it there.
Then drag its columns into the grid below.</source>
        <translation>Faites glisser ici une table depuis la liste des tables, ou double-cliquez dessus dans la liste.
Faites ensuite glisser ses colonnes dans la grille ci-dessous.</translation>
    </message>
    <message>
        <source>Open a database to begin: see the menu &quot;Database&quot;.</source>
        <translation>Ouvrez une base de données pour commencer : voir le menu « Base de données ».</translation>
    </message>
</context>
<context>
    <name>zandor::designer::JoinCommands</name>
    <message>
        <source>Only matching rows of %1</source>
        <translation>Seulement les lignes correspondantes de %1</translation>
    </message>
    <message>
        <source>All rows of %1</source>
        <translation>Toutes les lignes de %1</translation>
    </message>
</context>
<context>
    <name>zandor::designer::MenuQuestions</name>
    <message>
        <source>C&amp;olumn…</source>
        <translation>C&amp;olonne…</translation>
    </message>
</context>
<context>
    <name>zandor::designer::MissingTables</name>
    <message>
        <source>There is no table &quot;%1&quot; in %2.</source>
        <translation>Il n’y a pas de table «&#xa0;%1&#xa0;» dans %2.</translation>
    </message>
    <message>
        <source>There is no file &quot;%1&quot; any more; the query is as it was read last.</source>
        <translation>Le fichier « %1 » n’existe plus ; la requête est telle qu’elle a été lue en dernier.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::OneQuery</name>
    <message>
        <source>There is no statement: write one, or go back to the drawing.</source>
        <translation>Il n’y a pas d’instruction&#xa0;: écrivez-en une, ou revenez au dessin.</translation>
    </message>
    <message>
        <source>what begins here has no end: close it.</source>
        <translation>ce qui commence ici n’a pas de fin&#xa0;: fermez-le.</translation>
    </message>
    <message>
        <source>a NUL stands here: delete it.</source>
        <translation>il y a un NUL ici&#xa0;: supprimez-le.</translation>
    </message>
    <message>
        <source>a second statement begins here: one is run at a time.</source>
        <translation>une deuxième instruction commence ici&#xa0;: une seule est exécutée à la fois.</translation>
    </message>
    <message>
        <source>only a query is run: it begins with SELECT, WITH, VALUES or TABLE.</source>
        <translation>seule une requête est exécutée&#xa0;: elle commence par SELECT, WITH, VALUES ou TABLE.</translation>
    </message>
    <message>
        <source>INTO writes, and the database is only read: leave it out.</source>
        <translation>INTO écrit, et la base n’est que lue&#xa0;: omettez-le.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Opening</name>
    <message>
        <source>Connecting to %1…</source>
        <translation>Connexion à %1…</translation>
    </message>
</context>
<context>
    <name>zandor::designer::OptionsDialog</name>
    <message>
        <source>The entries of the context menu that are shown:</source>
        <translation>Entrées affichées dans le menu contextuel&#xa0;:</translation>
    </message>
    <message>
        <source>What can be done with joins:</source>
        <translation>Ce qui est possible avec les jointures&#xa0;:</translation>
    </message>
    <message>
        <source>For developers: each box must be answered before the control goes on, and there may be hundreds when a large query is shown.</source>
        <translation>Pour les développeurs&#xa0;: il faut répondre à chaque message avant que le contrôle continue, et une grande requête peut en produire des centaines.</translation>
    </message>
    <message>
        <source>Options</source>
        <translation>Options</translation>
    </message>
    <message>
        <source>Texts</source>
        <translation>Textes</translation>
    </message>
    <message>
        <source>Menu</source>
        <translation>Menu</translation>
    </message>
    <message>
        <source>Joins</source>
        <translation>Jointures</translation>
    </message>
    <message>
        <source>Debug</source>
        <translation>Débogage</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ParameterDialog</name>
    <message>
        <source>Values for the query</source>
        <translation>Valeurs pour la requête</translation>
    </message>
    <message>
        <source>&amp;Run</source>
        <translation>&amp;Exécuter</translation>
    </message>
    <message>
        <source>%1 has to be %2.</source>
        <translation>%1 doit être %2.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::PasswordPrompt</name>
    <message>
        <source>Password</source>
        <translation>Mot de passe</translation>
    </message>
    <message>
        <source>The database %1 on %2 asks for a password.</source>
        <translation>La base de données %1 sur %2 demande un mot de passe.</translation>
    </message>
    <message>
        <source>The database %1 on %2 asks for the password of %3.</source>
        <translation>La base de données %1 sur %2 demande le mot de passe de %3.</translation>
    </message>
    <message>
        <source>&amp;Password:</source>
        <translation>&amp;Mot de passe&#xa0;:</translation>
    </message>
</context>
<context>
    <name>zandor::designer::QueryFile</name>
    <message>
        <source>Untitled</source>
        <translation>Sans titre</translation>
    </message>
</context>
<context>
    <name>zandor::designer::QueryPanel</name>
    <message>
        <source>all</source>
        <translation>toutes</translation>
    </message>
    <message>
        <source>The query itself gives no more rows than these, in the order in which it is sorted</source>
        <translation>La requête elle-même ne donne pas plus de lignes, dans l’ordre de son tri</translation>
    </message>
    <message>
        <source>What the query is for. The file keeps it.</source>
        <translation>À quoi sert la requête. Le fichier le conserve.</translation>
    </message>
    <message>
        <source>Fi&amp;rst rows:</source>
        <translation>Première&amp;s lignes :</translation>
    </message>
    <message>
        <source>Equal rows onl&amp;y once</source>
        <translation>Lignes é&amp;gales une seule fois</translation>
    </message>
    <message>
        <source>Descripti&amp;on:</source>
        <translation>D&amp;escription :</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Question</name>
    <message>
        <source>a pattern: * for any characters, ? for one</source>
        <translation>un motif&#xa0;: * pour des caractères quelconques,&#xa0;? pour un seul</translation>
    </message>
    <message>
        <source>a text</source>
        <translation>un texte</translation>
    </message>
    <message>
        <source>a number</source>
        <translation>un nombre</translation>
    </message>
    <message>
        <source>a date such as 2024-12-31</source>
        <translation>une date comme 2024-12-31</translation>
    </message>
    <message>
        <source>a time such as 23:59</source>
        <translation>une heure comme 23:59</translation>
    </message>
    <message>
        <source>a date and time such as 2024-12-31 23:59</source>
        <translation>une date et une heure comme 2024-12-31 23:59</translation>
    </message>
    <message>
        <source>true or false</source>
        <translation>true ou false</translation>
    </message>
    <message>
        <source>a value</source>
        <translation>une valeur</translation>
    </message>
</context>
<context>
    <name>zandor::designer::RecentMenu</name>
    <message>
        <source>Open &amp;recent</source>
        <translation>&amp;Récents</translation>
    </message>
    <message>
        <source>&amp;Clear list</source>
        <translation>&amp;Vider la liste</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Recovery</name>
    <message>
        <source>A query was drawn and never saved.</source>
        <translation>Une requête a été dessinée et jamais enregistrée.</translation>
    </message>
    <message>
        <source>Recover query</source>
        <translation>Récupérer la requête</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has changes that were not saved.</source>
        <translation>«&#xa0;%1&#xa0;» contient des modifications non enregistrées.</translation>
    </message>
    <message>
        <source>The designer ended unexpectedly. The changes up to %1 can be recovered.</source>
        <translation>Le programme s’est terminé de façon inattendue. Les modifications jusqu’au %1 peuvent être récupérées.</translation>
    </message>
    <message>
        <source>&amp;Recover</source>
        <translation>&amp;Récupérer</translation>
    </message>
    <message>
        <source>&amp;Ask later</source>
        <translation>&amp;Demander plus tard</translation>
    </message>
    <message>
        <source>The designer ended unexpectedly, and the changes that were kept safe cannot be read. They stay in the file &quot;%1&quot;.</source>
        <translation>Le programme s’est terminé de façon inattendue, et les modifications mises en sûreté ne peuvent pas être lues. Elles restent dans le fichier «&#xa0;%1&#xa0;».</translation>
    </message>
</context>
<context>
    <name>zandor::designer::RenameDialog</name>
    <message>
        <source>Rename table</source>
        <translation>Renommer la table</translation>
    </message>
    <message>
        <source>&amp;Rename</source>
        <translation>&amp;Renommer</translation>
    </message>
    <message>
        <source>The name is the table&apos;s in this query only; the database stays as it is.</source>
        <translation>Ce nom ne vaut que dans cette requête&#xa0;; la base de données reste telle quelle.</translation>
    </message>
    <message>
        <source>&amp;Table:</source>
        <translation>&amp;Table&#xa0;:</translation>
    </message>
    <message>
        <source>&amp;New name:</source>
        <translation>&amp;Nouveau nom&#xa0;:</translation>
    </message>
    <message>
        <source>A table needs a name; type one.</source>
        <translation>Une table a besoin d’un nom&#xa0;; saisissez-en un.</translation>
    </message>
    <message>
        <source>Another table of this query is called &quot;%1&quot;; choose another name.</source>
        <translation>Une autre table de cette requête s’appelle «&#xa0;%1&#xa0;»&#xa0;; choisissez un autre nom.</translation>
    </message>
    <message>
        <source>Rename table %1</source>
        <translation>Renommer la table %1</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ResultModel</name>
    <message>
        <source>(blob, %1 bytes)</source>
        <translation>(blob, %1 octets)</translation>
    </message>
    <message>
        <source>%1
Click to sort the rows that are shown; the query stays as it is.</source>
        <translation>%1
Cliquez pour trier les lignes affichées&#xa0;; la requête reste telle quelle.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ResultTable</name>
    <message>
        <source>&amp;Copy</source>
        <translation>&amp;Copier</translation>
    </message>
    <message>
        <source>Copy &amp;with all columns</source>
        <translation>Copier a&amp;vec toutes les colonnes</translation>
    </message>
    <message>
        <source>Select c&amp;olumn</source>
        <translation>Sélectionner la c&amp;olonne</translation>
    </message>
    <message>
        <source>Sort &amp;ascending</source>
        <translation>Trier en ordre c&amp;roissant</translation>
    </message>
    <message>
        <source>Sort &amp;descending</source>
        <translation>Trier en ordre &amp;décroissant</translation>
    </message>
    <message>
        <source>As the &amp;query gives them</source>
        <translation>Comme la re&amp;quête les donne</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ResultsPanel</name>
    <message>
        <source>These are too many cells to copy; export the rows instead.</source>
        <translation>Ces cellules sont trop nombreuses pour être copiées&#xa0;; exportez plutôt les lignes.</translation>
    </message>
    <message>
        <source>No database is open: open one first.</source>
        <translation>Aucune base de données n’est ouverte&#xa0;: ouvrez-en d’abord une.</translation>
    </message>
    <message>
        <source>The query cannot be run yet:</source>
        <translation>La requête ne peut pas encore être exécutée&#xa0;:</translation>
    </message>
    <message>
        <source>Cancelling…</source>
        <translation>Annulation…</translation>
    </message>
    <message>
        <source>Exporting…</source>
        <translation>Exportation…</translation>
    </message>
    <message>
        <source>Running…</source>
        <translation>Exécution…</translation>
    </message>
    <message>
        <source>%1  Rows so far: %2 · %3</source>
        <translation>%1  Lignes jusqu’ici&#xa0;: %2 · %3</translation>
    </message>
    <message>
        <source>The server does not answer.</source>
        <translation>Le serveur ne répond pas.</translation>
    </message>
    <message>
        <source>Exported to %1. Rows: %2 · %3</source>
        <translation>Exporté vers %1. Lignes&#xa0;: %2 · %3</translation>
    </message>
    <message>
        <source>Rows: %1 · %2</source>
        <translation>Lignes&#xa0;: %1 · %2</translation>
    </message>
    <message>
        <source>First %1 rows; there are more · %2</source>
        <translation>%1 premières lignes&#xa0;; il y en a d’autres · %2</translation>
    </message>
    <message>
        <source>Cancelled; nothing was exported · %1</source>
        <translation>Annulé&#xa0;; rien n’a été exporté · %1</translation>
    </message>
    <message>
        <source>Cancelled. Rows that came: %1 · %2</source>
        <translation>Annulé. Lignes reçues&#xa0;: %1 · %2</translation>
    </message>
    <message>
        <source>The database did not run the statement:
%1</source>
        <translation>La base de données n’a pas exécuté l’instruction&#xa0;:
%1</translation>
    </message>
    <message>
        <source>The connection to the database has broken down:
%1</source>
        <translation>La connexion à la base de données est rompue&#xa0;:
%1</translation>
    </message>
    <message>
        <source>Export all rows</source>
        <translation>Exporter toutes les lignes</translation>
    </message>
    <message>
        <source>Comma-separated values (*.csv)</source>
        <translation>Valeurs séparées par des virgules (*.csv)</translation>
    </message>
    <message>
        <source>Run the query to see its rows here.</source>
        <translation>Exécutez la requête pour voir ses lignes ici.</translation>
    </message>
    <message>
        <source>%1 s</source>
        <translation>%1 s</translation>
    </message>
    <message>
        <source>&amp;Run</source>
        <translation>&amp;Exécuter</translation>
    </message>
    <message>
        <source>Run the query and show its rows (F5)</source>
        <translation>Exécuter la requête et afficher ses lignes (F5)</translation>
    </message>
    <message>
        <source>&amp;Cancel</source>
        <translation>&amp;Annuler</translation>
    </message>
    <message>
        <source>Run the query and write all its rows into a CSV file</source>
        <translation>Exécuter la requête et écrire toutes ses lignes dans un fichier CSV</translation>
    </message>
    <message>
        <source>So many rows are shown at most</source>
        <translation>Nombre maximal de lignes affichées</translation>
    </message>
    <message>
        <source>%1 rows</source>
        <translation>%1 lignes</translation>
    </message>
    <message>
        <source>All rows</source>
        <translation>Toutes les lignes</translation>
    </message>
    <message>
        <source>Run the query again without the limit</source>
        <translation>Exécuter à nouveau la requête sans cette limite</translation>
    </message>
    <message>
        <source>&amp;Export rows…</source>
        <translation>E&amp;xporter les lignes…</translation>
    </message>
    <message>
        <source>Export…</source>
        <translation>Exporter…</translation>
    </message>
    <message>
        <source>rows.csv</source>
        <translation>lignes.csv</translation>
    </message>
    <message>
        <source>the rows can be sorted when all of them have come</source>
        <translation>les lignes pourront être triées quand elles seront toutes arrivées</translation>
    </message>
    <message>
        <source>these are too many rows to sort here; use the row &quot;Sort:&quot; of the drawing</source>
        <translation>ces lignes sont trop nombreuses pour être triées ici&#xa0;; utilisez la ligne «&#xa0;Tri&#xa0;:&#xa0;» du dessin</translation>
    </message>
    <message>
        <source>Sorting the rows…</source>
        <translation>Tri des lignes…</translation>
    </message>
    <message>
        <source>these rows are sorted by %1 here, the query is not</source>
        <translation>ces lignes sont triées ici selon %1, la requête ne l’est pas</translation>
    </message>
    <message>
        <source>these rows are sorted by %1 descending here, the query is not</source>
        <translation>ces lignes sont triées ici selon %1 en ordre décroissant, la requête ne l’est pas</translation>
    </message>
    <message>
        <source>the drawing has changed since</source>
        <translation>le dessin a changé depuis</translation>
    </message>
    <message>
        <source>Stop what is running, on the database too (Esc)</source>
        <translation>Arrêter ce qui est en cours, sur la base de données aussi (Échap)</translation>
    </message>
    <message>
        <source>The query finds no rows.</source>
        <translation>La requête ne trouve aucune ligne.</translation>
    </message>
    <message>
        <source>A text has to be the same as a whole, and on most databases in capital and small letters: Like *berlin* finds Berlin wherever it stands.</source>
        <translation>Un texte doit être identique en entier et, dans la plupart des bases de données, jusqu’aux majuscules et minuscules&#xa0;: Like *berlin* trouve Berlin où qu’il se trouve.</translation>
    </message>
    <message>
        <source>Copy s&amp;ummary</source>
        <translation>Copier le rés&amp;umé</translation>
    </message>
    <message>
        <source>The chart is drawn when the rows have come.</source>
        <translation>Le graphique est dessiné quand les lignes sont arrivées.</translation>
    </message>
    <message>
        <source>C&amp;hart</source>
        <translation>&amp;Graphique</translation>
    </message>
    <message>
        <source>Show the rows as a chart (Ctrl+5), and as a table again (Ctrl+4)</source>
        <translation>Afficher les lignes en graphique (Ctrl+5), puis de nouveau en tableau (Ctrl+4)</translation>
    </message>
    <message>
        <source>The text that was typed cannot be run:
%1</source>
        <translation>Le texte saisi ne peut pas être exécuté&#xa0;:
%1</translation>
    </message>
    <message>
        <source>of the text that was typed, not of the drawing</source>
        <translation>du texte saisi, et non du dessin</translation>
    </message>
    <message>
        <source>the text has changed since</source>
        <translation>le texte a changé depuis</translation>
    </message>
</context>
<context>
    <name>zandor::designer::SavedQueryCommands</name>
    <message>
        <source>Add saved &amp;query…</source>
        <translation>Ajouter une re&amp;quête enregistrée…</translation>
    </message>
    <message>
        <source>Read saved queries a&amp;gain</source>
        <translation>Relire les requêtes en&amp;registrées</translation>
    </message>
    <message>
        <source>Add saved query</source>
        <translation>Ajouter une requête enregistrée</translation>
    </message>
    <message>
        <source>The saved queries are as they are here.</source>
        <translation>Les requêtes enregistrées sont telles qu’ici.</translation>
    </message>
    <message>
        <source>Read again: %1.</source>
        <translation>Relues : %1.</translation>
    </message>
    <message>
        <source>Read saved queries again</source>
        <translation>Relire les requêtes enregistrées</translation>
    </message>
</context>
<context>
    <name>zandor::designer::ShowCommands</name>
    <message>
        <source>&amp;Export drawing…</source>
        <translation>E&amp;xporter le dessin…</translation>
    </message>
    <message>
        <source>&amp;Print…</source>
        <translation>&amp;Imprimer…</translation>
    </message>
    <message>
        <source>Copy as p&amp;icture</source>
        <translation>Copier comme &amp;image</translation>
    </message>
    <message>
        <source>Export drawing</source>
        <translation>Exporter le dessin</translation>
    </message>
    <message>
        <source>Query</source>
        <translation>Requête</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>Imprimer</translation>
    </message>
    <message>
        <source>Pictures &amp;with all columns</source>
        <translation>Images &amp;avec toutes les colonnes</translation>
    </message>
    <message>
        <source>drawing.png</source>
        <translation>dessin.png</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Spool</name>
    <message>
        <source>No file for the rows can be made in &quot;%1&quot; (%2): set TMPDIR to a folder that you may write to.</source>
        <translation>Impossible de créer un fichier pour les lignes dans «&#xa0;%1&#xa0;» (%2)&#xa0;: donnez à TMPDIR un dossier où vous pouvez écrire.</translation>
    </message>
    <message>
        <source>The rows would fill the disk with the folder &quot;%1&quot;: make room there, or ask for fewer rows.</source>
        <translation>Les lignes rempliraient le disque du dossier «&#xa0;%1&#xa0;»&#xa0;: faites-y de la place, ou demandez moins de lignes.</translation>
    </message>
    <message>
        <source>The rows cannot be written</source>
        <translation>Les lignes ne peuvent pas être écrites</translation>
    </message>
</context>
<context>
    <name>zandor::designer::SqlCommands</name>
    <message>
        <source>SQL statements (*.sql)</source>
        <translation>Instructions SQL (*.sql)</translation>
    </message>
    <message>
        <source>All files (*)</source>
        <translation>Tous les fichiers (*)</translation>
    </message>
    <message>
        <source>Open SQ&amp;L…</source>
        <translation>Ouvrir du SQ&amp;L…</translation>
    </message>
    <message>
        <source>Paste S&amp;QL</source>
        <translation>Coller du S&amp;QL</translation>
    </message>
    <message>
        <source>Sa&amp;ve SQL as…</source>
        <translation>Enregistrer le SQL so&amp;us…</translation>
    </message>
    <message>
        <source>Open SQL</source>
        <translation>Ouvrir du SQL</translation>
    </message>
    <message>
        <source>Paste SQL</source>
        <translation>Coller du SQL</translation>
    </message>
    <message>
        <source>The clipboard has no text; copy a SELECT statement first.</source>
        <translation>Le presse-papiers n’a pas de texte&#xa0;; copiez d’abord une instruction SELECT.</translation>
    </message>
    <message>
        <source>Save SQL</source>
        <translation>Enregistrer le SQL</translation>
    </message>
    <message>
        <source>statement.sql</source>
        <translation>instruction.sql</translation>
    </message>
</context>
<context>
    <name>zandor::designer::StatementPanel</name>
    <message>
        <source>The dialect of SQL that the statement is written in</source>
        <translation>Le dialecte SQL dans lequel l’instruction est écrite</translation>
    </message>
    <message>
        <source>Dialect</source>
        <translation>Dialecte</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copier</translation>
    </message>
    <message>
        <source>Copy the statement to the clipboard</source>
        <translation>Copier l’instruction dans le presse-papiers</translation>
    </message>
    <message>
        <source>SQL statement</source>
        <translation>Instruction SQL</translation>
    </message>
    <message>
        <source>Findings</source>
        <translation>Remarques</translation>
    </message>
    <message>
        <source>Click a finding to see its place</source>
        <translation>Cliquez sur une remarque pour voir l’endroit concerné</translation>
    </message>
    <message>
        <source>Add a table to begin: the statement appears here.</source>
        <translation>Ajoutez une table pour commencer&#xa0;: l’instruction apparaît ici.</translation>
    </message>
    <message>
        <source>%1 cannot say this query:</source>
        <translation>%1 ne peut pas exprimer cette requête&#xa0;:</translation>
    </message>
    <message>
        <source>Error: %1</source>
        <translation>Erreur&#xa0;: %1</translation>
    </message>
    <message>
        <source>Warning: %1</source>
        <translation>Avertissement&#xa0;: %1</translation>
    </message>
    <message>
        <source>%1 (as the database)</source>
        <translation>%1 (comme la base de données)</translation>
    </message>
    <message>
        <source>Format</source>
        <translation>Mettre en forme</translation>
    </message>
    <message>
        <source>Write the statement as the drawing says it</source>
        <translation>Écrire l’instruction comme le dessin la dit</translation>
    </message>
    <message>
        <source>&amp;Back to the drawing</source>
        <translation>&amp;Revenir au dessin</translation>
    </message>
    <message>
        <source>The drawing&apos;s own statement takes the place of the text (Esc)</source>
        <translation>L’instruction du dessin prend la place du texte (Échap)</translation>
    </message>
    <message>
        <source>Add a table to begin, or write a SELECT here: it becomes the drawing.</source>
        <translation>Ajoutez une table pour commencer, ou écrivez un SELECT ici&#xa0;: il devient le dessin.</translation>
    </message>
    <message>
        <source>%1 The drawing sleeps until this can be read; Run takes the text as it is.</source>
        <translation>%1 Le dessin est en sommeil jusqu’à ce que ceci puisse être lu&#xa0;; «&#xa0;Exécuter&#xa0;» prend le texte tel quel.</translation>
    </message>
    <message>
        <source>This text is not drawn, and the drawing sleeps: open a database, and it is read.</source>
        <translation>Ce texte n’est pas dessiné, et le dessin est en sommeil&#xa0;: ouvrez une base, et il sera lu.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::StatementTyping</name>
    <message>
        <source>Change the SQL</source>
        <translation>Modifier le SQL</translation>
    </message>
    <message>
        <source>Back to the drawing</source>
        <translation>Revenir au dessin</translation>
    </message>
</context>
<context>
    <name>zandor::designer::StepName</name>
    <message>
        <source>Change the query</source>
        <translation>Modifier la requête</translation>
    </message>
    <message>
        <source>Delete table %1</source>
        <translation>Supprimer la table %1</translation>
    </message>
    <message numerus="yes">
        <source>Delete %n table(s)</source>
        <translation>
            <numerusform>Supprimer %n table</numerusform>
            <numerusform>Supprimer %n tables</numerusform>
        </translation>
    </message>
    <message>
        <source>Add table %1</source>
        <translation>Ajouter la table %1</translation>
    </message>
    <message numerus="yes">
        <source>Add %n table(s)</source>
        <translation>
            <numerusform>Ajouter %n table</numerusform>
            <numerusform>Ajouter %n tables</numerusform>
        </translation>
    </message>
    <message>
        <source>Rename table %1 to %2</source>
        <translation>Renommer la table %1 en %2</translation>
    </message>
    <message numerus="yes">
        <source>Resize %n table(s)</source>
        <translation>
            <numerusform>Redimensionner %n table</numerusform>
            <numerusform>Redimensionner %n tables</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Move %n table(s)</source>
        <translation>
            <numerusform>Déplacer %n table</numerusform>
            <numerusform>Déplacer %n tables</numerusform>
        </translation>
    </message>
    <message>
        <source>Resize table %1</source>
        <translation>Redimensionner la table %1</translation>
    </message>
    <message>
        <source>Move table %1</source>
        <translation>Déplacer la table %1</translation>
    </message>
    <message>
        <source>Add join %1</source>
        <translation>Ajouter la jointure %1</translation>
    </message>
    <message numerus="yes">
        <source>Add %n join(s)</source>
        <translation>
            <numerusform>Ajouter %n jointure</numerusform>
            <numerusform>Ajouter %n jointures</numerusform>
        </translation>
    </message>
    <message>
        <source>Delete join %1</source>
        <translation>Supprimer la jointure %1</translation>
    </message>
    <message numerus="yes">
        <source>Delete %n join(s)</source>
        <translation>
            <numerusform>Supprimer %n jointure</numerusform>
            <numerusform>Supprimer %n jointures</numerusform>
        </translation>
    </message>
    <message>
        <source>Change join %1</source>
        <translation>Modifier la jointure %1</translation>
    </message>
    <message>
        <source>Change joins</source>
        <translation>Modifier les jointures</translation>
    </message>
    <message numerus="yes">
        <source>Change %n column(s)</source>
        <translation>
            <numerusform>Modifier %n colonne</numerusform>
            <numerusform>Modifier %n colonnes</numerusform>
        </translation>
    </message>
    <message>
        <source>Add column %1</source>
        <translation>Ajouter la colonne %1</translation>
    </message>
    <message numerus="yes">
        <source>Add %n column(s)</source>
        <translation>
            <numerusform>Ajouter %n colonne</numerusform>
            <numerusform>Ajouter %n colonnes</numerusform>
        </translation>
    </message>
    <message>
        <source>Delete column %1</source>
        <translation>Supprimer la colonne %1</translation>
    </message>
    <message numerus="yes">
        <source>Delete %n column(s)</source>
        <translation>
            <numerusform>Supprimer %n colonne</numerusform>
            <numerusform>Supprimer %n colonnes</numerusform>
        </translation>
    </message>
    <message>
        <source>Change columns</source>
        <translation>Modifier les colonnes</translation>
    </message>
    <message>
        <source>Change criterion of %1</source>
        <translation>Modifier le critère de %1</translation>
    </message>
    <message>
        <source>Rename column %1</source>
        <translation>Renommer la colonne %1</translation>
    </message>
    <message>
        <source>Change sorting by %1</source>
        <translation>Modifier le tri selon %1</translation>
    </message>
    <message>
        <source>Show column %1</source>
        <translation>Afficher la colonne %1</translation>
    </message>
    <message>
        <source>Hide column %1</source>
        <translation>Masquer la colonne %1</translation>
    </message>
    <message>
        <source>Change column %1</source>
        <translation>Modifier la colonne %1</translation>
    </message>
    <message>
        <source>Move column %1</source>
        <translation>Déplacer la colonne %1</translation>
    </message>
    <message numerus="yes">
        <source>Move %n column(s)</source>
        <translation>
            <numerusform>Déplacer %n colonne</numerusform>
            <numerusform>Déplacer %n colonnes</numerusform>
        </translation>
    </message>
    <message>
        <source>Resize column %1</source>
        <translation>Redimensionner la colonne %1</translation>
    </message>
    <message>
        <source>Change total of %1</source>
        <translation>Modifier le total de %1</translation>
    </message>
    <message>
        <source>Change field of %1</source>
        <translation>Modifier le champ de %1</translation>
    </message>
    <message>
        <source>Describe the query</source>
        <translation>Décrire la requête</translation>
    </message>
    <message>
        <source>Change which rows come out</source>
        <translation>Modifier les lignes qui sortent</translation>
    </message>
    <message>
        <source>Change format of %1</source>
        <translation>Changer le format de %1</translation>
    </message>
</context>
<context>
    <name>zandor::designer::SummaryLine</name>
    <message>
        <source>What the selected cells come to</source>
        <translation>Ce que donnent les cellules sélectionnées</translation>
    </message>
    <message>
        <source>Cells: %1 · adding up, %2 %</source>
        <translation>Cellules : %1 · calcul en cours, %2 %</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TableAdding</name>
    <message>
        <source>Arrange tables</source>
        <translation>Disposer les tables</translation>
    </message>
    <message>
        <source>The drawing takes %1 tables, and has them; delete one first.</source>
        <translation>Le dessin accepte %1 tables et les a déjà&#xa0;; supprimez-en d’abord une.</translation>
    </message>
    <message>
        <source>The drawing takes %1 tables and has %2; choose fewer.</source>
        <translation>Le dessin accepte %1 tables et en a %2&#xa0;; choisissez-en moins.</translation>
    </message>
    <message>
        <source>Add table %1</source>
        <translation>Ajouter la table %1</translation>
    </message>
    <message>
        <source>Add %1 tables</source>
        <translation>Ajouter %1 tables</translation>
    </message>
    <message>
        <source>Reading the tables…</source>
        <translation>Lecture des tables…</translation>
    </message>
    <message>
        <source>The drawing takes %1 joins, and with this there would be %2; delete tables or joins first.</source>
        <translation>Le dessin accepte %1 jointures, et il y en aurait %2&#xa0;; supprimez d’abord des tables ou des jointures.</translation>
    </message>
    <message>
        <source>%1 and %2 are joined by %3. Not joined by %4: draw those yourself if you need them.</source>
        <translation>%1 et %2 sont reliées par %3, mais pas par %4&#xa0;: dessinez vous-même ces jointures si vous en avez besoin.</translation>
    </message>
    <message>
        <source>Add query %1</source>
        <translation>Ajouter la requête %1</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TableListModel</name>
    <message>
        <source>%1, view</source>
        <translation>%1, vue</translation>
    </message>
    <message>
        <source>%1, table</source>
        <translation>%1, table</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TableTip</name>
    <message>
        <source>%1 (view)</source>
        <translation>%1 (vue)</translation>
    </message>
    <message>
        <source>and %1 more</source>
        <translation>et %1 de plus</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TablesPanel</name>
    <message>
        <source>Filter tables</source>
        <translation>Filtrer les tables</translation>
    </message>
    <message>
        <source>Read the list of tables again</source>
        <translation>Relire la liste des tables</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>Tables</translation>
    </message>
    <message>
        <source>Open a database to see its tables.</source>
        <translation>Ouvrez une base de données pour voir ses tables.</translation>
    </message>
    <message>
        <source>There are no tables in this database.</source>
        <translation>Il n’y a pas de tables dans cette base de données.</translation>
    </message>
    <message>
        <source>No table has all of this in its name.</source>
        <translation>Aucune table n’a tout cela dans son nom.</translation>
    </message>
    <message>
        <source>%1 of %2 tables</source>
        <translation>%1 tables sur %2</translation>
    </message>
    <message>
        <source>1 table</source>
        <translation>1 table</translation>
    </message>
    <message>
        <source>%1 tables</source>
        <translation>%1 tables</translation>
    </message>
    <message>
        <source>&amp;Add to drawing</source>
        <translation>&amp;Ajouter au dessin</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TextsPage</name>
    <message>
        <source>Where it is used</source>
        <translation>Où il est utilisé</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Texte</translation>
    </message>
    <message>
        <source>Texts of the control</source>
        <translation>Textes du contrôle</translation>
    </message>
    <message>
        <source>Set of texts</source>
        <translation>Jeu de textes</translation>
    </message>
    <message>
        <source>Texts that are left as they are follow the designer&apos;s language. Emptying one brings its text of that language back.</source>
        <translation>Les textes laissés tels quels suivent la langue du programme. En vider un rétablit le texte de cette langue.</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Total</name>
    <message>
        <source>&amp;No total</source>
        <translation>&amp;Aucun total</translation>
    </message>
    <message>
        <source>&amp;Group by it</source>
        <translation>Re&amp;grouper selon elle</translation>
    </message>
    <message>
        <source>&amp;Count</source>
        <translation>&amp;Nombre</translation>
    </message>
    <message>
        <source>Count &amp;different values</source>
        <translation>Nombre de valeurs &amp;différentes</translation>
    </message>
    <message>
        <source>&amp;Sum</source>
        <translation>&amp;Somme</translation>
    </message>
    <message>
        <source>&amp;Average</source>
        <translation>&amp;Moyenne</translation>
    </message>
    <message>
        <source>S&amp;mallest</source>
        <translation>&amp;Plus petit</translation>
    </message>
    <message>
        <source>&amp;Largest</source>
        <translation>P&amp;lus grand</translation>
    </message>
    <message>
        <source>C&amp;riteria only</source>
        <translation>C&amp;ritères seulement</translation>
    </message>
</context>
<context>
    <name>zandor::designer::TotalCommands</name>
    <message>
        <source>&amp;Total</source>
        <translation>&amp;Total</translation>
    </message>
</context>
<context>
    <name>zandor::designer::Waiting</name>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
</context>
<context>
    <name>zandor::designer::shell</name>
    <message>
        <source>Password for %1: </source>
        <translation>Mot de passe pour %1&#xa0;: </translation>
    </message>
    <message>
        <source>The query asks for &quot;%1&quot;; give it with --set &quot;%1=VALUE&quot;.</source>
        <translation>La requête demande «&#xa0;%1&#xa0;»&#xa0;; donnez-le avec --set &quot;%1=VALEUR&quot;.</translation>
    </message>
    <message>
        <source>The query asks for &quot;%1&quot;, which has to be %2; &quot;%3&quot; is not.</source>
        <translation>La requête demande «&#xa0;%1&#xa0;», qui doit être %2&#xa0;; «&#xa0;%3&#xa0;» ne l’est pas.</translation>
    </message>
    <message>
        <source>The query does not ask for &quot;%1&quot;; leave out its --set.</source>
        <translation>La requête ne demande pas «&#xa0;%1&#xa0;»&#xa0;; retirez son --set.</translation>
    </message>
    <message>
        <source>Cancelled.</source>
        <translation>Annulé.</translation>
    </message>
    <message>
        <source>The query names no database; give one with --database.</source>
        <translation>La requête ne nomme aucune base de données&#xa0;; indiquez-en une avec --database.</translation>
    </message>
    <message>
        <source>There is no format &quot;%1&quot;; write --format csv or --format json.</source>
        <translation>Il n’y a pas de format «&#xa0;%1&#xa0;»&#xa0;; écrivez --format csv ou --format json.</translation>
    </message>
    <message>
        <source>--limit takes a number of rows; write --limit 100.</source>
        <translation>--limit attend un nombre de lignes&#xa0;; écrivez --limit 100.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; sets nothing; write --set NAME=VALUE.</source>
        <translation>«&#xa0;%1&#xa0;» ne fixe rien&#xa0;; écrivez --set NOM=VALEUR.</translation>
    </message>
    <message>
        <source>--%1 goes with --run only.</source>
        <translation>--%1 ne va qu’avec --run.</translation>
    </message>
    <message>
        <source>--dialect goes with --sql only.</source>
        <translation>--dialect ne va qu’avec --sql.</translation>
    </message>
    <message>
        <source>No query is named; write --%1 query.json.</source>
        <translation>Aucune requête n’est nommée&#xa0;; écrivez --%1 requete.json.</translation>
    </message>
    <message>
        <source>There is no dialect &quot;%1&quot;; known are sqlite, postgresql, mysql, sqlserver and standard.</source>
        <translation>Il n’y a pas de dialecte «&#xa0;%1&#xa0;»&#xa0;; sont connus sqlite, postgresql, mysql, sqlserver et standard.</translation>
    </message>
    <message>
        <source>There is no folder &quot;%1&quot;; several statements are drawn into one that is there.</source>
        <translation>Il n’y a pas de dossier «&#xa0;%1&#xa0;»&#xa0;; plusieurs instructions sont dessinées dans un dossier qui existe.</translation>
    </message>
    <message>
        <source>The standard input stream has no name; name a file to draw it into.</source>
        <translation>L’entrée standard n’a pas de nom&#xa0;; indiquez un fichier où la dessiner.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; and &quot;%2&quot; would both become &quot;%3&quot;; draw them into two folders.</source>
        <translation>«&#xa0;%1&#xa0;» et «&#xa0;%2&#xa0;» deviendraient tous deux «&#xa0;%3&#xa0;»&#xa0;; dessinez-les dans deux dossiers.</translation>
    </message>
    <message>
        <source>The standard input stream cannot be read.</source>
        <translation>L’entrée standard ne peut pas être lue.</translation>
    </message>
    <message>
        <source>--draw takes two files; write --draw statement.sql query.json.</source>
        <translation>--draw prend deux fichiers&#xa0;; écrivez --draw instruction.sql requete.json.</translation>
    </message>
    <message>
        <source>--draw needs to know the tables; name their database with --database.</source>
        <translation>--draw doit connaître les tables&#xa0;; indiquez leur base de données avec --database.</translation>
    </message>
    <message>
        <source>--sql, --run and --draw go one at a time.</source>
        <translation>--sql, --run et --draw vont un seul à la fois.</translation>
    </message>
    <message>
        <source>--database goes with --run and --draw only.</source>
        <translation>--database ne va qu’avec --run et --draw.</translation>
    </message>
    <message>
        <source>The text that was typed beside the drawing is left out.</source>
        <translation>Le texte saisi à côté du dessin est laissé de côté.</translation>
    </message>
</context>
</TS>

<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr_FR">
<context>
    <name>EditedFile</name>
    <message>
        <source>No file name</source>
        <translation>Aucun nom de fichier</translation>
    </message>
</context>
<context>
    <name>FilterBar</name>
    <message>
        <source>Filter by action, function, command or key</source>
        <translation>Filtrer par action, fonction, commande ou raccourci</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtrer</translation>
    </message>
    <message>
        <source>Press a key combination to find what it does</source>
        <translation>Appuyez sur une combinaison de touches pour savoir ce qu’elle fait</translation>
    </message>
    <message>
        <source>Find key</source>
        <translation>Chercher un raccourci</translation>
    </message>
    <message numerus="yes">
        <source>%1 of %n bindings</source>
        <extracomment>Shown while a filter is active, for example &quot;3 of 186 bindings&quot;.</extracomment>
        <translation>
            <numerusform>%1 sur %n raccourci</numerusform>
            <numerusform>%1 sur %n raccourcis</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 is disabled</source>
        <translation>%1 est désactivé</translation>
    </message>
    <message>
        <source>%1 is free</source>
        <translation>%1 est libre</translation>
    </message>
    <message>
        <source>%1 is taken from the system file</source>
        <translation>%1 vient du fichier du système</translation>
    </message>
</context>
<context>
    <name>Handbook</name>
    <message>
        <source>Zem hotkeys editor Handbook</source>
        <translation>Manuel de l’éditeur de raccourcis Zem</translation>
    </message>
    <message>
        <source>&lt;h2&gt;Zem hotkeys editor&lt;/h2&gt;&lt;p&gt;The editor shows every function of the zem-wm window manager in its group, and below &lt;i&gt;Command Keybindings&lt;/i&gt; the command lines of your own, each with its key. &lt;b&gt;Current Key&lt;/b&gt; is the key combination that starts it; &lt;b&gt;Source&lt;/b&gt; says whether the binding comes from your own hotkeys file (&lt;i&gt;user&lt;/i&gt;) or from the system-wide one (&lt;i&gt;system&lt;/i&gt;), which gives every user&apos;s defaults.&lt;/p&gt;</source>
        <translation>&lt;h2&gt;Éditeur de raccourcis Zem&lt;/h2&gt;&lt;p&gt;L’éditeur montre chaque fonction du gestionnaire de fenêtres zem-wm dans son groupe et, sous &lt;i&gt;Raccourcis de commandes&lt;/i&gt;, vos propres lignes de commande, chacune avec son raccourci. &lt;b&gt;Raccourci actuel&lt;/b&gt; est la combinaison qui la déclenche ; &lt;b&gt;Source&lt;/b&gt; indique si le raccourci vient de votre propre fichier (&lt;i&gt;utilisateur&lt;/i&gt;) ou de celui du système (&lt;i&gt;système&lt;/i&gt;), qui donne les valeurs par défaut de tous les utilisateurs.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Finding&lt;/h3&gt;&lt;p&gt;Type into the field above the tree (Ctrl+F) to see only the rows whose action, function, command or key holds the text; a key may be typed as Ctrl+Alt+T or Ctrl|Alt|t. &lt;b&gt;Find key&lt;/b&gt; records a combination and shows who holds it, or says that it is free.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Rechercher&lt;/h3&gt;&lt;p&gt;Tapez dans le champ au-dessus de la liste (Ctrl+F) pour ne voir que les lignes dont l’action, la fonction, la commande ou le raccourci contient le texte ; un raccourci peut s’écrire Ctrl+Alt+T ou Ctrl|Alt|t. &lt;b&gt;Chercher un raccourci&lt;/b&gt; enregistre une combinaison et montre qui l’utilise, ou indique qu’elle est libre.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Commands&lt;/h3&gt;&lt;p&gt;&lt;b&gt;New action&lt;/b&gt; adds a command line of your own: type it, choose a program file with the first button beside the field, or an installed application with the second. &lt;b&gt;Clone&lt;/b&gt; gives a function or a command a further row for another key; &lt;b&gt;Edit&lt;/b&gt; and &lt;b&gt;Delete&lt;/b&gt; change or remove a command.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Commandes&lt;/h3&gt;&lt;p&gt;&lt;b&gt;Nouvelle action&lt;/b&gt; ajoute une ligne de commande à vous : tapez-la, choisissez un fichier de programme avec le premier bouton à côté du champ, ou une application installée avec le second. &lt;b&gt;Dupliquer&lt;/b&gt; donne à une fonction ou à une commande une ligne de plus pour un autre raccourci ; &lt;b&gt;Édition&lt;/b&gt; et &lt;b&gt;Supprimer&lt;/b&gt; modifient ou retirent une commande.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Files&lt;/h3&gt;&lt;p&gt;Your hotkeys file is keyshortcutrc in ~/.config/zem (or $XDG_CONFIG_HOME/zem); the system one is in the zem directory of the system configuration, /etc/zem for most installations. The window size and layout are kept in ~/.config/zem/zem-admin-hotkeys.conf. The command &lt;tt&gt;zem-hotkeys&lt;/tt&gt; lists, checks and changes the same files from a shell.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Fichiers&lt;/h3&gt;&lt;p&gt;Votre fichier de raccourcis est keyshortcutrc dans ~/.config/zem (ou $XDG_CONFIG_HOME/zem) ; celui du système est dans le répertoire zem de la configuration du système, /etc/zem pour la plupart des installations. La taille et la disposition de la fenêtre sont gardées dans ~/.config/zem/zem-admin-hotkeys.conf. La commande &lt;tt&gt;zem-hotkeys&lt;/tt&gt; liste, vérifie et modifie les mêmes fichiers depuis un terminal.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Keys&lt;/h3&gt;&lt;p&gt;Select a row and click &lt;b&gt;Assign Key:&lt;/b&gt;, then press the combination. A combination that another row holds is refused; &lt;b&gt;Reassign&lt;/b&gt; in that message moves it to your row and leaves the other without a key. &lt;b&gt;Clear Key&lt;/b&gt; takes the key away. A system key you clear or change is written into your file as &lt;i&gt;Disable&lt;/i&gt;, which switches the system binding of that key off. &lt;b&gt;Revert to System Binding&lt;/b&gt; in the Edit menu gives a function or a command back what the system file gives it, and a key that Reassign took goes back to the row it came from. Every edit can be undone and redone (Ctrl+Z, Ctrl+Shift+Z), wherever the focus is.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Touches&lt;/h3&gt;&lt;p&gt;Choisissez une ligne, cliquez sur &lt;b&gt;Attribuer :&lt;/b&gt;, puis appuyez sur la combinaison. Une combinaison qu&apos;une autre ligne possède est refusée ; &lt;b&gt;Réattribuer&lt;/b&gt; dans ce message la donne à votre ligne et laisse l&apos;autre sans touche. &lt;b&gt;Effacer le raccourci&lt;/b&gt; retire la touche. Une touche du système que vous effacez ou changez est écrite dans votre fichier comme &lt;i&gt;Disable&lt;/i&gt;, ce qui désactive l&apos;affectation système de cette touche. &lt;b&gt;Revenir au raccourci du système&lt;/b&gt; dans le menu Édition rend à une fonction ou à une commande ce que le fichier système lui donne, et une touche prise par Réattribuer retourne à sa ligne. Chaque modification peut être annulée et rétablie (Ctrl+Z, Ctrl+Maj+Z), où que soit le focus.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Save and Apply&lt;/h3&gt;&lt;p&gt;&lt;b&gt;Save&lt;/b&gt; (Ctrl+S) writes your hotkeys file; only the lines of the keys you edited change, and a file that cannot be written whole is left untouched. &lt;b&gt;Apply&lt;/b&gt; (Ctrl+Return) saves and tells the running window manager to read the file again; a file saved but not yet applied can still be applied. When another program changed the file since it was loaded, you are asked before it is overwritten. &lt;b&gt;Restore&lt;/b&gt; replaces your file with the system one and keeps the old one beside it as keyshortcutrc~.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Enregistrer et appliquer&lt;/h3&gt;&lt;p&gt;&lt;b&gt;Enregistrer&lt;/b&gt; (Ctrl+S) écrit votre fichier de raccourcis ; seules les lignes des touches modifiées changent, et un fichier qui ne peut être écrit en entier reste intact. &lt;b&gt;Appliquer&lt;/b&gt; (Ctrl+Entrée) enregistre et demande au gestionnaire de fenêtres en cours de relire le fichier ; un fichier enregistré mais pas encore appliqué peut toujours l&apos;être. Si un autre programme a modifié le fichier depuis son chargement, on vous demande avant de l&apos;écraser. &lt;b&gt;Restaurer&lt;/b&gt; remplace votre fichier par celui du système et garde l&apos;ancien à côté sous le nom keyshortcutrc~.&lt;/p&gt;</translation>
    </message>
</context>
<context>
    <name>HotkeysCheck</name>
    <message>
        <source>no [ShortCutKeys] section</source>
        <translation>aucune section [ShortCutKeys]</translation>
    </message>
    <message>
        <source>the key %1 cannot be read</source>
        <translation>le raccourci %1 est illisible</translation>
    </message>
    <message>
        <source>the key %1 does not count: line %2 binds the same key</source>
        <translation>la touche %1 ne compte pas : la ligne %2 affecte la même touche</translation>
    </message>
    <message>
        <source>%1 is no function of the window manager</source>
        <translation>%1 n’est pas une fonction du gestionnaire de fenêtres</translation>
    </message>
    <message>
        <source>the program of &quot;%1&quot; is not installed</source>
        <translation>le programme de « %1 » n’est pas installé</translation>
    </message>
    <message>
        <source>the key %1 alone takes a character from typing</source>
        <translation>le raccourci %1 seul prend un caractère à la saisie</translation>
    </message>
</context>
<context>
    <name>HotkeysFile</name>
    <message>
        <source>No file name</source>
        <translation>Aucun nom de fichier</translation>
    </message>
    <message>
        <source>Not a regular file</source>
        <translation>Pas un fichier ordinaire</translation>
    </message>
    <message>
        <source>The file is larger than 16 MiB</source>
        <translation>Le fichier dépasse 16 Mio</translation>
    </message>
    <message>
        <source>The file holds NUL bytes</source>
        <translation>Le fichier contient des octets NUL</translation>
    </message>
    <message>
        <source>The key &quot;%1&quot; cannot be written to a hotkeys file</source>
        <translation>Le raccourci « %1 » ne peut pas être écrit dans un fichier de raccourcis</translation>
    </message>
    <message>
        <source>The action &quot;%1&quot; cannot be written to a hotkeys file</source>
        <translation>L’action « %1 » ne peut pas être écrite dans un fichier de raccourcis</translation>
    </message>
    <message>
        <source>No [ShortCutKeys] section</source>
        <translation>Aucune section [ShortCutKeys]</translation>
    </message>
    <message>
        <source>The command is empty</source>
        <translation>La commande est vide</translation>
    </message>
    <message>
        <source>The command holds the control character %1, which a hotkeys file cannot hold</source>
        <translation>La commande contient le caractère de contrôle %1, qu&apos;un fichier de raccourcis ne peut pas contenir</translation>
    </message>
    <message>
        <source>The file name holds control characters</source>
        <translation>Le nom de fichier contient des caractères de contrôle</translation>
    </message>
    <message>
        <source>The file name cannot be written in the locale&apos;s encoding</source>
        <translation>Le nom de fichier ne peut pas s&apos;écrire dans l&apos;encodage de la locale</translation>
    </message>
    <message>
        <source>The file name is too long to be handed to the window manager</source>
        <translation>Le nom de fichier est trop long pour être transmis au gestionnaire de fenêtres</translation>
    </message>
    <message>
        <source>%1 is a symbolic link of another account</source>
        <translation>%1 est un lien symbolique d&apos;un autre compte</translation>
    </message>
    <message>
        <source>%1 is read-only: its owner&apos;s write permission is off</source>
        <translation>%1 est en lecture seule : son propriétaire n&apos;a pas le droit d&apos;écriture</translation>
    </message>
    <message>
        <source>%1 belongs to another account</source>
        <translation>%1 appartient à un autre compte</translation>
    </message>
    <message>
        <source>%1 has %2 hard links; replacing it would part it from the others</source>
        <translation>%1 a %2 liens physiques ; le remplacer le séparerait des autres</translation>
    </message>
    <message>
        <source>The file would be larger than 16 MiB</source>
        <translation>Le fichier dépasserait 16 Mio</translation>
    </message>
    <message>
        <source>Another program is writing a hotkeys file in %1; gave up waiting after %2 seconds</source>
        <translation>Un autre programme écrit un fichier de raccourcis dans %1 ; abandon après %2 secondes d&apos;attente</translation>
    </message>
</context>
<context>
    <name>KKeySequenceButton</name>
    <message>
        <source>Unsupported Key</source>
        <translation>Touche non prise en charge</translation>
    </message>
    <message>
        <source>The key you just pressed is not supported by Qt.</source>
        <translation>La touche que vous venez de presser n’est pas prise en charge par Qt.</translation>
    </message>
    <message>
        <source>Clear the key</source>
        <translation>Effacer la touche</translation>
    </message>
</context>
<context>
    <name>KKeySequenceWidgetPrivate</name>
    <message>
        <source>Input</source>
        <translation>Saisie</translation>
    </message>
    <message>
        <source>None</source>
        <translation>Aucun</translation>
    </message>
</context>
<context>
    <name>KeysConfForm</name>
    <message>
        <source>Window decoration (on/off)</source>
        <translation>Décoration des fenêtres (activée/désactivée)</translation>
    </message>
    <message>
        <source>toggle switch of a border</source>
        <translation>activer/désactiver la bordure</translation>
    </message>
    <message>
        <source>toggle switch of a border edge</source>
        <translation>activer/désactiver le bord de la bordure</translation>
    </message>
    <message>
        <source>toggle switch of a minimize button</source>
        <translation>activer/désactiver le bouton de réduction</translation>
    </message>
    <message>
        <source>toggle switch of a restore button</source>
        <translation>activer/désactiver le bouton de restauration</translation>
    </message>
    <message>
        <source>toggle switch of a close button</source>
        <translation>activer/désactiver le bouton de fermeture</translation>
    </message>
    <message>
        <source>toggle switch of a control button</source>
        <translation>activer/désactiver le bouton de contrôle</translation>
    </message>
    <message>
        <source>toggle switch of a taskbar button</source>
        <translation>activer/désactiver le bouton de la barre des tâches</translation>
    </message>
    <message>
        <source>toggle switch of a title bar</source>
        <translation>activer/désactiver la barre de titre</translation>
    </message>
    <message>
        <source>toggle switch of all decorations</source>
        <translation>activer/désactiver toutes les décorations</translation>
    </message>
    <message>
        <source>Taskbar</source>
        <translation>Barre des tâches</translation>
    </message>
    <message>
        <source>move the taskbar to bottom</source>
        <translation>placer la barre des tâches en bas</translation>
    </message>
    <message>
        <source>move the taskbar to top</source>
        <translation>placer la barre des tâches en haut</translation>
    </message>
    <message>
        <source>move the taskbar to left</source>
        <translation>placer la barre des tâches à gauche</translation>
    </message>
    <message>
        <source>move the taskbar to right</source>
        <translation>placer la barre des tâches à droite</translation>
    </message>
    <message>
        <source>toggle switch of TaskbarAutoHide</source>
        <translation>activer/désactiver le masquage automatique de la barre des tâches</translation>
    </message>
    <message>
        <source>enable TaskbarAutoHide</source>
        <translation>activer le masquage automatique de la barre des tâches</translation>
    </message>
    <message>
        <source>disable TaskbarAutoHide</source>
        <translation>désactiver le masquage automatique de la barre des tâches</translation>
    </message>
    <message>
        <source>toggle switch of the taskbar show/hide</source>
        <translation>afficher/masquer la barre des tâches</translation>
    </message>
    <message>
        <source>show the taskbar</source>
        <translation>afficher la barre des tâches</translation>
    </message>
    <message>
        <source>hide the taskbar</source>
        <translation>masquer la barre des tâches</translation>
    </message>
    <message>
        <source>appear the taskbar when TaskbarAutoHide</source>
        <translation>faire apparaître la barre des tâches masquée automatiquement</translation>
    </message>
    <message>
        <source>disappear the taskbar when TaskbarAutoHide</source>
        <translation>faire disparaître la barre des tâches masquée automatiquement</translation>
    </message>
    <message>
        <source>toggle switch of the taskbar top/botton</source>
        <translation>barre des tâches au premier/dernier plan</translation>
    </message>
    <message>
        <source>taskbar on top of all</source>
        <translation>barre des tâches au-dessus de tout</translation>
    </message>
    <message>
        <source>taskbar on bottom of all</source>
        <translation>barre des tâches en dessous de tout</translation>
    </message>
    <message>
        <source>Desktop Icon</source>
        <translation>Icônes du bureau</translation>
    </message>
    <message>
        <source>line up icons</source>
        <translation>aligner les icônes</translation>
    </message>
    <message>
        <source>order icons</source>
        <translation>ranger les icônes</translation>
    </message>
    <message>
        <source>select all icons</source>
        <translation>sélectionner toutes les icônes</translation>
    </message>
    <message>
        <source>find icons</source>
        <translation>chercher des icônes</translation>
    </message>
    <message>
        <source>execute the icon</source>
        <translation>exécuter l’icône</translation>
    </message>
    <message>
        <source>execute the icon with</source>
        <translation>exécuter l’icône avec</translation>
    </message>
    <message>
        <source>send the icon by email</source>
        <translation>envoyer l’icône par courriel</translation>
    </message>
    <message>
        <source>delete the icon</source>
        <translation>supprimer l’icône</translation>
    </message>
    <message>
        <source>show icon properties</source>
        <translation>afficher les propriétés de l’icône</translation>
    </message>
    <message>
        <source>create an icon</source>
        <translation>créer une icône</translation>
    </message>
    <message>
        <source>create a text file</source>
        <translation>créer un fichier texte</translation>
    </message>
    <message>
        <source>create a session script file</source>
        <translation>créer un script de session</translation>
    </message>
    <message>
        <source>cretae a folder</source>
        <translation>créer un dossier</translation>
    </message>
    <message>
        <source>send icon to home folder</source>
        <translation>envoyer l’icône dans le dossier personnel</translation>
    </message>
    <message>
        <source>send icon to My documents folder</source>
        <translation>envoyer l’icône dans le dossier Mes documents</translation>
    </message>
    <message>
        <source>send icon trash can</source>
        <translation>envoyer l’icône à la corbeille</translation>
    </message>
    <message>
        <source>send icon start menu</source>
        <translation>envoyer l’icône dans le menu démarrer</translation>
    </message>
    <message>
        <source>send icon to toolbar</source>
        <translation>envoyer l’icône dans la barre d’outils</translation>
    </message>
    <message>
        <source>send icon to folder</source>
        <translation>envoyer l’icône dans un dossier</translation>
    </message>
    <message>
        <source>cut icon(s)</source>
        <translation>couper les icônes</translation>
    </message>
    <message>
        <source>copy icon(s)</source>
        <translation>copier les icônes</translation>
    </message>
    <message>
        <source>paste icon(s)</source>
        <translation>coller les icônes</translation>
    </message>
    <message>
        <source>navigate up</source>
        <translation>aller vers le haut</translation>
    </message>
    <message>
        <source>navigate down</source>
        <translation>aller vers le bas</translation>
    </message>
    <message>
        <source>navigate left</source>
        <translation>aller vers la gauche</translation>
    </message>
    <message>
        <source>navigate right</source>
        <translation>aller vers la droite</translation>
    </message>
    <message>
        <source>rename icon</source>
        <translation>renommer l’icône</translation>
    </message>
    <message>
        <source>undo last operation on desktop</source>
        <translation>annuler la dernière opération sur le bureau</translation>
    </message>
    <message>
        <source>Keyboard</source>
        <translation>Clavier</translation>
    </message>
    <message>
        <source>switch to base keyboard</source>
        <translation>passer à la disposition de base</translation>
    </message>
    <message>
        <source>switch to alt keyboard</source>
        <translation>passer à la disposition secondaire</translation>
    </message>
    <message>
        <source>switch keyboard</source>
        <translation>changer de disposition de clavier</translation>
    </message>
    <message>
        <source>Pager</source>
        <translation>Sélecteur de bureaux</translation>
    </message>
    <message>
        <source>toggle switch of the pager show/hide</source>
        <translation>afficher/masquer le sélecteur de bureaux</translation>
    </message>
    <message>
        <source>show the pager</source>
        <translation>afficher le sélecteur de bureaux</translation>
    </message>
    <message>
        <source>hide the pager</source>
        <translation>masquer le sélecteur de bureaux</translation>
    </message>
    <message>
        <source>toggle switch of the pager top/botton</source>
        <translation>sélecteur de bureaux au premier/dernier plan</translation>
    </message>
    <message>
        <source>pager on top of all</source>
        <translation>sélecteur de bureaux au-dessus de tout</translation>
    </message>
    <message>
        <source>pager on botton of all</source>
        <translation>sélecteur de bureaux en dessous de tout</translation>
    </message>
    <message>
        <source>add row to the pager</source>
        <translation>ajouter une ligne au sélecteur de bureaux</translation>
    </message>
    <message>
        <source>remove row from the pager</source>
        <translation>retirer une ligne du sélecteur de bureaux</translation>
    </message>
    <message>
        <source>add column to the pager</source>
        <translation>ajouter une colonne au sélecteur de bureaux</translation>
    </message>
    <message>
        <source>remove column from the pager</source>
        <translation>retirer une colonne du sélecteur de bureaux</translation>
    </message>
    <message>
        <source>update the pager</source>
        <translation>actualiser le sélecteur de bureaux</translation>
    </message>
    <message>
        <source>maximize the pager (fullscreen)</source>
        <translation>agrandir le sélecteur de bureaux (plein écran)</translation>
    </message>
    <message>
        <source>restore the pager (small window)</source>
        <translation>restaurer le sélecteur de bureaux (petite fenêtre)</translation>
    </message>
    <message>
        <source>toggle pager fullscreen mode</source>
        <translation>basculer le sélecteur de bureaux en plein écran</translation>
    </message>
    <message>
        <source>Paging</source>
        <translation>Changement de page</translation>
    </message>
    <message>
        <source>switch to the left page</source>
        <translation>passer à la page de gauche</translation>
    </message>
    <message>
        <source>switch to the right page</source>
        <translation>passer à la page de droite</translation>
    </message>
    <message>
        <source>switch to the up page</source>
        <translation>passer à la page du haut</translation>
    </message>
    <message>
        <source>switch to the down page</source>
        <translation>passer à la page du bas</translation>
    </message>
    <message>
        <source>Search panel</source>
        <translation>Panneau de recherche</translation>
    </message>
    <message>
        <source>toggle search panel</source>
        <translation>afficher/masquer le panneau de recherche</translation>
    </message>
    <message>
        <source>Menu</source>
        <translation>Menu</translation>
    </message>
    <message>
        <source>pop up the start menu</source>
        <translation>ouvrir le menu démarrer</translation>
    </message>
    <message>
        <source>pop up the desktop menu</source>
        <translation>ouvrir le menu du bureau</translation>
    </message>
    <message>
        <source>pop up a window ctrl menu</source>
        <translation>ouvrir le menu de la fenêtre</translation>
    </message>
    <message>
        <source>pop down a menu</source>
        <translation>fermer un menu</translation>
    </message>
    <message>
        <source>pop down all menus</source>
        <translation>fermer tous les menus</translation>
    </message>
    <message>
        <source>Rearrangement</source>
        <translation>Disposition</translation>
    </message>
    <message>
        <source>overlap all windows</source>
        <translation>superposer toutes les fenêtres</translation>
    </message>
    <message>
        <source>overlap windows within the screen</source>
        <translation>superposer les fenêtres de l’écran</translation>
    </message>
    <message>
        <source>horizontally tile all windows</source>
        <translation>mosaïque horizontale de toutes les fenêtres</translation>
    </message>
    <message>
        <source>horizontally tile windows within the screen</source>
        <translation>mosaïque horizontale des fenêtres de l’écran</translation>
    </message>
    <message>
        <source>vertically tile all windows</source>
        <translation>mosaïque verticale de toutes les fenêtres</translation>
    </message>
    <message>
        <source>vertically tile windows within the screen</source>
        <translation>mosaïque verticale des fenêtres de l’écran</translation>
    </message>
    <message>
        <source>tile all windows in matrix</source>
        <translation>disposer toutes les fenêtres en grille</translation>
    </message>
    <message>
        <source>tile windows in matrix within the screen</source>
        <translation>disposer les fenêtres de l’écran en grille</translation>
    </message>
    <message>
        <source>minimize all windows</source>
        <translation>réduire toutes les fenêtres</translation>
    </message>
    <message>
        <source>minimize windows within the screen</source>
        <translation>réduire les fenêtres de l’écran</translation>
    </message>
    <message>
        <source>minimize/restore all windows</source>
        <translation>réduire/restaurer toutes les fenêtres</translation>
    </message>
    <message>
        <source>minimize/restore windows within the screen</source>
        <translation>réduire/restaurer les fenêtres de l’écran</translation>
    </message>
    <message>
        <source>restore all windows</source>
        <translation>restaurer toutes les fenêtres</translation>
    </message>
    <message>
        <source>restore windows within the screen</source>
        <translation>restaurer les fenêtres de l’écran</translation>
    </message>
    <message>
        <source>close all windows</source>
        <translation>fermer toutes les fenêtres</translation>
    </message>
    <message>
        <source>close windows within the screen</source>
        <translation>fermer les fenêtres de l’écran</translation>
    </message>
    <message>
        <source>Window placement</source>
        <translation>Placement des fenêtres</translation>
    </message>
    <message>
        <source>move a window</source>
        <translation>déplacer une fenêtre</translation>
    </message>
    <message>
        <source>move a window to the next screen</source>
        <translation>déplacer une fenêtre vers l’écran suivant</translation>
    </message>
    <message>
        <source>move a window to the previous screen</source>
        <translation>déplacer une fenêtre vers l’écran précédent</translation>
    </message>
    <message>
        <source>resize a window</source>
        <translation>redimensionner une fenêtre</translation>
    </message>
    <message>
        <source>minimize a window</source>
        <translation>réduire une fenêtre</translation>
    </message>
    <message>
        <source>restore a window size</source>
        <translation>restaurer la taille d’une fenêtre</translation>
    </message>
    <message>
        <source>maximize a window</source>
        <translation>agrandir une fenêtre</translation>
    </message>
    <message>
        <source>maximize/restore a window</source>
        <translation>agrandir/restaurer une fenêtre</translation>
    </message>
    <message>
        <source>fullscreen/restore a window</source>
        <translation>fenêtre en plein écran/restaurer</translation>
    </message>
    <message>
        <source>swallow to tray</source>
        <translation>réduire dans la zone de notification</translation>
    </message>
    <message>
        <source>move taskbar btn left(up)</source>
        <translation>déplacer le bouton de la barre des tâches à gauche (en haut)</translation>
    </message>
    <message>
        <source>move taskbar btn right(down)</source>
        <translation>déplacer le bouton de la barre des tâches à droite (en bas)</translation>
    </message>
    <message>
        <source>expand a window to all directions</source>
        <translation>étendre une fenêtre dans toutes les directions</translation>
    </message>
    <message>
        <source>expand a window to a left direction</source>
        <translation>étendre une fenêtre vers la gauche</translation>
    </message>
    <message>
        <source>expand a window to a right direction</source>
        <translation>étendre une fenêtre vers la droite</translation>
    </message>
    <message>
        <source>expand a window to an up direction</source>
        <translation>étendre une fenêtre vers le haut</translation>
    </message>
    <message>
        <source>expand a window to a down direction</source>
        <translation>étendre une fenêtre vers le bas</translation>
    </message>
    <message>
        <source>snap a window to a right edge</source>
        <translation>accrocher une fenêtre au bord droit</translation>
    </message>
    <message>
        <source>snap a window to a left edge</source>
        <translation>accrocher une fenêtre au bord gauche</translation>
    </message>
    <message>
        <source>snap a window to a bottom right corner</source>
        <translation>accrocher une fenêtre au coin inférieur droit</translation>
    </message>
    <message>
        <source>snap a window to a botton left corner</source>
        <translation>accrocher une fenêtre au coin inférieur gauche</translation>
    </message>
    <message>
        <source>snap a window to a top right corner</source>
        <translation>accrocher une fenêtre au coin supérieur droit</translation>
    </message>
    <message>
        <source>snap a window to a top left corner</source>
        <translation>accrocher une fenêtre au coin supérieur gauche</translation>
    </message>
    <message>
        <source>snap a window to a top edge</source>
        <translation>accrocher une fenêtre au bord supérieur</translation>
    </message>
    <message>
        <source>snap a window to a bottom edge</source>
        <translation>accrocher une fenêtre au bord inférieur</translation>
    </message>
    <message>
        <source>raise a window</source>
        <translation>mettre une fenêtre au premier plan</translation>
    </message>
    <message>
        <source>lower a window</source>
        <translation>mettre une fenêtre à l’arrière-plan</translation>
    </message>
    <message>
        <source>close a window (recommend)</source>
        <translation>fermer une fenêtre (recommandé)</translation>
    </message>
    <message>
        <source>close all similar window</source>
        <translation>fermer toutes les fenêtres semblables</translation>
    </message>
    <message>
        <source>close a window forcely</source>
        <translation>fermer une fenêtre de force</translation>
    </message>
    <message>
        <source>toggle switch of an ONTOP attribute</source>
        <translation>activer/désactiver l’attribut « toujours au-dessus »</translation>
    </message>
    <message>
        <source>toggle switch of an ONBOTTOM attribute</source>
        <translation>activer/désactiver l’attribut « toujours en dessous »</translation>
    </message>
    <message>
        <source>toggle switch of a STICKY attribute</source>
        <translation>activer/désactiver l’attribut « sur tous les bureaux »</translation>
    </message>
    <message>
        <source>toggle switch of a focus attribute</source>
        <translation>activer/désactiver l’attribut de focus</translation>
    </message>
    <message>
        <source>Window focus</source>
        <translation>Focus des fenêtres</translation>
    </message>
    <message>
        <source>switch an active window</source>
        <translation>changer de fenêtre active</translation>
    </message>
    <message>
        <source>switch back an active window</source>
        <translation>revenir à la fenêtre active précédente</translation>
    </message>
    <message>
        <source>change an active window</source>
        <translation>changer la fenêtre active</translation>
    </message>
    <message>
        <source>change back an active window</source>
        <translation>revenir à la fenêtre active</translation>
    </message>
    <message>
        <source>change an active window within a screen</source>
        <translation>changer la fenêtre active de l’écran</translation>
    </message>
    <message>
        <source>change back an active window in a screen</source>
        <translation>revenir à la fenêtre active de l’écran</translation>
    </message>
    <message>
        <source>make the desktop active</source>
        <translation>activer le bureau</translation>
    </message>
    <message>
        <source>Window Manager</source>
        <translation>Gestionnaire de fenêtres</translation>
    </message>
    <message>
        <source>restart zem-wm</source>
        <translation>redémarrer zem-wm</translation>
    </message>
    <message>
        <source>lock screen</source>
        <translation>verrouiller l’écran</translation>
    </message>
    <message>
        <source>standby</source>
        <translation>veille</translation>
    </message>
    <message>
        <source>suspend</source>
        <translation>mise en veille</translation>
    </message>
    <message>
        <source>hibernate</source>
        <translation>hibernation</translation>
    </message>
    <message>
        <source>change user</source>
        <translation>changer d’utilisateur</translation>
    </message>
    <message>
        <source>change/switch user</source>
        <translation>changer/basculer d’utilisateur</translation>
    </message>
    <message>
        <source>postpone session</source>
        <translation>suspendre la session</translation>
    </message>
    <message>
        <source>suspend screensaver</source>
        <translation>suspendre l’économiseur d’écran</translation>
    </message>
    <message>
        <source>resume screensaver</source>
        <translation>reprendre l’économiseur d’écran</translation>
    </message>
    <message>
        <source>exit zem-wm</source>
        <translation>quitter zem-wm</translation>
    </message>
    <message>
        <source>reboot</source>
        <translation>redémarrer</translation>
    </message>
    <message>
        <source>shutdown</source>
        <translation>éteindre</translation>
    </message>
    <message>
        <source>dpms on</source>
        <translation>gestion d’énergie de l’écran activée</translation>
    </message>
    <message>
        <source>dpms off</source>
        <translation>gestion d’énergie de l’écran désactivée</translation>
    </message>
    <message>
        <source>dpms toggle</source>
        <translation>basculer la gestion d’énergie de l’écran</translation>
    </message>
    <message>
        <source>previous wallpaper</source>
        <translation>fond d’écran précédent</translation>
    </message>
    <message>
        <source>next wallpaper</source>
        <translation>fond d’écran suivant</translation>
    </message>
    <message>
        <source>Command Keybindings</source>
        <extracomment>The group row under which the user&apos;s command entries are listed.</extracomment>
        <translation>Raccourcis de commandes</translation>
    </message>
    <message>
        <source>Zem hotkeys editor</source>
        <translation>Éditeur de raccourcis Zem</translation>
    </message>
    <message>
        <source>user</source>
        <translation>utilisateur</translation>
    </message>
    <message>
        <source>system</source>
        <translation>système</translation>
    </message>
    <message>
        <source>Action</source>
        <translation>Action</translation>
    </message>
    <message>
        <source>Current Key</source>
        <translation>Raccourci actuel</translation>
    </message>
    <message>
        <source>zem-wm function</source>
        <translation>fonction de zem-wm</translation>
    </message>
    <message>
        <source>Source</source>
        <translation>Source</translation>
    </message>
    <message>
        <source>Choose a Key for the Selected Action</source>
        <extracomment>The title of the key panel below the tree.</extracomment>
        <translation>Choisir un raccourci pour l’action sélectionnée</translation>
    </message>
    <message>
        <source>Assign Key:</source>
        <translation>Attribuer :</translation>
    </message>
    <message>
        <source>Clear Key</source>
        <translation>Effacer le raccourci</translation>
    </message>
    <message>
        <source>&amp;New file</source>
        <translation>&amp;Nouveau fichier</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>&amp;Ouvrir…</translation>
    </message>
    <message>
        <source>&amp;Restore...</source>
        <translation>&amp;Restaurer…</translation>
    </message>
    <message>
        <source>Restore user&apos;s keyshortcutrc file from system one</source>
        <translation>Restaurer le fichier keyshortcutrc de l’utilisateur à partir de celui du système</translation>
    </message>
    <message>
        <source>&amp;Save</source>
        <translation>&amp;Enregistrer</translation>
    </message>
    <message>
        <source>Save &amp;As...</source>
        <translation>Enregistrer &amp;sous…</translation>
    </message>
    <message>
        <source>E&amp;xit</source>
        <translation>&amp;Quitter</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Appliquer</translation>
    </message>
    <message>
        <source>&amp;New action</source>
        <translation>Nouvelle &amp;action</translation>
    </message>
    <message>
        <source>&amp;Clone</source>
        <translation>&amp;Dupliquer</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>É&amp;dition</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Supprimer</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Fichier</translation>
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
        <source>Revert to System Binding</source>
        <translation>Revenir au raccourci du système</translation>
    </message>
    <message>
        <source>Handbook</source>
        <translation>Manuel</translation>
    </message>
    <message>
        <source>Actions toolbar</source>
        <translation>Barre d’actions</translation>
    </message>
    <message>
        <source>Add command %1</source>
        <translation>Ajouter la commande %1</translation>
    </message>
    <message>
        <source>Edit command %1</source>
        <translation>Modifier la commande %1</translation>
    </message>
    <message>
        <source>Clone %1</source>
        <translation>Dupliquer %1</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>Are you sure to delete this action?</source>
        <translation>Voulez-vous vraiment supprimer cette action ?</translation>
    </message>
    <message>
        <source>Delete %1</source>
        <translation>Supprimer %1</translation>
    </message>
    <message>
        <source>Revert %1 to the system binding</source>
        <translation>Rétablir le raccourci du système pour %1</translation>
    </message>
    <message numerus="yes">
        <source>%1 stays with the row that holds it now.</source>
        <translation>
            <numerusform>%1 reste à la ligne qui l’utilise maintenant.</numerusform>
            <numerusform>%1 restent aux lignes qui les utilisent maintenant.</numerusform>
        </translation>
    </message>
    <message>
        <source>Save ?</source>
        <translation>Enregistrer ?</translation>
    </message>
    <message>
        <source>Save previous changes?</source>
        <translation>Enregistrer les modifications ?</translation>
    </message>
    <message>
        <source>Select hotkeys file</source>
        <translation>Choisir un fichier de raccourcis</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erreur</translation>
    </message>
    <message>
        <source>Can&apos;t create file </source>
        <translation>Impossible de créer le fichier </translation>
    </message>
    <message>
        <source>Can&apos;t copy %1
to %2</source>
        <translation>Impossible de copier %1
vers %2</translation>
    </message>
    <message>
        <source>No file name</source>
        <translation>Aucun nom de fichier</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Attention</translation>
    </message>
    <message>
        <source>Can&apos;t parse file:
%1</source>
        <translation>Impossible de lire le fichier :
%1</translation>
    </message>
    <message>
        <source>Can&apos;t save in file </source>
        <translation>Impossible d’enregistrer dans le fichier </translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Restaurer</translation>
    </message>
    <message>
        <source>Replace your hotkeys file with the system one?
All your own bindings in it will be lost.</source>
        <translation>Remplacer votre fichier de raccourcis par celui du système ?
Tous vos propres raccourcis qu’il contient seront perdus.</translation>
    </message>
    <message>
        <source>All changes will be lost. Save them?</source>
        <translation>Toutes les modifications seront perdues. Les enregistrer ?</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Avertissement</translation>
    </message>
    <message>
        <source>You current file is &quot;%1&quot;.
After restart zem-wm will use &quot;%2&quot;.</source>
        <translation>Le fichier actuel est « %1 ».
Après un redémarrage, zem-wm utilisera « %2 ».</translation>
    </message>
    <message>
        <source>The window manager could not be told to reload %1.</source>
        <translation>Le gestionnaire de fenêtres n’a pas pu être invité à recharger %1.</translation>
    </message>
    <message>
        <source>Reassign %1 from %2 to %3</source>
        <translation>Réattribuer %1 de %2 à %3</translation>
    </message>
    <message>
        <source>Assign %1 to %2</source>
        <translation>Attribuer %1 à %2</translation>
    </message>
    <message>
        <source>command</source>
        <extracomment>Names a command entry in &quot;to the %2 action (%3)&quot;, where %3 is its command line.</extracomment>
        <translation>commande</translation>
    </message>
    <message>
        <source>Whoopsie! Key conflict.</source>
        <translation>Oups ! Conflit de raccourcis.</translation>
    </message>
    <message>
        <source>Ouch! The %1 key combination has already been allocated
to the %2 action (%3).

Please choose a unique key combination.</source>
        <translation>Aïe ! La combinaison %1 est déjà attribuée
à l’action %2 (%3).

Veuillez choisir une combinaison unique.</translation>
    </message>
    <message>
        <source>Reassign</source>
        <extracomment>Moves the key combination to the edited row, leaving the other one without a key.</extracomment>
        <translation>Réattribuer</translation>
    </message>
    <message>
        <source>Clear the key of %1</source>
        <translation>Effacer le raccourci de %1</translation>
    </message>
    <message>
        <source>File changed on disk</source>
        <translation>Fichier modifié sur le disque</translation>
    </message>
    <message>
        <source>%1 was deleted or renamed since it was loaded.
It is written anew.</source>
        <translation>%1 a été supprimé ou renommé depuis son chargement.
Il est écrit à nouveau.</translation>
    </message>
    <message>
        <source>%1 was changed by another program since it was loaded.
Overwrite it with your edits, reload it and drop them, or cancel?</source>
        <translation>%1 a été modifié par un autre programme depuis son chargement.
L’écraser avec vos modifications, le recharger en les abandonnant, ou annuler ?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>Écraser</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Recharger</translation>
    </message>
    <message>
        <source>The window manager cannot be told to use this file.
Save it under another name.</source>
        <translation>Impossible d&apos;indiquer ce fichier au gestionnaire de fenêtres.
Enregistrez-le sous un autre nom.</translation>
    </message>
    <message>
        <source>The system hotkeys file %1 was changed by another program since it was loaded.
Overwrite %2 with your edits, reload both and drop them, or cancel?</source>
        <translation>Le fichier de raccourcis du système %1 a été modifié par un autre programme depuis son chargement.
Écraser %2 avec vos modifications, recharger les deux et abandonner vos modifications, ou annuler ?</translation>
    </message>
    <message>
        <source>Saved %1</source>
        <translation>%1 enregistré</translation>
    </message>
    <message>
        <source>The window manager was told to reload %1</source>
        <translation>Le gestionnaire de fenêtres a été prié de relire %1</translation>
    </message>
    <message>
        <source>Key of the selected action</source>
        <extracomment>Spoken by screen readers for the key recorder of the key panel.</extracomment>
        <translation>Touche de l&apos;action choisie</translation>
    </message>
    <message>
        <source>Bindings</source>
        <extracomment>Spoken by screen readers for the tree of bindings.</extracomment>
        <translation>Raccourcis</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Usage: zem-admin-hotkeys filepath - open/create file as hotkeys coll
</source>
        <translation>Utilisation : zem-admin-hotkeys fichier – ouvrir/créer le fichier de raccourcis
</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Avertissement</translation>
    </message>
    <message>
        <source>File %1 doesn&apos;t exist. Create?</source>
        <translation>Le fichier %1 n’existe pas. Le créer ?</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Attention</translation>
    </message>
    <message>
        <source>Can&apos;t open/create file:
%1</source>
        <translation>Impossible d’ouvrir/créer le fichier :
%1</translation>
    </message>
    <message>
        <source>Can&apos;t parse file:
%1</source>
        <translation>Impossible de lire le fichier :
%1</translation>
    </message>
    <message>
        <source>the file name is not valid in the locale&apos;s encoding</source>
        <translation>le nom de fichier n&apos;est pas valide dans l&apos;encodage de la locale</translation>
    </message>
    <message>
        <source>an editor already runs on this display and was brought forward; %1 was not opened there</source>
        <translation>un éditeur tourne déjà sur cet écran et a été mis au premier plan ; %1 n&apos;y a pas été ouvert</translation>
    </message>
</context>
<context>
    <name>SelectCommandDialog</name>
    <message>
        <source>Choose a program file</source>
        <translation>Choisir un fichier de programme</translation>
    </message>
    <message>
        <source>Choose an application from the menu</source>
        <translation>Choisir une application dans le menu</translation>
    </message>
    <message>
        <source>Select Command</source>
        <translation>Choisir une commande</translation>
    </message>
    <message>
        <source>Open executable</source>
        <translation>Ouvrir un exécutable</translation>
    </message>
    <message>
        <source>File doesn&apos;t exist</source>
        <translation>Le fichier n’existe pas</translation>
    </message>
    <message>
        <source>File you have selected doesn&apos;t exist. Do you want to choose another one?</source>
        <translation>Le fichier choisi n’existe pas. Voulez-vous en choisir un autre ?</translation>
    </message>
    <message>
        <source>File isn&apos;t executable</source>
        <translation>Le fichier n’est pas exécutable</translation>
    </message>
    <message>
        <source>You can&apos;t exec selected file. Do you want to choose another one?</source>
        <translation>Le fichier choisi ne peut pas être exécuté. Voulez-vous en choisir un autre ?</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Attention</translation>
    </message>
</context>
<context>
    <name>ZemHelpMenu</name>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Aide</translation>
    </message>
    <message>
        <source>About Zem hotkeys editor</source>
        <translation>À propos de l’éditeur de raccourcis Zem</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>À propos de Qt</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Zem hotkeys editor %1&lt;/h3&gt;&lt;p&gt;Edits the keyboard shortcuts of the zem-wm window manager.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Éditeur de raccourcis Zem %1&lt;/h3&gt;&lt;p&gt;Modifie les raccourcis clavier du gestionnaire de fenêtres zem-wm.&lt;/p&gt;</translation>
    </message>
</context>
<context>
    <name>ZemHotkeys</name>
    <message>
        <source>unknown option %1</source>
        <translation>option inconnue %1</translation>
    </message>
    <message>
        <source>cannot read the key &quot;%1&quot;</source>
        <translation>impossible de lire le raccourci « %1 »</translation>
    </message>
    <message>
        <source>no [ShortCutKeys] section</source>
        <translation>aucune section [ShortCutKeys]</translation>
    </message>
    <message>
        <source>%1 is no function of the window manager</source>
        <translation>%1 n’est pas une fonction du gestionnaire de fenêtres</translation>
    </message>
    <message>
        <source>%1 already does %2</source>
        <translation>%1 fait déjà %2</translation>
    </message>
    <message>
        <source>%1 is held by %2; --force takes it over</source>
        <translation>%1 est pris par %2 ; --force le reprend</translation>
    </message>
    <message>
        <source>no binding holds %1</source>
        <translation>aucun raccourci n’utilise %1</translation>
    </message>
    <message>
        <source>no X display; the window manager cannot be told</source>
        <translation>pas d’écran X ; le gestionnaire de fenêtres ne peut pas être prévenu</translation>
    </message>
    <message>
        <source>the X display refused the command</source>
        <translation>l’écran X a refusé la commande</translation>
    </message>
    <message>
        <source>--file needs a file name</source>
        <translation>--file demande un nom de fichier</translation>
    </message>
    <message>
        <source>the argument %1 is not valid in the locale&apos;s encoding</source>
        <translation>l&apos;argument %1 n&apos;est pas valide dans l&apos;encodage de la locale</translation>
    </message>
</context>
<context>
    <name>ZemMenuDialog</name>
    <message>
        <source>Multimedia</source>
        <translation>Multimédia</translation>
    </message>
    <message>
        <source>Development</source>
        <translation>Développement</translation>
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
        <source>Internet</source>
        <translation>Internet</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>Bureautique</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>Science</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Paramètres</translation>
    </message>
    <message>
        <source>System</source>
        <translation>Système</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Accessoires</translation>
    </message>
    <message>
        <source>Other</source>
        <translation>Autres</translation>
    </message>
    <message>
        <source>Choose an application</source>
        <translation>Choisir une application</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtrer</translation>
    </message>
    <message>
        <source>No installed applications were found. Applications appear here when their desktop entries are installed in an applications directory.</source>
        <translation>Aucune application installée n’a été trouvée. Les applications apparaissent ici lorsque leurs fichiers .desktop sont installés dans un répertoire applications.</translation>
    </message>
</context>
<context>
    <name>commandDialog</name>
    <message>
        <source>Command:</source>
        <translation>Commande :</translation>
    </message>
    <message>
        <source>...</source>
        <translation>…</translation>
    </message>
</context>
</TS>

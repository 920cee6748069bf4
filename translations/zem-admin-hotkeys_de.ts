<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE">
<context>
    <name>EditedFile</name>
    <message>
        <source>No file name</source>
        <translation>Kein Dateiname</translation>
    </message>
</context>
<context>
    <name>FilterBar</name>
    <message>
        <source>Filter by action, function, command or key</source>
        <translation>Nach Aktion, Funktion, Befehl oder Kürzel filtern</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filter</translation>
    </message>
    <message>
        <source>Press a key combination to find what it does</source>
        <translation>Eine Tastenkombination drücken, um zu sehen, was sie tut</translation>
    </message>
    <message>
        <source>Find key</source>
        <translation>Kürzel suchen</translation>
    </message>
    <message numerus="yes">
        <source>%1 of %n bindings</source>
        <extracomment>Shown while a filter is active, for example &quot;3 of 186 bindings&quot;.</extracomment>
        <translation>
            <numerusform>%1 von %n Kürzel</numerusform>
            <numerusform>%1 von %n Kürzeln</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 is disabled</source>
        <translation>%1 ist abgeschaltet</translation>
    </message>
    <message>
        <source>%1 is free</source>
        <translation>%1 ist frei</translation>
    </message>
    <message>
        <source>%1 is taken from the system file</source>
        <translation>%1 stammt aus der Systemdatei</translation>
    </message>
</context>
<context>
    <name>Handbook</name>
    <message>
        <source>Zem hotkeys editor Handbook</source>
        <translation>Handbuch des Zem-Tastenkürzel-Editors</translation>
    </message>
    <message>
        <source>&lt;h2&gt;Zem hotkeys editor&lt;/h2&gt;&lt;p&gt;The editor shows every function of the zem-wm window manager in its group, and below &lt;i&gt;Command Keybindings&lt;/i&gt; the command lines of your own, each with its key. &lt;b&gt;Current Key&lt;/b&gt; is the key combination that starts it; &lt;b&gt;Source&lt;/b&gt; says whether the binding comes from your own hotkeys file (&lt;i&gt;user&lt;/i&gt;) or from the system-wide one (&lt;i&gt;system&lt;/i&gt;), which gives every user&apos;s defaults.&lt;/p&gt;</source>
        <translation>&lt;h2&gt;Zem-Tastenkürzel-Editor&lt;/h2&gt;&lt;p&gt;Der Editor zeigt jede Funktion des Fenstermanagers zem-wm in ihrer Gruppe und unter &lt;i&gt;Befehlskürzel&lt;/i&gt; Ihre eigenen Befehlszeilen, jede mit ihrem Kürzel. &lt;b&gt;Aktuelles Kürzel&lt;/b&gt; ist die Tastenkombination, die sie auslöst; &lt;b&gt;Herkunft&lt;/b&gt; sagt, ob die Belegung aus Ihrer eigenen Tastenkürzeldatei (&lt;i&gt;Benutzer&lt;/i&gt;) stammt oder aus der des Systems (&lt;i&gt;System&lt;/i&gt;), die allen Benutzern die Voreinstellungen gibt.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Finding&lt;/h3&gt;&lt;p&gt;Type into the field above the tree (Ctrl+F) to see only the rows whose action, function, command or key holds the text; a key may be typed as Ctrl+Alt+T or Ctrl|Alt|t. &lt;b&gt;Find key&lt;/b&gt; records a combination and shows who holds it, or says that it is free.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Suchen&lt;/h3&gt;&lt;p&gt;Tippen Sie in das Feld über der Liste (Strg+F), um nur die Zeilen zu sehen, deren Aktion, Funktion, Befehl oder Kürzel den Text enthält; ein Kürzel kann als Strg+Alt+T oder Ctrl|Alt|t geschrieben werden. &lt;b&gt;Kürzel suchen&lt;/b&gt; nimmt eine Kombination auf und zeigt, wem sie gehört, oder sagt, dass sie frei ist.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Commands&lt;/h3&gt;&lt;p&gt;&lt;b&gt;New action&lt;/b&gt; adds a command line of your own: type it, choose a program file with the first button beside the field, or an installed application with the second. &lt;b&gt;Clone&lt;/b&gt; gives a function or a command a further row for another key; &lt;b&gt;Edit&lt;/b&gt; and &lt;b&gt;Delete&lt;/b&gt; change or remove a command.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Befehle&lt;/h3&gt;&lt;p&gt;&lt;b&gt;Neue Aktion&lt;/b&gt; fügt eine eigene Befehlszeile hinzu: Tippen Sie sie ein, wählen Sie mit dem ersten Knopf neben dem Feld eine Programmdatei oder mit dem zweiten eine installierte Anwendung. &lt;b&gt;Duplizieren&lt;/b&gt; gibt einer Funktion oder einem Befehl eine weitere Zeile für ein weiteres Kürzel; &lt;b&gt;Bearbeiten&lt;/b&gt; und &lt;b&gt;Löschen&lt;/b&gt; ändern oder entfernen einen Befehl.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Files&lt;/h3&gt;&lt;p&gt;Your hotkeys file is keyshortcutrc in ~/.config/zem (or $XDG_CONFIG_HOME/zem); the system one is in the zem directory of the system configuration, /etc/zem for most installations. The window size and layout are kept in ~/.config/zem/zem-admin-hotkeys.conf. The command &lt;tt&gt;zem-hotkeys&lt;/tt&gt; lists, checks and changes the same files from a shell.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Dateien&lt;/h3&gt;&lt;p&gt;Ihre Tastenkürzeldatei ist keyshortcutrc in ~/.config/zem (oder $XDG_CONFIG_HOME/zem); die des Systems liegt im Verzeichnis zem der Systemkonfiguration, bei den meisten Installationen /etc/zem. Fenstergröße und Anordnung stehen in ~/.config/zem/zem-admin-hotkeys.conf. Der Befehl &lt;tt&gt;zem-hotkeys&lt;/tt&gt; listet, prüft und ändert dieselben Dateien in einer Shell.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Keys&lt;/h3&gt;&lt;p&gt;Select a row and click &lt;b&gt;Assign Key:&lt;/b&gt;, then press the combination. A combination that another row holds is refused; &lt;b&gt;Reassign&lt;/b&gt; in that message moves it to your row and leaves the other without a key. &lt;b&gt;Clear Key&lt;/b&gt; takes the key away. A system key you clear or change is written into your file as &lt;i&gt;Disable&lt;/i&gt;, which switches the system binding of that key off. &lt;b&gt;Revert to System Binding&lt;/b&gt; in the Edit menu gives a function or a command back what the system file gives it, and a key that Reassign took goes back to the row it came from. Every edit can be undone and redone (Ctrl+Z, Ctrl+Shift+Z), wherever the focus is.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Kürzel&lt;/h3&gt;&lt;p&gt;Wählen Sie eine Zeile, klicken Sie auf &lt;b&gt;Kürzel zuweisen:&lt;/b&gt; und drücken Sie die Kombination. Eine Kombination, die eine andere Zeile hat, wird abgelehnt; &lt;b&gt;Neu zuweisen&lt;/b&gt; in dieser Meldung gibt sie Ihrer Zeile und lässt die andere ohne Kürzel. &lt;b&gt;Kürzel entfernen&lt;/b&gt; nimmt das Kürzel weg. Ein Systemkürzel, das Sie entfernen oder ändern, wird als &lt;i&gt;Disable&lt;/i&gt; in Ihre Datei geschrieben, was die Systembelegung dieses Kürzels abschaltet. &lt;b&gt;Systemkürzel wiederherstellen&lt;/b&gt; im Menü Bearbeiten gibt einer Funktion oder einem Befehl zurück, was ihnen die Systemdatei gibt, und ein Kürzel, das Neu zuweisen genommen hat, geht an seine Zeile zurück. Jede Änderung lässt sich rückgängig machen und wiederholen (Strg+Z, Strg+Umschalt+Z), wo auch immer der Fokus steht.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Save and Apply&lt;/h3&gt;&lt;p&gt;&lt;b&gt;Save&lt;/b&gt; (Ctrl+S) writes your hotkeys file; only the lines of the keys you edited change, and a file that cannot be written whole is left untouched. &lt;b&gt;Apply&lt;/b&gt; (Ctrl+Return) saves and tells the running window manager to read the file again; a file saved but not yet applied can still be applied. When another program changed the file since it was loaded, you are asked before it is overwritten. &lt;b&gt;Restore&lt;/b&gt; replaces your file with the system one and keeps the old one beside it as keyshortcutrc~.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Speichern und Anwenden&lt;/h3&gt;&lt;p&gt;&lt;b&gt;Speichern&lt;/b&gt; (Strg+S) schreibt Ihre Tastenkürzeldatei; nur die Zeilen der Kürzel, die Sie geändert haben, ändern sich, und eine Datei, die sich nicht ganz schreiben lässt, bleibt unberührt. &lt;b&gt;Anwenden&lt;/b&gt; (Strg+Eingabe) speichert und weist den laufenden Fenstermanager an, die Datei neu zu lesen; eine gespeicherte, noch nicht angewandte Datei lässt sich weiterhin anwenden. Hat ein anderes Programm die Datei seit dem Laden geändert, werden Sie gefragt, bevor sie überschrieben wird. &lt;b&gt;Wiederherstellen&lt;/b&gt; ersetzt Ihre Datei durch die des Systems und behält die alte daneben als keyshortcutrc~.&lt;/p&gt;</translation>
    </message>
</context>
<context>
    <name>HotkeysCheck</name>
    <message>
        <source>no [ShortCutKeys] section</source>
        <translation>kein Abschnitt [ShortCutKeys]</translation>
    </message>
    <message>
        <source>the key %1 cannot be read</source>
        <translation>das Kürzel %1 ist nicht lesbar</translation>
    </message>
    <message>
        <source>the key %1 does not count: line %2 binds the same key</source>
        <translation>die Taste %1 zählt nicht: Zeile %2 belegt dieselbe Taste</translation>
    </message>
    <message>
        <source>%1 is no function of the window manager</source>
        <translation>%1 ist keine Funktion des Fenstermanagers</translation>
    </message>
    <message>
        <source>the program of &quot;%1&quot; is not installed</source>
        <translation>das Programm von „%1“ ist nicht installiert</translation>
    </message>
    <message>
        <source>the key %1 alone takes a character from typing</source>
        <translation>das Kürzel %1 allein nimmt dem Tippen ein Zeichen weg</translation>
    </message>
</context>
<context>
    <name>HotkeysFile</name>
    <message>
        <source>No file name</source>
        <translation>Kein Dateiname</translation>
    </message>
    <message>
        <source>Not a regular file</source>
        <translation>Keine reguläre Datei</translation>
    </message>
    <message>
        <source>The file is larger than 16 MiB</source>
        <translation>Die Datei ist größer als 16 MiB</translation>
    </message>
    <message>
        <source>The file holds NUL bytes</source>
        <translation>Die Datei enthält NUL-Bytes</translation>
    </message>
    <message>
        <source>The key &quot;%1&quot; cannot be written to a hotkeys file</source>
        <translation>Das Kürzel „%1“ kann nicht in eine Tastenkürzeldatei geschrieben werden</translation>
    </message>
    <message>
        <source>The action &quot;%1&quot; cannot be written to a hotkeys file</source>
        <translation>Die Aktion „%1“ kann nicht in eine Tastenkürzeldatei geschrieben werden</translation>
    </message>
    <message>
        <source>No [ShortCutKeys] section</source>
        <translation>Kein Abschnitt [ShortCutKeys]</translation>
    </message>
    <message>
        <source>The command is empty</source>
        <translation>Der Befehl ist leer</translation>
    </message>
    <message>
        <source>The command holds the control character %1, which a hotkeys file cannot hold</source>
        <translation>Der Befehl enthält das Steuerzeichen %1, das eine Tastenkürzeldatei nicht aufnehmen kann</translation>
    </message>
    <message>
        <source>The file name holds control characters</source>
        <translation>Der Dateiname enthält Steuerzeichen</translation>
    </message>
    <message>
        <source>The file name cannot be written in the locale&apos;s encoding</source>
        <translation>Der Dateiname lässt sich in der Kodierung der Sprachumgebung nicht schreiben</translation>
    </message>
    <message>
        <source>The file name is too long to be handed to the window manager</source>
        <translation>Der Dateiname ist zu lang, um ihn an den Fenstermanager zu übergeben</translation>
    </message>
    <message>
        <source>%1 is a symbolic link of another account</source>
        <translation>%1 ist eine symbolische Verknüpfung eines anderen Kontos</translation>
    </message>
    <message>
        <source>%1 is read-only: its owner&apos;s write permission is off</source>
        <translation>%1 ist schreibgeschützt: Der Besitzer hat kein Schreibrecht</translation>
    </message>
    <message>
        <source>%1 belongs to another account</source>
        <translation>%1 gehört einem anderen Konto</translation>
    </message>
    <message>
        <source>%1 has %2 hard links; replacing it would part it from the others</source>
        <translation>%1 hat %2 harte Verknüpfungen; sie zu ersetzen, würde sie von den anderen trennen</translation>
    </message>
    <message>
        <source>The file would be larger than 16 MiB</source>
        <translation>Die Datei wäre größer als 16 MiB</translation>
    </message>
    <message>
        <source>Another program is writing a hotkeys file in %1; gave up waiting after %2 seconds</source>
        <translation>Ein anderes Programm schreibt eine Tastenkürzeldatei in %1; nach %2 Sekunden Warten aufgegeben</translation>
    </message>
</context>
<context>
    <name>KKeySequenceButton</name>
    <message>
        <source>Unsupported Key</source>
        <translation>Nicht unterstützte Taste</translation>
    </message>
    <message>
        <source>The key you just pressed is not supported by Qt.</source>
        <translation>Die eben gedrückte Taste wird von Qt nicht unterstützt.</translation>
    </message>
    <message>
        <source>Clear the key</source>
        <translation>Kürzel entfernen</translation>
    </message>
</context>
<context>
    <name>KKeySequenceWidgetPrivate</name>
    <message>
        <source>Input</source>
        <translation>Eingabe</translation>
    </message>
    <message>
        <source>None</source>
        <translation>Keins</translation>
    </message>
</context>
<context>
    <name>KeysConfForm</name>
    <message>
        <source>Window decoration (on/off)</source>
        <translation>Fensterdekoration (ein/aus)</translation>
    </message>
    <message>
        <source>toggle switch of a border</source>
        <translation>Rahmen ein-/ausschalten</translation>
    </message>
    <message>
        <source>toggle switch of a border edge</source>
        <translation>Rahmenkante ein-/ausschalten</translation>
    </message>
    <message>
        <source>toggle switch of a minimize button</source>
        <translation>Minimieren-Knopf ein-/ausschalten</translation>
    </message>
    <message>
        <source>toggle switch of a restore button</source>
        <translation>Wiederherstellen-Knopf ein-/ausschalten</translation>
    </message>
    <message>
        <source>toggle switch of a close button</source>
        <translation>Schließen-Knopf ein-/ausschalten</translation>
    </message>
    <message>
        <source>toggle switch of a control button</source>
        <translation>Steuerknopf ein-/ausschalten</translation>
    </message>
    <message>
        <source>toggle switch of a taskbar button</source>
        <translation>Taskleistenknopf ein-/ausschalten</translation>
    </message>
    <message>
        <source>toggle switch of a title bar</source>
        <translation>Titelleiste ein-/ausschalten</translation>
    </message>
    <message>
        <source>toggle switch of all decorations</source>
        <translation>Alle Dekorationen ein-/ausschalten</translation>
    </message>
    <message>
        <source>Taskbar</source>
        <translation>Taskleiste</translation>
    </message>
    <message>
        <source>move the taskbar to bottom</source>
        <translation>Taskleiste nach unten verschieben</translation>
    </message>
    <message>
        <source>move the taskbar to top</source>
        <translation>Taskleiste nach oben verschieben</translation>
    </message>
    <message>
        <source>move the taskbar to left</source>
        <translation>Taskleiste nach links verschieben</translation>
    </message>
    <message>
        <source>move the taskbar to right</source>
        <translation>Taskleiste nach rechts verschieben</translation>
    </message>
    <message>
        <source>toggle switch of TaskbarAutoHide</source>
        <translation>Automatisches Ausblenden der Taskleiste ein-/ausschalten</translation>
    </message>
    <message>
        <source>enable TaskbarAutoHide</source>
        <translation>Automatisches Ausblenden der Taskleiste einschalten</translation>
    </message>
    <message>
        <source>disable TaskbarAutoHide</source>
        <translation>Automatisches Ausblenden der Taskleiste ausschalten</translation>
    </message>
    <message>
        <source>toggle switch of the taskbar show/hide</source>
        <translation>Taskleiste zeigen/verbergen</translation>
    </message>
    <message>
        <source>show the taskbar</source>
        <translation>Taskleiste zeigen</translation>
    </message>
    <message>
        <source>hide the taskbar</source>
        <translation>Taskleiste verbergen</translation>
    </message>
    <message>
        <source>appear the taskbar when TaskbarAutoHide</source>
        <translation>Automatisch ausgeblendete Taskleiste erscheinen lassen</translation>
    </message>
    <message>
        <source>disappear the taskbar when TaskbarAutoHide</source>
        <translation>Automatisch ausgeblendete Taskleiste verschwinden lassen</translation>
    </message>
    <message>
        <source>toggle switch of the taskbar top/botton</source>
        <translation>Taskleiste zuoberst/zuunterst umschalten</translation>
    </message>
    <message>
        <source>taskbar on top of all</source>
        <translation>Taskleiste über allem</translation>
    </message>
    <message>
        <source>taskbar on bottom of all</source>
        <translation>Taskleiste unter allem</translation>
    </message>
    <message>
        <source>Desktop Icon</source>
        <translation>Arbeitsflächensymbole</translation>
    </message>
    <message>
        <source>line up icons</source>
        <translation>Symbole ausrichten</translation>
    </message>
    <message>
        <source>order icons</source>
        <translation>Symbole ordnen</translation>
    </message>
    <message>
        <source>select all icons</source>
        <translation>Alle Symbole auswählen</translation>
    </message>
    <message>
        <source>find icons</source>
        <translation>Symbole suchen</translation>
    </message>
    <message>
        <source>execute the icon</source>
        <translation>Symbol ausführen</translation>
    </message>
    <message>
        <source>execute the icon with</source>
        <translation>Symbol ausführen mit</translation>
    </message>
    <message>
        <source>send the icon by email</source>
        <translation>Symbol per E-Mail senden</translation>
    </message>
    <message>
        <source>delete the icon</source>
        <translation>Symbol löschen</translation>
    </message>
    <message>
        <source>show icon properties</source>
        <translation>Symboleigenschaften zeigen</translation>
    </message>
    <message>
        <source>create an icon</source>
        <translation>Symbol anlegen</translation>
    </message>
    <message>
        <source>create a text file</source>
        <translation>Textdatei anlegen</translation>
    </message>
    <message>
        <source>create a session script file</source>
        <translation>Sitzungsskript anlegen</translation>
    </message>
    <message>
        <source>cretae a folder</source>
        <translation>Ordner anlegen</translation>
    </message>
    <message>
        <source>send icon to home folder</source>
        <translation>Symbol in den persönlichen Ordner senden</translation>
    </message>
    <message>
        <source>send icon to My documents folder</source>
        <translation>Symbol in den Ordner „Meine Dokumente“ senden</translation>
    </message>
    <message>
        <source>send icon trash can</source>
        <translation>Symbol in den Papierkorb senden</translation>
    </message>
    <message>
        <source>send icon start menu</source>
        <translation>Symbol ins Startmenü senden</translation>
    </message>
    <message>
        <source>send icon to toolbar</source>
        <translation>Symbol in die Werkzeugleiste senden</translation>
    </message>
    <message>
        <source>send icon to folder</source>
        <translation>Symbol in einen Ordner senden</translation>
    </message>
    <message>
        <source>cut icon(s)</source>
        <translation>Symbol(e) ausschneiden</translation>
    </message>
    <message>
        <source>copy icon(s)</source>
        <translation>Symbol(e) kopieren</translation>
    </message>
    <message>
        <source>paste icon(s)</source>
        <translation>Symbol(e) einfügen</translation>
    </message>
    <message>
        <source>navigate up</source>
        <translation>nach oben gehen</translation>
    </message>
    <message>
        <source>navigate down</source>
        <translation>nach unten gehen</translation>
    </message>
    <message>
        <source>navigate left</source>
        <translation>nach links gehen</translation>
    </message>
    <message>
        <source>navigate right</source>
        <translation>nach rechts gehen</translation>
    </message>
    <message>
        <source>rename icon</source>
        <translation>Symbol umbenennen</translation>
    </message>
    <message>
        <source>undo last operation on desktop</source>
        <translation>Letzten Vorgang auf der Arbeitsfläche rückgängig machen</translation>
    </message>
    <message>
        <source>Keyboard</source>
        <translation>Tastatur</translation>
    </message>
    <message>
        <source>switch to base keyboard</source>
        <translation>zur Grundbelegung wechseln</translation>
    </message>
    <message>
        <source>switch to alt keyboard</source>
        <translation>zur Zweitbelegung wechseln</translation>
    </message>
    <message>
        <source>switch keyboard</source>
        <translation>Tastaturbelegung wechseln</translation>
    </message>
    <message>
        <source>Pager</source>
        <translation>Arbeitsflächenumschalter</translation>
    </message>
    <message>
        <source>toggle switch of the pager show/hide</source>
        <translation>Arbeitsflächenumschalter zeigen/verbergen</translation>
    </message>
    <message>
        <source>show the pager</source>
        <translation>Arbeitsflächenumschalter zeigen</translation>
    </message>
    <message>
        <source>hide the pager</source>
        <translation>Arbeitsflächenumschalter verbergen</translation>
    </message>
    <message>
        <source>toggle switch of the pager top/botton</source>
        <translation>Arbeitsflächenumschalter zuoberst/zuunterst umschalten</translation>
    </message>
    <message>
        <source>pager on top of all</source>
        <translation>Arbeitsflächenumschalter über allem</translation>
    </message>
    <message>
        <source>pager on botton of all</source>
        <translation>Arbeitsflächenumschalter unter allem</translation>
    </message>
    <message>
        <source>add row to the pager</source>
        <translation>Zeile zum Arbeitsflächenumschalter hinzufügen</translation>
    </message>
    <message>
        <source>remove row from the pager</source>
        <translation>Zeile aus dem Arbeitsflächenumschalter entfernen</translation>
    </message>
    <message>
        <source>add column to the pager</source>
        <translation>Spalte zum Arbeitsflächenumschalter hinzufügen</translation>
    </message>
    <message>
        <source>remove column from the pager</source>
        <translation>Spalte aus dem Arbeitsflächenumschalter entfernen</translation>
    </message>
    <message>
        <source>update the pager</source>
        <translation>Arbeitsflächenumschalter aktualisieren</translation>
    </message>
    <message>
        <source>maximize the pager (fullscreen)</source>
        <translation>Arbeitsflächenumschalter maximieren (Vollbild)</translation>
    </message>
    <message>
        <source>restore the pager (small window)</source>
        <translation>Arbeitsflächenumschalter wiederherstellen (kleines Fenster)</translation>
    </message>
    <message>
        <source>toggle pager fullscreen mode</source>
        <translation>Vollbildmodus des Arbeitsflächenumschalters umschalten</translation>
    </message>
    <message>
        <source>Paging</source>
        <translation>Seitenwechsel</translation>
    </message>
    <message>
        <source>switch to the left page</source>
        <translation>zur linken Seite wechseln</translation>
    </message>
    <message>
        <source>switch to the right page</source>
        <translation>zur rechten Seite wechseln</translation>
    </message>
    <message>
        <source>switch to the up page</source>
        <translation>zur oberen Seite wechseln</translation>
    </message>
    <message>
        <source>switch to the down page</source>
        <translation>zur unteren Seite wechseln</translation>
    </message>
    <message>
        <source>Search panel</source>
        <translation>Suchleiste</translation>
    </message>
    <message>
        <source>toggle search panel</source>
        <translation>Suchleiste ein-/ausblenden</translation>
    </message>
    <message>
        <source>Menu</source>
        <translation>Menü</translation>
    </message>
    <message>
        <source>pop up the start menu</source>
        <translation>Startmenü öffnen</translation>
    </message>
    <message>
        <source>pop up the desktop menu</source>
        <translation>Arbeitsflächenmenü öffnen</translation>
    </message>
    <message>
        <source>pop up a window ctrl menu</source>
        <translation>Fenstermenü öffnen</translation>
    </message>
    <message>
        <source>pop down a menu</source>
        <translation>Menü schließen</translation>
    </message>
    <message>
        <source>pop down all menus</source>
        <translation>Alle Menüs schließen</translation>
    </message>
    <message>
        <source>Rearrangement</source>
        <translation>Anordnung</translation>
    </message>
    <message>
        <source>overlap all windows</source>
        <translation>Alle Fenster überlappend anordnen</translation>
    </message>
    <message>
        <source>overlap windows within the screen</source>
        <translation>Fenster des Bildschirms überlappend anordnen</translation>
    </message>
    <message>
        <source>horizontally tile all windows</source>
        <translation>Alle Fenster nebeneinander anordnen</translation>
    </message>
    <message>
        <source>horizontally tile windows within the screen</source>
        <translation>Fenster des Bildschirms nebeneinander anordnen</translation>
    </message>
    <message>
        <source>vertically tile all windows</source>
        <translation>Alle Fenster untereinander anordnen</translation>
    </message>
    <message>
        <source>vertically tile windows within the screen</source>
        <translation>Fenster des Bildschirms untereinander anordnen</translation>
    </message>
    <message>
        <source>tile all windows in matrix</source>
        <translation>Alle Fenster als Raster anordnen</translation>
    </message>
    <message>
        <source>tile windows in matrix within the screen</source>
        <translation>Fenster des Bildschirms als Raster anordnen</translation>
    </message>
    <message>
        <source>minimize all windows</source>
        <translation>Alle Fenster minimieren</translation>
    </message>
    <message>
        <source>minimize windows within the screen</source>
        <translation>Fenster des Bildschirms minimieren</translation>
    </message>
    <message>
        <source>minimize/restore all windows</source>
        <translation>Alle Fenster minimieren/wiederherstellen</translation>
    </message>
    <message>
        <source>minimize/restore windows within the screen</source>
        <translation>Fenster des Bildschirms minimieren/wiederherstellen</translation>
    </message>
    <message>
        <source>restore all windows</source>
        <translation>Alle Fenster wiederherstellen</translation>
    </message>
    <message>
        <source>restore windows within the screen</source>
        <translation>Fenster des Bildschirms wiederherstellen</translation>
    </message>
    <message>
        <source>close all windows</source>
        <translation>Alle Fenster schließen</translation>
    </message>
    <message>
        <source>close windows within the screen</source>
        <translation>Fenster des Bildschirms schließen</translation>
    </message>
    <message>
        <source>Window placement</source>
        <translation>Fensterplatzierung</translation>
    </message>
    <message>
        <source>move a window</source>
        <translation>Fenster verschieben</translation>
    </message>
    <message>
        <source>move a window to the next screen</source>
        <translation>Fenster auf den nächsten Bildschirm verschieben</translation>
    </message>
    <message>
        <source>move a window to the previous screen</source>
        <translation>Fenster auf den vorigen Bildschirm verschieben</translation>
    </message>
    <message>
        <source>resize a window</source>
        <translation>Fenstergröße ändern</translation>
    </message>
    <message>
        <source>minimize a window</source>
        <translation>Fenster minimieren</translation>
    </message>
    <message>
        <source>restore a window size</source>
        <translation>Fenstergröße wiederherstellen</translation>
    </message>
    <message>
        <source>maximize a window</source>
        <translation>Fenster maximieren</translation>
    </message>
    <message>
        <source>maximize/restore a window</source>
        <translation>Fenster maximieren/wiederherstellen</translation>
    </message>
    <message>
        <source>fullscreen/restore a window</source>
        <translation>Fenster im Vollbild/wiederherstellen</translation>
    </message>
    <message>
        <source>swallow to tray</source>
        <translation>in den Infobereich einklappen</translation>
    </message>
    <message>
        <source>move taskbar btn left(up)</source>
        <translation>Taskleistenknopf nach links (oben) verschieben</translation>
    </message>
    <message>
        <source>move taskbar btn right(down)</source>
        <translation>Taskleistenknopf nach rechts (unten) verschieben</translation>
    </message>
    <message>
        <source>expand a window to all directions</source>
        <translation>Fenster in alle Richtungen ausdehnen</translation>
    </message>
    <message>
        <source>expand a window to a left direction</source>
        <translation>Fenster nach links ausdehnen</translation>
    </message>
    <message>
        <source>expand a window to a right direction</source>
        <translation>Fenster nach rechts ausdehnen</translation>
    </message>
    <message>
        <source>expand a window to an up direction</source>
        <translation>Fenster nach oben ausdehnen</translation>
    </message>
    <message>
        <source>expand a window to a down direction</source>
        <translation>Fenster nach unten ausdehnen</translation>
    </message>
    <message>
        <source>snap a window to a right edge</source>
        <translation>Fenster an den rechten Rand heften</translation>
    </message>
    <message>
        <source>snap a window to a left edge</source>
        <translation>Fenster an den linken Rand heften</translation>
    </message>
    <message>
        <source>snap a window to a bottom right corner</source>
        <translation>Fenster in die Ecke unten rechts heften</translation>
    </message>
    <message>
        <source>snap a window to a botton left corner</source>
        <translation>Fenster in die Ecke unten links heften</translation>
    </message>
    <message>
        <source>snap a window to a top right corner</source>
        <translation>Fenster in die Ecke oben rechts heften</translation>
    </message>
    <message>
        <source>snap a window to a top left corner</source>
        <translation>Fenster in die Ecke oben links heften</translation>
    </message>
    <message>
        <source>snap a window to a top edge</source>
        <translation>Fenster an den oberen Rand heften</translation>
    </message>
    <message>
        <source>snap a window to a bottom edge</source>
        <translation>Fenster an den unteren Rand heften</translation>
    </message>
    <message>
        <source>raise a window</source>
        <translation>Fenster nach vorn holen</translation>
    </message>
    <message>
        <source>lower a window</source>
        <translation>Fenster nach hinten stellen</translation>
    </message>
    <message>
        <source>close a window (recommend)</source>
        <translation>Fenster schließen (empfohlen)</translation>
    </message>
    <message>
        <source>close all similar window</source>
        <translation>Alle gleichartigen Fenster schließen</translation>
    </message>
    <message>
        <source>close a window forcely</source>
        <translation>Fenster gewaltsam schließen</translation>
    </message>
    <message>
        <source>toggle switch of an ONTOP attribute</source>
        <translation>Eigenschaft „Immer oben“ ein-/ausschalten</translation>
    </message>
    <message>
        <source>toggle switch of an ONBOTTOM attribute</source>
        <translation>Eigenschaft „Immer unten“ ein-/ausschalten</translation>
    </message>
    <message>
        <source>toggle switch of a STICKY attribute</source>
        <translation>Eigenschaft „Auf allen Arbeitsflächen“ ein-/ausschalten</translation>
    </message>
    <message>
        <source>toggle switch of a focus attribute</source>
        <translation>Eigenschaft „Fokus“ ein-/ausschalten</translation>
    </message>
    <message>
        <source>Window focus</source>
        <translation>Fensterfokus</translation>
    </message>
    <message>
        <source>switch an active window</source>
        <translation>Aktives Fenster wechseln</translation>
    </message>
    <message>
        <source>switch back an active window</source>
        <translation>Aktives Fenster zurückwechseln</translation>
    </message>
    <message>
        <source>change an active window</source>
        <translation>Aktives Fenster ändern</translation>
    </message>
    <message>
        <source>change back an active window</source>
        <translation>Aktives Fenster zurück ändern</translation>
    </message>
    <message>
        <source>change an active window within a screen</source>
        <translation>Aktives Fenster des Bildschirms ändern</translation>
    </message>
    <message>
        <source>change back an active window in a screen</source>
        <translation>Aktives Fenster des Bildschirms zurück ändern</translation>
    </message>
    <message>
        <source>make the desktop active</source>
        <translation>Arbeitsfläche aktivieren</translation>
    </message>
    <message>
        <source>Window Manager</source>
        <translation>Fenstermanager</translation>
    </message>
    <message>
        <source>restart zem-wm</source>
        <translation>zem-wm neu starten</translation>
    </message>
    <message>
        <source>lock screen</source>
        <translation>Bildschirm sperren</translation>
    </message>
    <message>
        <source>standby</source>
        <translation>Bereitschaft</translation>
    </message>
    <message>
        <source>suspend</source>
        <translation>Ruhezustand (Arbeitsspeicher)</translation>
    </message>
    <message>
        <source>hibernate</source>
        <translation>Ruhezustand (Festplatte)</translation>
    </message>
    <message>
        <source>change user</source>
        <translation>Benutzer wechseln</translation>
    </message>
    <message>
        <source>change/switch user</source>
        <translation>Benutzer wechseln/umschalten</translation>
    </message>
    <message>
        <source>postpone session</source>
        <translation>Sitzung zurückstellen</translation>
    </message>
    <message>
        <source>suspend screensaver</source>
        <translation>Bildschirmschoner aussetzen</translation>
    </message>
    <message>
        <source>resume screensaver</source>
        <translation>Bildschirmschoner fortsetzen</translation>
    </message>
    <message>
        <source>exit zem-wm</source>
        <translation>zem-wm beenden</translation>
    </message>
    <message>
        <source>reboot</source>
        <translation>Neu starten</translation>
    </message>
    <message>
        <source>shutdown</source>
        <translation>Ausschalten</translation>
    </message>
    <message>
        <source>dpms on</source>
        <translation>Energiesparen des Bildschirms ein</translation>
    </message>
    <message>
        <source>dpms off</source>
        <translation>Energiesparen des Bildschirms aus</translation>
    </message>
    <message>
        <source>dpms toggle</source>
        <translation>Energiesparen des Bildschirms umschalten</translation>
    </message>
    <message>
        <source>previous wallpaper</source>
        <translation>Vorheriges Hintergrundbild</translation>
    </message>
    <message>
        <source>next wallpaper</source>
        <translation>Nächstes Hintergrundbild</translation>
    </message>
    <message>
        <source>Command Keybindings</source>
        <extracomment>The group row under which the user&apos;s command entries are listed.</extracomment>
        <translation>Befehlskürzel</translation>
    </message>
    <message>
        <source>Zem hotkeys editor</source>
        <translation>Zem-Tastenkürzel-Editor</translation>
    </message>
    <message>
        <source>user</source>
        <translation>Benutzer</translation>
    </message>
    <message>
        <source>system</source>
        <translation>System</translation>
    </message>
    <message>
        <source>Action</source>
        <translation>Aktion</translation>
    </message>
    <message>
        <source>Current Key</source>
        <translation>Aktuelles Kürzel</translation>
    </message>
    <message>
        <source>zem-wm function</source>
        <translation>zem-wm-Funktion</translation>
    </message>
    <message>
        <source>Source</source>
        <translation>Herkunft</translation>
    </message>
    <message>
        <source>Choose a Key for the Selected Action</source>
        <extracomment>The title of the key panel below the tree.</extracomment>
        <translation>Kürzel für die gewählte Aktion</translation>
    </message>
    <message>
        <source>Assign Key:</source>
        <translation>Kürzel zuweisen:</translation>
    </message>
    <message>
        <source>Clear Key</source>
        <translation>Kürzel entfernen</translation>
    </message>
    <message>
        <source>&amp;New file</source>
        <translation>&amp;Neue Datei</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>Ö&amp;ffnen …</translation>
    </message>
    <message>
        <source>&amp;Restore...</source>
        <translation>&amp;Wiederherstellen …</translation>
    </message>
    <message>
        <source>Restore user&apos;s keyshortcutrc file from system one</source>
        <translation>Die keyshortcutrc des Benutzers aus der des Systems wiederherstellen</translation>
    </message>
    <message>
        <source>&amp;Save</source>
        <translation>&amp;Speichern</translation>
    </message>
    <message>
        <source>Save &amp;As...</source>
        <translation>Speichern &amp;unter …</translation>
    </message>
    <message>
        <source>E&amp;xit</source>
        <translation>&amp;Beenden</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Anwenden</translation>
    </message>
    <message>
        <source>&amp;New action</source>
        <translation>Neue &amp;Aktion</translation>
    </message>
    <message>
        <source>&amp;Clone</source>
        <translation>&amp;Duplizieren</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Bearbeiten</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Löschen</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Datei</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Rückgängig</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Wiederholen</translation>
    </message>
    <message>
        <source>Revert to System Binding</source>
        <translation>Systemkürzel wiederherstellen</translation>
    </message>
    <message>
        <source>Handbook</source>
        <translation>Handbuch</translation>
    </message>
    <message>
        <source>Actions toolbar</source>
        <translation>Aktionsleiste</translation>
    </message>
    <message>
        <source>Add command %1</source>
        <translation>Befehl %1 hinzufügen</translation>
    </message>
    <message>
        <source>Edit command %1</source>
        <translation>Befehl %1 bearbeiten</translation>
    </message>
    <message>
        <source>Clone %1</source>
        <translation>%1 duplizieren</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Are you sure to delete this action?</source>
        <translation>Diese Aktion wirklich löschen?</translation>
    </message>
    <message>
        <source>Delete %1</source>
        <translation>%1 löschen</translation>
    </message>
    <message>
        <source>Revert %1 to the system binding</source>
        <translation>Systemkürzel für %1 wiederherstellen</translation>
    </message>
    <message numerus="yes">
        <source>%1 stays with the row that holds it now.</source>
        <translation>
            <numerusform>%1 bleibt bei der Zeile, die es jetzt hat.</numerusform>
            <numerusform>%1 bleiben bei den Zeilen, die sie jetzt haben.</numerusform>
        </translation>
    </message>
    <message>
        <source>Save ?</source>
        <translation>Speichern?</translation>
    </message>
    <message>
        <source>Save previous changes?</source>
        <translation>Bisherige Änderungen speichern?</translation>
    </message>
    <message>
        <source>Select hotkeys file</source>
        <translation>Tastenkürzeldatei wählen</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>Can&apos;t create file </source>
        <translation>Datei kann nicht angelegt werden: </translation>
    </message>
    <message>
        <source>Can&apos;t copy %1
to %2</source>
        <translation>%1
kann nicht nach %2 kopiert werden</translation>
    </message>
    <message>
        <source>No file name</source>
        <translation>Kein Dateiname</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Achtung</translation>
    </message>
    <message>
        <source>Can&apos;t parse file:
%1</source>
        <translation>Datei kann nicht gelesen werden:
%1</translation>
    </message>
    <message>
        <source>Can&apos;t save in file </source>
        <translation>Speichern nicht möglich in </translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Wiederherstellen</translation>
    </message>
    <message>
        <source>Replace your hotkeys file with the system one?
All your own bindings in it will be lost.</source>
        <translation>Ihre Tastenkürzeldatei durch die des Systems ersetzen?
Alle Ihre eigenen Kürzel darin gehen verloren.</translation>
    </message>
    <message>
        <source>All changes will be lost. Save them?</source>
        <translation>Alle Änderungen gehen verloren. Speichern?</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>You current file is &quot;%1&quot;.
After restart zem-wm will use &quot;%2&quot;.</source>
        <translation>Die aktuelle Datei ist „%1“.
Nach einem Neustart verwendet zem-wm „%2“.</translation>
    </message>
    <message>
        <source>The window manager could not be told to reload %1.</source>
        <translation>Der Fenstermanager konnte nicht angewiesen werden, %1 neu zu laden.</translation>
    </message>
    <message>
        <source>Reassign %1 from %2 to %3</source>
        <translation>%1 von %2 neu an %3 zuweisen</translation>
    </message>
    <message>
        <source>Assign %1 to %2</source>
        <translation>%1 an %2 vergeben</translation>
    </message>
    <message>
        <source>command</source>
        <extracomment>Names a command entry in &quot;to the %2 action (%3)&quot;, where %3 is its command line.</extracomment>
        <translation>Befehl</translation>
    </message>
    <message>
        <source>Whoopsie! Key conflict.</source>
        <translation>Hoppla! Kürzelkonflikt.</translation>
    </message>
    <message>
        <source>Ouch! The %1 key combination has already been allocated
to the %2 action (%3).

Please choose a unique key combination.</source>
        <translation>Autsch! Die Tastenkombination %1 ist bereits
der Aktion %2 (%3) zugewiesen.

Bitte wählen Sie eine eindeutige Tastenkombination.</translation>
    </message>
    <message>
        <source>Reassign</source>
        <extracomment>Moves the key combination to the edited row, leaving the other one without a key.</extracomment>
        <translation>Neu zuweisen</translation>
    </message>
    <message>
        <source>Clear the key of %1</source>
        <translation>Kürzel von %1 entfernen</translation>
    </message>
    <message>
        <source>File changed on disk</source>
        <translation>Datei auf der Festplatte geändert</translation>
    </message>
    <message>
        <source>%1 was deleted or renamed since it was loaded.
It is written anew.</source>
        <translation>%1 wurde seit dem Laden gelöscht oder umbenannt.
Sie wird neu geschrieben.</translation>
    </message>
    <message>
        <source>%1 was changed by another program since it was loaded.
Overwrite it with your edits, reload it and drop them, or cancel?</source>
        <translation>%1 wurde seit dem Laden von einem anderen Programm geändert.
Mit Ihren Änderungen überschreiben, neu laden und Ihre Änderungen verwerfen, oder abbrechen?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>Überschreiben</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Neu laden</translation>
    </message>
    <message>
        <source>The window manager cannot be told to use this file.
Save it under another name.</source>
        <translation>Dem Fenstermanager kann diese Datei nicht übergeben werden.
Speichern Sie sie unter einem anderen Namen.</translation>
    </message>
    <message>
        <source>The system hotkeys file %1 was changed by another program since it was loaded.
Overwrite %2 with your edits, reload both and drop them, or cancel?</source>
        <translation>Die System-Tastenkürzeldatei %1 wurde seit dem Laden von einem anderen Programm geändert.
%2 mit Ihren Änderungen überschreiben, beide neu laden und die Änderungen verwerfen, oder abbrechen?</translation>
    </message>
    <message>
        <source>Saved %1</source>
        <translation>%1 gespeichert</translation>
    </message>
    <message>
        <source>The window manager was told to reload %1</source>
        <translation>Der Fenstermanager wurde angewiesen, %1 neu zu laden</translation>
    </message>
    <message>
        <source>Key of the selected action</source>
        <extracomment>Spoken by screen readers for the key recorder of the key panel.</extracomment>
        <translation>Kürzel der gewählten Aktion</translation>
    </message>
    <message>
        <source>Bindings</source>
        <extracomment>Spoken by screen readers for the tree of bindings.</extracomment>
        <translation>Belegungen</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Usage: zem-admin-hotkeys filepath - open/create file as hotkeys coll
</source>
        <translation>Aufruf: zem-admin-hotkeys Datei – Datei als Tastenkürzelsammlung öffnen/anlegen
</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>File %1 doesn&apos;t exist. Create?</source>
        <translation>Datei %1 gibt es nicht. Anlegen?</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Achtung</translation>
    </message>
    <message>
        <source>Can&apos;t open/create file:
%1</source>
        <translation>Datei kann nicht geöffnet/angelegt werden:
%1</translation>
    </message>
    <message>
        <source>Can&apos;t parse file:
%1</source>
        <translation>Datei kann nicht gelesen werden:
%1</translation>
    </message>
    <message>
        <source>the file name is not valid in the locale&apos;s encoding</source>
        <translation>der Dateiname ist in der Kodierung der Sprachumgebung ungültig</translation>
    </message>
    <message>
        <source>an editor already runs on this display and was brought forward; %1 was not opened there</source>
        <translation>auf dieser Anzeige läuft bereits ein Editor und wurde nach vorn geholt; %1 wurde dort nicht geöffnet</translation>
    </message>
</context>
<context>
    <name>SelectCommandDialog</name>
    <message>
        <source>Choose a program file</source>
        <translation>Programmdatei wählen</translation>
    </message>
    <message>
        <source>Choose an application from the menu</source>
        <translation>Anwendung aus dem Menü wählen</translation>
    </message>
    <message>
        <source>Select Command</source>
        <translation>Befehl wählen</translation>
    </message>
    <message>
        <source>Open executable</source>
        <translation>Programm öffnen</translation>
    </message>
    <message>
        <source>File doesn&apos;t exist</source>
        <translation>Datei existiert nicht</translation>
    </message>
    <message>
        <source>File you have selected doesn&apos;t exist. Do you want to choose another one?</source>
        <translation>Die gewählte Datei existiert nicht. Eine andere wählen?</translation>
    </message>
    <message>
        <source>File isn&apos;t executable</source>
        <translation>Datei ist nicht ausführbar</translation>
    </message>
    <message>
        <source>You can&apos;t exec selected file. Do you want to choose another one?</source>
        <translation>Die gewählte Datei kann nicht ausgeführt werden. Eine andere wählen?</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Achtung</translation>
    </message>
</context>
<context>
    <name>ZemHelpMenu</name>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Hilfe</translation>
    </message>
    <message>
        <source>About Zem hotkeys editor</source>
        <translation>Über den Zem-Tastenkürzel-Editor</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>Über Qt</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Zem hotkeys editor %1&lt;/h3&gt;&lt;p&gt;Edits the keyboard shortcuts of the zem-wm window manager.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Zem-Tastenkürzel-Editor %1&lt;/h3&gt;&lt;p&gt;Bearbeitet die Tastenkürzel des Fenstermanagers zem-wm.&lt;/p&gt;</translation>
    </message>
</context>
<context>
    <name>ZemHotkeys</name>
    <message>
        <source>unknown option %1</source>
        <translation>unbekannte Option %1</translation>
    </message>
    <message>
        <source>cannot read the key &quot;%1&quot;</source>
        <translation>das Kürzel „%1“ ist nicht lesbar</translation>
    </message>
    <message>
        <source>no [ShortCutKeys] section</source>
        <translation>kein Abschnitt [ShortCutKeys]</translation>
    </message>
    <message>
        <source>%1 is no function of the window manager</source>
        <translation>%1 ist keine Funktion des Fenstermanagers</translation>
    </message>
    <message>
        <source>%1 already does %2</source>
        <translation>%1 bewirkt bereits %2</translation>
    </message>
    <message>
        <source>%1 is held by %2; --force takes it over</source>
        <translation>%1 gehört zu %2; --force übernimmt es</translation>
    </message>
    <message>
        <source>no binding holds %1</source>
        <translation>kein Kürzel belegt %1</translation>
    </message>
    <message>
        <source>no X display; the window manager cannot be told</source>
        <translation>kein X-Bildschirm; der Fenstermanager ist nicht erreichbar</translation>
    </message>
    <message>
        <source>the X display refused the command</source>
        <translation>der X-Bildschirm hat den Befehl abgelehnt</translation>
    </message>
    <message>
        <source>--file needs a file name</source>
        <translation>--file braucht einen Dateinamen</translation>
    </message>
    <message>
        <source>the argument %1 is not valid in the locale&apos;s encoding</source>
        <translation>das Argument %1 ist in der Kodierung der Sprachumgebung ungültig</translation>
    </message>
</context>
<context>
    <name>ZemMenuDialog</name>
    <message>
        <source>Multimedia</source>
        <translation>Multimedia</translation>
    </message>
    <message>
        <source>Development</source>
        <translation>Entwicklung</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>Bildung</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>Spiele</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>Grafik</translation>
    </message>
    <message>
        <source>Internet</source>
        <translation>Internet</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>Büro</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>Wissenschaft</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>System</source>
        <translation>System</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Zubehör</translation>
    </message>
    <message>
        <source>Other</source>
        <translation>Sonstiges</translation>
    </message>
    <message>
        <source>Choose an application</source>
        <translation>Anwendung wählen</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filter</translation>
    </message>
    <message>
        <source>No installed applications were found. Applications appear here when their desktop entries are installed in an applications directory.</source>
        <translation>Es wurden keine installierten Anwendungen gefunden. Anwendungen erscheinen hier, wenn ihre Desktop-Einträge in einem applications-Verzeichnis installiert sind.</translation>
    </message>
</context>
<context>
    <name>commandDialog</name>
    <message>
        <source>Command:</source>
        <translation>Befehl:</translation>
    </message>
    <message>
        <source>...</source>
        <translation>…</translation>
    </message>
</context>
</TS>

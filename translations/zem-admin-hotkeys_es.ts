<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es_ES">
<context>
    <name>EditedFile</name>
    <message>
        <source>No file name</source>
        <translation>Sin nombre de archivo</translation>
    </message>
</context>
<context>
    <name>FilterBar</name>
    <message>
        <source>Filter by action, function, command or key</source>
        <translation>Filtrar por acción, función, orden o atajo</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtrar</translation>
    </message>
    <message>
        <source>Press a key combination to find what it does</source>
        <translation>Pulse una combinación de teclas para ver qué hace</translation>
    </message>
    <message>
        <source>Find key</source>
        <translation>Buscar atajo</translation>
    </message>
    <message numerus="yes">
        <source>%1 of %n bindings</source>
        <extracomment>Shown while a filter is active, for example &quot;3 of 186 bindings&quot;.</extracomment>
        <translation>
            <numerusform>%1 de %n atajo</numerusform>
            <numerusform>%1 de %n atajos</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 is disabled</source>
        <translation>%1 está desactivado</translation>
    </message>
    <message>
        <source>%1 is free</source>
        <translation>%1 está libre</translation>
    </message>
    <message>
        <source>%1 is taken from the system file</source>
        <translation>%1 procede del archivo del sistema</translation>
    </message>
</context>
<context>
    <name>Handbook</name>
    <message>
        <source>Zem hotkeys editor Handbook</source>
        <translation>Manual del editor de atajos de Zem</translation>
    </message>
    <message>
        <source>&lt;h2&gt;Zem hotkeys editor&lt;/h2&gt;&lt;p&gt;The editor shows every function of the zem-wm window manager in its group, and below &lt;i&gt;Command Keybindings&lt;/i&gt; the command lines of your own, each with its key. &lt;b&gt;Current Key&lt;/b&gt; is the key combination that starts it; &lt;b&gt;Source&lt;/b&gt; says whether the binding comes from your own hotkeys file (&lt;i&gt;user&lt;/i&gt;) or from the system-wide one (&lt;i&gt;system&lt;/i&gt;), which gives every user&apos;s defaults.&lt;/p&gt;</source>
        <translation>&lt;h2&gt;Editor de atajos de Zem&lt;/h2&gt;&lt;p&gt;El editor muestra cada función del gestor de ventanas zem-wm en su grupo y, bajo &lt;i&gt;Atajos de órdenes&lt;/i&gt;, sus propias líneas de órdenes, cada una con su atajo. &lt;b&gt;Atajo actual&lt;/b&gt; es la combinación que la lanza; &lt;b&gt;Origen&lt;/b&gt; indica si el atajo viene de su propio archivo (&lt;i&gt;usuario&lt;/i&gt;) o del archivo del sistema (&lt;i&gt;sistema&lt;/i&gt;), que da los valores predeterminados de todos los usuarios.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Finding&lt;/h3&gt;&lt;p&gt;Type into the field above the tree (Ctrl+F) to see only the rows whose action, function, command or key holds the text; a key may be typed as Ctrl+Alt+T or Ctrl|Alt|t. &lt;b&gt;Find key&lt;/b&gt; records a combination and shows who holds it, or says that it is free.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Buscar&lt;/h3&gt;&lt;p&gt;Escriba en el campo sobre la lista (Ctrl+F) para ver solo las filas cuya acción, función, orden o atajo contiene el texto; un atajo puede escribirse como Ctrl+Alt+T o Ctrl|Alt|t. &lt;b&gt;Buscar atajo&lt;/b&gt; graba una combinación y muestra quién la tiene, o indica que está libre.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Commands&lt;/h3&gt;&lt;p&gt;&lt;b&gt;New action&lt;/b&gt; adds a command line of your own: type it, choose a program file with the first button beside the field, or an installed application with the second. &lt;b&gt;Clone&lt;/b&gt; gives a function or a command a further row for another key; &lt;b&gt;Edit&lt;/b&gt; and &lt;b&gt;Delete&lt;/b&gt; change or remove a command.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Órdenes&lt;/h3&gt;&lt;p&gt;&lt;b&gt;Nueva acción&lt;/b&gt; añade una línea de órdenes propia: escríbala, elija un archivo de programa con el primer botón junto al campo o una aplicación instalada con el segundo. &lt;b&gt;Duplicar&lt;/b&gt; da a una función o a una orden otra fila para otro atajo; &lt;b&gt;Editar&lt;/b&gt; y &lt;b&gt;Eliminar&lt;/b&gt; cambian o quitan una orden.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Files&lt;/h3&gt;&lt;p&gt;Your hotkeys file is keyshortcutrc in ~/.config/zem (or $XDG_CONFIG_HOME/zem); the system one is in the zem directory of the system configuration, /etc/zem for most installations. The window size and layout are kept in ~/.config/zem/zem-admin-hotkeys.conf. The command &lt;tt&gt;zem-hotkeys&lt;/tt&gt; lists, checks and changes the same files from a shell.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Archivos&lt;/h3&gt;&lt;p&gt;Su archivo de atajos es keyshortcutrc en ~/.config/zem (o $XDG_CONFIG_HOME/zem); el del sistema está en el directorio zem de la configuración del sistema, /etc/zem en la mayoría de las instalaciones. El tamaño y la disposición de la ventana se guardan en ~/.config/zem/zem-admin-hotkeys.conf. La orden &lt;tt&gt;zem-hotkeys&lt;/tt&gt; lista, comprueba y cambia los mismos archivos desde una terminal.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Keys&lt;/h3&gt;&lt;p&gt;Select a row and click &lt;b&gt;Assign Key:&lt;/b&gt;, then press the combination. A combination that another row holds is refused; &lt;b&gt;Reassign&lt;/b&gt; in that message moves it to your row and leaves the other without a key. &lt;b&gt;Clear Key&lt;/b&gt; takes the key away. A system key you clear or change is written into your file as &lt;i&gt;Disable&lt;/i&gt;, which switches the system binding of that key off. &lt;b&gt;Revert to System Binding&lt;/b&gt; in the Edit menu gives a function or a command back what the system file gives it, and a key that Reassign took goes back to the row it came from. Every edit can be undone and redone (Ctrl+Z, Ctrl+Shift+Z), wherever the focus is.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Teclas&lt;/h3&gt;&lt;p&gt;Elija una fila, pulse &lt;b&gt;Asignar atajo:&lt;/b&gt; y luego la combinación. Una combinación que tiene otra fila se rechaza; &lt;b&gt;Reasignar&lt;/b&gt; en ese mensaje la da a su fila y deja la otra sin tecla. &lt;b&gt;Quitar el atajo&lt;/b&gt; quita la tecla. Una tecla del sistema que usted borra o cambia se escribe en su archivo como &lt;i&gt;Disable&lt;/i&gt;, lo que desactiva la asignación del sistema de esa tecla. &lt;b&gt;Volver al atajo del sistema&lt;/b&gt; en el menú Editar devuelve a una función o a una orden lo que le da el archivo del sistema, y una tecla que Reasignar tomó vuelve a su fila. Cada cambio se puede deshacer y rehacer (Ctrl+Z, Ctrl+Mayús+Z), esté donde esté el foco.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Save and Apply&lt;/h3&gt;&lt;p&gt;&lt;b&gt;Save&lt;/b&gt; (Ctrl+S) writes your hotkeys file; only the lines of the keys you edited change, and a file that cannot be written whole is left untouched. &lt;b&gt;Apply&lt;/b&gt; (Ctrl+Return) saves and tells the running window manager to read the file again; a file saved but not yet applied can still be applied. When another program changed the file since it was loaded, you are asked before it is overwritten. &lt;b&gt;Restore&lt;/b&gt; replaces your file with the system one and keeps the old one beside it as keyshortcutrc~.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Guardar y aplicar&lt;/h3&gt;&lt;p&gt;&lt;b&gt;Guardar&lt;/b&gt; (Ctrl+S) escribe su archivo de atajos; solo cambian las líneas de las teclas que usted editó, y un archivo que no puede escribirse entero queda intacto. &lt;b&gt;Aplicar&lt;/b&gt; (Ctrl+Intro) guarda y pide al gestor de ventanas en ejecución que vuelva a leer el archivo; un archivo guardado pero aún no aplicado se puede seguir aplicando. Si otro programa cambió el archivo desde que se cargó, se le pregunta antes de sobrescribirlo. &lt;b&gt;Restaurar&lt;/b&gt; sustituye su archivo por el del sistema y guarda el anterior al lado como keyshortcutrc~.&lt;/p&gt;</translation>
    </message>
</context>
<context>
    <name>HotkeysCheck</name>
    <message>
        <source>no [ShortCutKeys] section</source>
        <translation>sin sección [ShortCutKeys]</translation>
    </message>
    <message>
        <source>the key %1 cannot be read</source>
        <translation>el atajo %1 no se puede leer</translation>
    </message>
    <message>
        <source>the key %1 does not count: line %2 binds the same key</source>
        <translation>la tecla %1 no cuenta: la línea %2 asigna la misma tecla</translation>
    </message>
    <message>
        <source>%1 is no function of the window manager</source>
        <translation>%1 no es una función del gestor de ventanas</translation>
    </message>
    <message>
        <source>the program of &quot;%1&quot; is not installed</source>
        <translation>el programa de «%1» no está instalado</translation>
    </message>
    <message>
        <source>the key %1 alone takes a character from typing</source>
        <translation>el atajo %1 solo quita un carácter al escribir</translation>
    </message>
</context>
<context>
    <name>HotkeysFile</name>
    <message>
        <source>No file name</source>
        <translation>Sin nombre de archivo</translation>
    </message>
    <message>
        <source>Not a regular file</source>
        <translation>No es un archivo normal</translation>
    </message>
    <message>
        <source>The file is larger than 16 MiB</source>
        <translation>El archivo ocupa más de 16 MiB</translation>
    </message>
    <message>
        <source>The file holds NUL bytes</source>
        <translation>El archivo contiene bytes NUL</translation>
    </message>
    <message>
        <source>The key &quot;%1&quot; cannot be written to a hotkeys file</source>
        <translation>El atajo «%1» no se puede escribir en un archivo de atajos</translation>
    </message>
    <message>
        <source>The action &quot;%1&quot; cannot be written to a hotkeys file</source>
        <translation>La acción «%1» no se puede escribir en un archivo de atajos</translation>
    </message>
    <message>
        <source>No [ShortCutKeys] section</source>
        <translation>Sin sección [ShortCutKeys]</translation>
    </message>
    <message>
        <source>The command is empty</source>
        <translation>La orden está vacía</translation>
    </message>
    <message>
        <source>The command holds the control character %1, which a hotkeys file cannot hold</source>
        <translation>La orden contiene el carácter de control %1, que un archivo de atajos no puede contener</translation>
    </message>
    <message>
        <source>The file name holds control characters</source>
        <translation>El nombre de archivo contiene caracteres de control</translation>
    </message>
    <message>
        <source>The file name cannot be written in the locale&apos;s encoding</source>
        <translation>El nombre de archivo no se puede escribir en la codificación de la configuración regional</translation>
    </message>
    <message>
        <source>The file name is too long to be handed to the window manager</source>
        <translation>El nombre de archivo es demasiado largo para pasarlo al gestor de ventanas</translation>
    </message>
    <message>
        <source>%1 is a symbolic link of another account</source>
        <translation>%1 es un enlace simbólico de otra cuenta</translation>
    </message>
    <message>
        <source>%1 is read-only: its owner&apos;s write permission is off</source>
        <translation>%1 es de solo lectura: su propietario no tiene permiso de escritura</translation>
    </message>
    <message>
        <source>%1 belongs to another account</source>
        <translation>%1 pertenece a otra cuenta</translation>
    </message>
    <message>
        <source>%1 has %2 hard links; replacing it would part it from the others</source>
        <translation>%1 tiene %2 enlaces duros; reemplazarlo lo separaría de los demás</translation>
    </message>
    <message>
        <source>The file would be larger than 16 MiB</source>
        <translation>El archivo superaría los 16 MiB</translation>
    </message>
    <message>
        <source>Another program is writing a hotkeys file in %1; gave up waiting after %2 seconds</source>
        <translation>Otro programa está escribiendo un archivo de atajos en %1; se dejó de esperar tras %2 segundos</translation>
    </message>
</context>
<context>
    <name>KKeySequenceButton</name>
    <message>
        <source>Unsupported Key</source>
        <translation>Tecla no admitida</translation>
    </message>
    <message>
        <source>The key you just pressed is not supported by Qt.</source>
        <translation>La tecla que acaba de pulsar no es compatible con Qt.</translation>
    </message>
    <message>
        <source>Clear the key</source>
        <translation>Borrar la tecla</translation>
    </message>
</context>
<context>
    <name>KKeySequenceWidgetPrivate</name>
    <message>
        <source>Input</source>
        <translation>Entrada</translation>
    </message>
    <message>
        <source>None</source>
        <translation>Ninguno</translation>
    </message>
</context>
<context>
    <name>KeysConfForm</name>
    <message>
        <source>Window decoration (on/off)</source>
        <translation>Decoración de ventanas (sí/no)</translation>
    </message>
    <message>
        <source>toggle switch of a border</source>
        <translation>activar/desactivar el borde</translation>
    </message>
    <message>
        <source>toggle switch of a border edge</source>
        <translation>activar/desactivar el filo del borde</translation>
    </message>
    <message>
        <source>toggle switch of a minimize button</source>
        <translation>activar/desactivar el botón de minimizar</translation>
    </message>
    <message>
        <source>toggle switch of a restore button</source>
        <translation>activar/desactivar el botón de restaurar</translation>
    </message>
    <message>
        <source>toggle switch of a close button</source>
        <translation>activar/desactivar el botón de cerrar</translation>
    </message>
    <message>
        <source>toggle switch of a control button</source>
        <translation>activar/desactivar el botón de control</translation>
    </message>
    <message>
        <source>toggle switch of a taskbar button</source>
        <translation>activar/desactivar el botón de la barra de tareas</translation>
    </message>
    <message>
        <source>toggle switch of a title bar</source>
        <translation>activar/desactivar la barra de título</translation>
    </message>
    <message>
        <source>toggle switch of all decorations</source>
        <translation>activar/desactivar todas las decoraciones</translation>
    </message>
    <message>
        <source>Taskbar</source>
        <translation>Barra de tareas</translation>
    </message>
    <message>
        <source>move the taskbar to bottom</source>
        <translation>mover la barra de tareas abajo</translation>
    </message>
    <message>
        <source>move the taskbar to top</source>
        <translation>mover la barra de tareas arriba</translation>
    </message>
    <message>
        <source>move the taskbar to left</source>
        <translation>mover la barra de tareas a la izquierda</translation>
    </message>
    <message>
        <source>move the taskbar to right</source>
        <translation>mover la barra de tareas a la derecha</translation>
    </message>
    <message>
        <source>toggle switch of TaskbarAutoHide</source>
        <translation>activar/desactivar la ocultación automática de la barra de tareas</translation>
    </message>
    <message>
        <source>enable TaskbarAutoHide</source>
        <translation>activar la ocultación automática de la barra de tareas</translation>
    </message>
    <message>
        <source>disable TaskbarAutoHide</source>
        <translation>desactivar la ocultación automática de la barra de tareas</translation>
    </message>
    <message>
        <source>toggle switch of the taskbar show/hide</source>
        <translation>mostrar/ocultar la barra de tareas</translation>
    </message>
    <message>
        <source>show the taskbar</source>
        <translation>mostrar la barra de tareas</translation>
    </message>
    <message>
        <source>hide the taskbar</source>
        <translation>ocultar la barra de tareas</translation>
    </message>
    <message>
        <source>appear the taskbar when TaskbarAutoHide</source>
        <translation>hacer aparecer la barra de tareas oculta automáticamente</translation>
    </message>
    <message>
        <source>disappear the taskbar when TaskbarAutoHide</source>
        <translation>hacer desaparecer la barra de tareas oculta automáticamente</translation>
    </message>
    <message>
        <source>toggle switch of the taskbar top/botton</source>
        <translation>barra de tareas encima/debajo de todo</translation>
    </message>
    <message>
        <source>taskbar on top of all</source>
        <translation>barra de tareas encima de todo</translation>
    </message>
    <message>
        <source>taskbar on bottom of all</source>
        <translation>barra de tareas debajo de todo</translation>
    </message>
    <message>
        <source>Desktop Icon</source>
        <translation>Iconos del escritorio</translation>
    </message>
    <message>
        <source>line up icons</source>
        <translation>alinear los iconos</translation>
    </message>
    <message>
        <source>order icons</source>
        <translation>ordenar los iconos</translation>
    </message>
    <message>
        <source>select all icons</source>
        <translation>seleccionar todos los iconos</translation>
    </message>
    <message>
        <source>find icons</source>
        <translation>buscar iconos</translation>
    </message>
    <message>
        <source>execute the icon</source>
        <translation>ejecutar el icono</translation>
    </message>
    <message>
        <source>execute the icon with</source>
        <translation>ejecutar el icono con</translation>
    </message>
    <message>
        <source>send the icon by email</source>
        <translation>enviar el icono por correo</translation>
    </message>
    <message>
        <source>delete the icon</source>
        <translation>eliminar el icono</translation>
    </message>
    <message>
        <source>show icon properties</source>
        <translation>mostrar las propiedades del icono</translation>
    </message>
    <message>
        <source>create an icon</source>
        <translation>crear un icono</translation>
    </message>
    <message>
        <source>create a text file</source>
        <translation>crear un archivo de texto</translation>
    </message>
    <message>
        <source>create a session script file</source>
        <translation>crear un script de sesión</translation>
    </message>
    <message>
        <source>cretae a folder</source>
        <translation>crear una carpeta</translation>
    </message>
    <message>
        <source>send icon to home folder</source>
        <translation>enviar el icono a la carpeta personal</translation>
    </message>
    <message>
        <source>send icon to My documents folder</source>
        <translation>enviar el icono a la carpeta Mis documentos</translation>
    </message>
    <message>
        <source>send icon trash can</source>
        <translation>enviar el icono a la papelera</translation>
    </message>
    <message>
        <source>send icon start menu</source>
        <translation>enviar el icono al menú de inicio</translation>
    </message>
    <message>
        <source>send icon to toolbar</source>
        <translation>enviar el icono a la barra de herramientas</translation>
    </message>
    <message>
        <source>send icon to folder</source>
        <translation>enviar el icono a una carpeta</translation>
    </message>
    <message>
        <source>cut icon(s)</source>
        <translation>cortar iconos</translation>
    </message>
    <message>
        <source>copy icon(s)</source>
        <translation>copiar iconos</translation>
    </message>
    <message>
        <source>paste icon(s)</source>
        <translation>pegar iconos</translation>
    </message>
    <message>
        <source>navigate up</source>
        <translation>ir hacia arriba</translation>
    </message>
    <message>
        <source>navigate down</source>
        <translation>ir hacia abajo</translation>
    </message>
    <message>
        <source>navigate left</source>
        <translation>ir a la izquierda</translation>
    </message>
    <message>
        <source>navigate right</source>
        <translation>ir a la derecha</translation>
    </message>
    <message>
        <source>rename icon</source>
        <translation>cambiar el nombre del icono</translation>
    </message>
    <message>
        <source>undo last operation on desktop</source>
        <translation>deshacer la última operación en el escritorio</translation>
    </message>
    <message>
        <source>Keyboard</source>
        <translation>Teclado</translation>
    </message>
    <message>
        <source>switch to base keyboard</source>
        <translation>cambiar a la distribución básica</translation>
    </message>
    <message>
        <source>switch to alt keyboard</source>
        <translation>cambiar a la distribución alternativa</translation>
    </message>
    <message>
        <source>switch keyboard</source>
        <translation>cambiar la distribución del teclado</translation>
    </message>
    <message>
        <source>Pager</source>
        <translation>Paginador</translation>
    </message>
    <message>
        <source>toggle switch of the pager show/hide</source>
        <translation>mostrar/ocultar el paginador</translation>
    </message>
    <message>
        <source>show the pager</source>
        <translation>mostrar el paginador</translation>
    </message>
    <message>
        <source>hide the pager</source>
        <translation>ocultar el paginador</translation>
    </message>
    <message>
        <source>toggle switch of the pager top/botton</source>
        <translation>paginador encima/debajo de todo</translation>
    </message>
    <message>
        <source>pager on top of all</source>
        <translation>paginador encima de todo</translation>
    </message>
    <message>
        <source>pager on botton of all</source>
        <translation>paginador debajo de todo</translation>
    </message>
    <message>
        <source>add row to the pager</source>
        <translation>añadir una fila al paginador</translation>
    </message>
    <message>
        <source>remove row from the pager</source>
        <translation>quitar una fila del paginador</translation>
    </message>
    <message>
        <source>add column to the pager</source>
        <translation>añadir una columna al paginador</translation>
    </message>
    <message>
        <source>remove column from the pager</source>
        <translation>quitar una columna del paginador</translation>
    </message>
    <message>
        <source>update the pager</source>
        <translation>actualizar el paginador</translation>
    </message>
    <message>
        <source>maximize the pager (fullscreen)</source>
        <translation>maximizar el paginador (pantalla completa)</translation>
    </message>
    <message>
        <source>restore the pager (small window)</source>
        <translation>restaurar el paginador (ventana pequeña)</translation>
    </message>
    <message>
        <source>toggle pager fullscreen mode</source>
        <translation>alternar el paginador a pantalla completa</translation>
    </message>
    <message>
        <source>Paging</source>
        <translation>Cambio de página</translation>
    </message>
    <message>
        <source>switch to the left page</source>
        <translation>cambiar a la página de la izquierda</translation>
    </message>
    <message>
        <source>switch to the right page</source>
        <translation>cambiar a la página de la derecha</translation>
    </message>
    <message>
        <source>switch to the up page</source>
        <translation>cambiar a la página de arriba</translation>
    </message>
    <message>
        <source>switch to the down page</source>
        <translation>cambiar a la página de abajo</translation>
    </message>
    <message>
        <source>Search panel</source>
        <translation>Panel de búsqueda</translation>
    </message>
    <message>
        <source>toggle search panel</source>
        <translation>mostrar/ocultar el panel de búsqueda</translation>
    </message>
    <message>
        <source>Menu</source>
        <translation>Menú</translation>
    </message>
    <message>
        <source>pop up the start menu</source>
        <translation>abrir el menú de inicio</translation>
    </message>
    <message>
        <source>pop up the desktop menu</source>
        <translation>abrir el menú del escritorio</translation>
    </message>
    <message>
        <source>pop up a window ctrl menu</source>
        <translation>abrir el menú de la ventana</translation>
    </message>
    <message>
        <source>pop down a menu</source>
        <translation>cerrar un menú</translation>
    </message>
    <message>
        <source>pop down all menus</source>
        <translation>cerrar todos los menús</translation>
    </message>
    <message>
        <source>Rearrangement</source>
        <translation>Disposición</translation>
    </message>
    <message>
        <source>overlap all windows</source>
        <translation>superponer todas las ventanas</translation>
    </message>
    <message>
        <source>overlap windows within the screen</source>
        <translation>superponer las ventanas de la pantalla</translation>
    </message>
    <message>
        <source>horizontally tile all windows</source>
        <translation>mosaico horizontal de todas las ventanas</translation>
    </message>
    <message>
        <source>horizontally tile windows within the screen</source>
        <translation>mosaico horizontal de las ventanas de la pantalla</translation>
    </message>
    <message>
        <source>vertically tile all windows</source>
        <translation>mosaico vertical de todas las ventanas</translation>
    </message>
    <message>
        <source>vertically tile windows within the screen</source>
        <translation>mosaico vertical de las ventanas de la pantalla</translation>
    </message>
    <message>
        <source>tile all windows in matrix</source>
        <translation>disponer todas las ventanas en cuadrícula</translation>
    </message>
    <message>
        <source>tile windows in matrix within the screen</source>
        <translation>disponer las ventanas de la pantalla en cuadrícula</translation>
    </message>
    <message>
        <source>minimize all windows</source>
        <translation>minimizar todas las ventanas</translation>
    </message>
    <message>
        <source>minimize windows within the screen</source>
        <translation>minimizar las ventanas de la pantalla</translation>
    </message>
    <message>
        <source>minimize/restore all windows</source>
        <translation>minimizar/restaurar todas las ventanas</translation>
    </message>
    <message>
        <source>minimize/restore windows within the screen</source>
        <translation>minimizar/restaurar las ventanas de la pantalla</translation>
    </message>
    <message>
        <source>restore all windows</source>
        <translation>restaurar todas las ventanas</translation>
    </message>
    <message>
        <source>restore windows within the screen</source>
        <translation>restaurar las ventanas de la pantalla</translation>
    </message>
    <message>
        <source>close all windows</source>
        <translation>cerrar todas las ventanas</translation>
    </message>
    <message>
        <source>close windows within the screen</source>
        <translation>cerrar las ventanas de la pantalla</translation>
    </message>
    <message>
        <source>Window placement</source>
        <translation>Colocación de ventanas</translation>
    </message>
    <message>
        <source>move a window</source>
        <translation>mover una ventana</translation>
    </message>
    <message>
        <source>move a window to the next screen</source>
        <translation>mover una ventana a la pantalla siguiente</translation>
    </message>
    <message>
        <source>move a window to the previous screen</source>
        <translation>mover una ventana a la pantalla anterior</translation>
    </message>
    <message>
        <source>resize a window</source>
        <translation>cambiar el tamaño de una ventana</translation>
    </message>
    <message>
        <source>minimize a window</source>
        <translation>minimizar una ventana</translation>
    </message>
    <message>
        <source>restore a window size</source>
        <translation>restaurar el tamaño de una ventana</translation>
    </message>
    <message>
        <source>maximize a window</source>
        <translation>maximizar una ventana</translation>
    </message>
    <message>
        <source>maximize/restore a window</source>
        <translation>maximizar/restaurar una ventana</translation>
    </message>
    <message>
        <source>fullscreen/restore a window</source>
        <translation>ventana a pantalla completa/restaurar</translation>
    </message>
    <message>
        <source>swallow to tray</source>
        <translation>recoger en la bandeja del sistema</translation>
    </message>
    <message>
        <source>move taskbar btn left(up)</source>
        <translation>mover el botón de la barra de tareas a la izquierda (arriba)</translation>
    </message>
    <message>
        <source>move taskbar btn right(down)</source>
        <translation>mover el botón de la barra de tareas a la derecha (abajo)</translation>
    </message>
    <message>
        <source>expand a window to all directions</source>
        <translation>extender una ventana en todas las direcciones</translation>
    </message>
    <message>
        <source>expand a window to a left direction</source>
        <translation>extender una ventana hacia la izquierda</translation>
    </message>
    <message>
        <source>expand a window to a right direction</source>
        <translation>extender una ventana hacia la derecha</translation>
    </message>
    <message>
        <source>expand a window to an up direction</source>
        <translation>extender una ventana hacia arriba</translation>
    </message>
    <message>
        <source>expand a window to a down direction</source>
        <translation>extender una ventana hacia abajo</translation>
    </message>
    <message>
        <source>snap a window to a right edge</source>
        <translation>ajustar una ventana al borde derecho</translation>
    </message>
    <message>
        <source>snap a window to a left edge</source>
        <translation>ajustar una ventana al borde izquierdo</translation>
    </message>
    <message>
        <source>snap a window to a bottom right corner</source>
        <translation>ajustar una ventana a la esquina inferior derecha</translation>
    </message>
    <message>
        <source>snap a window to a botton left corner</source>
        <translation>ajustar una ventana a la esquina inferior izquierda</translation>
    </message>
    <message>
        <source>snap a window to a top right corner</source>
        <translation>ajustar una ventana a la esquina superior derecha</translation>
    </message>
    <message>
        <source>snap a window to a top left corner</source>
        <translation>ajustar una ventana a la esquina superior izquierda</translation>
    </message>
    <message>
        <source>snap a window to a top edge</source>
        <translation>ajustar una ventana al borde superior</translation>
    </message>
    <message>
        <source>snap a window to a bottom edge</source>
        <translation>ajustar una ventana al borde inferior</translation>
    </message>
    <message>
        <source>raise a window</source>
        <translation>traer una ventana al frente</translation>
    </message>
    <message>
        <source>lower a window</source>
        <translation>enviar una ventana al fondo</translation>
    </message>
    <message>
        <source>close a window (recommend)</source>
        <translation>cerrar una ventana (recomendado)</translation>
    </message>
    <message>
        <source>close all similar window</source>
        <translation>cerrar todas las ventanas similares</translation>
    </message>
    <message>
        <source>close a window forcely</source>
        <translation>cerrar una ventana a la fuerza</translation>
    </message>
    <message>
        <source>toggle switch of an ONTOP attribute</source>
        <translation>activar/desactivar el atributo «siempre encima»</translation>
    </message>
    <message>
        <source>toggle switch of an ONBOTTOM attribute</source>
        <translation>activar/desactivar el atributo «siempre debajo»</translation>
    </message>
    <message>
        <source>toggle switch of a STICKY attribute</source>
        <translation>activar/desactivar el atributo «en todos los escritorios»</translation>
    </message>
    <message>
        <source>toggle switch of a focus attribute</source>
        <translation>activar/desactivar el atributo de foco</translation>
    </message>
    <message>
        <source>Window focus</source>
        <translation>Foco de ventanas</translation>
    </message>
    <message>
        <source>switch an active window</source>
        <translation>cambiar la ventana activa</translation>
    </message>
    <message>
        <source>switch back an active window</source>
        <translation>volver a la ventana activa anterior</translation>
    </message>
    <message>
        <source>change an active window</source>
        <translation>cambiar de ventana activa</translation>
    </message>
    <message>
        <source>change back an active window</source>
        <translation>volver a la ventana activa</translation>
    </message>
    <message>
        <source>change an active window within a screen</source>
        <translation>cambiar la ventana activa de la pantalla</translation>
    </message>
    <message>
        <source>change back an active window in a screen</source>
        <translation>volver a la ventana activa de la pantalla</translation>
    </message>
    <message>
        <source>make the desktop active</source>
        <translation>activar el escritorio</translation>
    </message>
    <message>
        <source>Window Manager</source>
        <translation>Gestor de ventanas</translation>
    </message>
    <message>
        <source>restart zem-wm</source>
        <translation>reiniciar zem-wm</translation>
    </message>
    <message>
        <source>lock screen</source>
        <translation>bloquear la pantalla</translation>
    </message>
    <message>
        <source>standby</source>
        <translation>espera</translation>
    </message>
    <message>
        <source>suspend</source>
        <translation>suspender</translation>
    </message>
    <message>
        <source>hibernate</source>
        <translation>hibernar</translation>
    </message>
    <message>
        <source>change user</source>
        <translation>cambiar de usuario</translation>
    </message>
    <message>
        <source>change/switch user</source>
        <translation>cambiar/alternar de usuario</translation>
    </message>
    <message>
        <source>postpone session</source>
        <translation>posponer la sesión</translation>
    </message>
    <message>
        <source>suspend screensaver</source>
        <translation>suspender el salvapantallas</translation>
    </message>
    <message>
        <source>resume screensaver</source>
        <translation>reanudar el salvapantallas</translation>
    </message>
    <message>
        <source>exit zem-wm</source>
        <translation>salir de zem-wm</translation>
    </message>
    <message>
        <source>reboot</source>
        <translation>reiniciar</translation>
    </message>
    <message>
        <source>shutdown</source>
        <translation>apagar</translation>
    </message>
    <message>
        <source>dpms on</source>
        <translation>ahorro de energía de la pantalla activado</translation>
    </message>
    <message>
        <source>dpms off</source>
        <translation>ahorro de energía de la pantalla desactivado</translation>
    </message>
    <message>
        <source>dpms toggle</source>
        <translation>alternar el ahorro de energía de la pantalla</translation>
    </message>
    <message>
        <source>previous wallpaper</source>
        <translation>fondo de pantalla anterior</translation>
    </message>
    <message>
        <source>next wallpaper</source>
        <translation>fondo de pantalla siguiente</translation>
    </message>
    <message>
        <source>Command Keybindings</source>
        <extracomment>The group row under which the user&apos;s command entries are listed.</extracomment>
        <translation>Atajos de órdenes</translation>
    </message>
    <message>
        <source>Zem hotkeys editor</source>
        <translation>Editor de atajos de Zem</translation>
    </message>
    <message>
        <source>user</source>
        <translation>usuario</translation>
    </message>
    <message>
        <source>system</source>
        <translation>sistema</translation>
    </message>
    <message>
        <source>Action</source>
        <translation>Acción</translation>
    </message>
    <message>
        <source>Current Key</source>
        <translation>Atajo actual</translation>
    </message>
    <message>
        <source>zem-wm function</source>
        <translation>función de zem-wm</translation>
    </message>
    <message>
        <source>Source</source>
        <translation>Origen</translation>
    </message>
    <message>
        <source>Choose a Key for the Selected Action</source>
        <extracomment>The title of the key panel below the tree.</extracomment>
        <translation>Elegir un atajo para la acción seleccionada</translation>
    </message>
    <message>
        <source>Assign Key:</source>
        <translation>Asignar atajo:</translation>
    </message>
    <message>
        <source>Clear Key</source>
        <translation>Quitar el atajo</translation>
    </message>
    <message>
        <source>&amp;New file</source>
        <translation>&amp;Nuevo archivo</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>&amp;Abrir…</translation>
    </message>
    <message>
        <source>&amp;Restore...</source>
        <translation>&amp;Restaurar…</translation>
    </message>
    <message>
        <source>Restore user&apos;s keyshortcutrc file from system one</source>
        <translation>Restaurar el archivo keyshortcutrc del usuario a partir del del sistema</translation>
    </message>
    <message>
        <source>&amp;Save</source>
        <translation>&amp;Guardar</translation>
    </message>
    <message>
        <source>Save &amp;As...</source>
        <translation>Guardar &amp;como…</translation>
    </message>
    <message>
        <source>E&amp;xit</source>
        <translation>&amp;Salir</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Aplicar</translation>
    </message>
    <message>
        <source>&amp;New action</source>
        <translation>Nueva &amp;acción</translation>
    </message>
    <message>
        <source>&amp;Clone</source>
        <translation>&amp;Duplicar</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Editar</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Eliminar</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Archivo</translation>
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
        <source>Revert to System Binding</source>
        <translation>Volver al atajo del sistema</translation>
    </message>
    <message>
        <source>Handbook</source>
        <translation>Manual</translation>
    </message>
    <message>
        <source>Actions toolbar</source>
        <translation>Barra de acciones</translation>
    </message>
    <message>
        <source>Add command %1</source>
        <translation>Añadir la orden %1</translation>
    </message>
    <message>
        <source>Edit command %1</source>
        <translation>Editar la orden %1</translation>
    </message>
    <message>
        <source>Clone %1</source>
        <translation>Duplicar %1</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>Are you sure to delete this action?</source>
        <translation>¿Seguro que quiere eliminar esta acción?</translation>
    </message>
    <message>
        <source>Delete %1</source>
        <translation>Eliminar %1</translation>
    </message>
    <message>
        <source>Revert %1 to the system binding</source>
        <translation>Volver al atajo del sistema para %1</translation>
    </message>
    <message numerus="yes">
        <source>%1 stays with the row that holds it now.</source>
        <translation>
            <numerusform>%1 se queda en la fila que lo tiene ahora.</numerusform>
            <numerusform>%1 se quedan en las filas que los tienen ahora.</numerusform>
        </translation>
    </message>
    <message>
        <source>Save ?</source>
        <translation>¿Guardar?</translation>
    </message>
    <message>
        <source>Save previous changes?</source>
        <translation>¿Guardar los cambios?</translation>
    </message>
    <message>
        <source>Select hotkeys file</source>
        <translation>Elegir un archivo de atajos</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>Can&apos;t create file </source>
        <translation>No se puede crear el archivo </translation>
    </message>
    <message>
        <source>Can&apos;t copy %1
to %2</source>
        <translation>No se puede copiar %1
a %2</translation>
    </message>
    <message>
        <source>No file name</source>
        <translation>Sin nombre de archivo</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Atención</translation>
    </message>
    <message>
        <source>Can&apos;t parse file:
%1</source>
        <translation>No se puede leer el archivo:
%1</translation>
    </message>
    <message>
        <source>Can&apos;t save in file </source>
        <translation>No se puede guardar en el archivo </translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Restaurar</translation>
    </message>
    <message>
        <source>Replace your hotkeys file with the system one?
All your own bindings in it will be lost.</source>
        <translation>¿Sustituir su archivo de atajos por el del sistema?
Se perderán todos sus atajos propios.</translation>
    </message>
    <message>
        <source>All changes will be lost. Save them?</source>
        <translation>Se perderán todos los cambios. ¿Guardarlos?</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>You current file is &quot;%1&quot;.
After restart zem-wm will use &quot;%2&quot;.</source>
        <translation>El archivo actual es «%1».
Tras reiniciar, zem-wm usará «%2».</translation>
    </message>
    <message>
        <source>The window manager could not be told to reload %1.</source>
        <translation>No se pudo indicar al gestor de ventanas que recargue %1.</translation>
    </message>
    <message>
        <source>Reassign %1 from %2 to %3</source>
        <translation>Reasignar %1 de %2 a %3</translation>
    </message>
    <message>
        <source>Assign %1 to %2</source>
        <translation>Asignar %1 a %2</translation>
    </message>
    <message>
        <source>command</source>
        <extracomment>Names a command entry in &quot;to the %2 action (%3)&quot;, where %3 is its command line.</extracomment>
        <translation>orden</translation>
    </message>
    <message>
        <source>Whoopsie! Key conflict.</source>
        <translation>¡Vaya! Conflicto de atajos.</translation>
    </message>
    <message>
        <source>Ouch! The %1 key combination has already been allocated
to the %2 action (%3).

Please choose a unique key combination.</source>
        <translation>¡Ay! La combinación %1 ya está asignada
a la acción %2 (%3).

Elija una combinación única.</translation>
    </message>
    <message>
        <source>Reassign</source>
        <extracomment>Moves the key combination to the edited row, leaving the other one without a key.</extracomment>
        <translation>Reasignar</translation>
    </message>
    <message>
        <source>Clear the key of %1</source>
        <translation>Quitar el atajo de %1</translation>
    </message>
    <message>
        <source>File changed on disk</source>
        <translation>Archivo cambiado en el disco</translation>
    </message>
    <message>
        <source>%1 was deleted or renamed since it was loaded.
It is written anew.</source>
        <translation>%1 se eliminó o cambió de nombre desde que se cargó.
Se escribe de nuevo.</translation>
    </message>
    <message>
        <source>%1 was changed by another program since it was loaded.
Overwrite it with your edits, reload it and drop them, or cancel?</source>
        <translation>Otro programa ha cambiado %1 desde que se cargó.
¿Sobrescribirlo con sus cambios, recargarlo descartándolos, o cancelar?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>Sobrescribir</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Recargar</translation>
    </message>
    <message>
        <source>The window manager cannot be told to use this file.
Save it under another name.</source>
        <translation>No se puede indicar este archivo al gestor de ventanas.
Guárdelo con otro nombre.</translation>
    </message>
    <message>
        <source>The system hotkeys file %1 was changed by another program since it was loaded.
Overwrite %2 with your edits, reload both and drop them, or cancel?</source>
        <translation>Otro programa cambió el archivo de atajos del sistema %1 desde que se cargó.
¿Sobrescribir %2 con sus cambios, recargar ambos y descartarlos, o cancelar?</translation>
    </message>
    <message>
        <source>Saved %1</source>
        <translation>%1 guardado</translation>
    </message>
    <message>
        <source>The window manager was told to reload %1</source>
        <translation>Se pidió al gestor de ventanas que vuelva a cargar %1</translation>
    </message>
    <message>
        <source>Key of the selected action</source>
        <extracomment>Spoken by screen readers for the key recorder of the key panel.</extracomment>
        <translation>Tecla de la acción elegida</translation>
    </message>
    <message>
        <source>Bindings</source>
        <extracomment>Spoken by screen readers for the tree of bindings.</extracomment>
        <translation>Atajos</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Usage: zem-admin-hotkeys filepath - open/create file as hotkeys coll
</source>
        <translation>Uso: zem-admin-hotkeys archivo – abrir/crear el archivo de atajos
</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>File %1 doesn&apos;t exist. Create?</source>
        <translation>El archivo %1 no existe. ¿Crearlo?</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Atención</translation>
    </message>
    <message>
        <source>Can&apos;t open/create file:
%1</source>
        <translation>No se puede abrir/crear el archivo:
%1</translation>
    </message>
    <message>
        <source>Can&apos;t parse file:
%1</source>
        <translation>No se puede leer el archivo:
%1</translation>
    </message>
    <message>
        <source>the file name is not valid in the locale&apos;s encoding</source>
        <translation>el nombre de archivo no es válido en la codificación de la configuración regional</translation>
    </message>
    <message>
        <source>an editor already runs on this display and was brought forward; %1 was not opened there</source>
        <translation>ya se ejecuta un editor en esta pantalla y se ha traído al frente; %1 no se abrió en él</translation>
    </message>
</context>
<context>
    <name>SelectCommandDialog</name>
    <message>
        <source>Choose a program file</source>
        <translation>Elegir un archivo de programa</translation>
    </message>
    <message>
        <source>Choose an application from the menu</source>
        <translation>Elegir una aplicación del menú</translation>
    </message>
    <message>
        <source>Select Command</source>
        <translation>Elegir una orden</translation>
    </message>
    <message>
        <source>Open executable</source>
        <translation>Abrir un ejecutable</translation>
    </message>
    <message>
        <source>File doesn&apos;t exist</source>
        <translation>El archivo no existe</translation>
    </message>
    <message>
        <source>File you have selected doesn&apos;t exist. Do you want to choose another one?</source>
        <translation>El archivo elegido no existe. ¿Quiere elegir otro?</translation>
    </message>
    <message>
        <source>File isn&apos;t executable</source>
        <translation>El archivo no es ejecutable</translation>
    </message>
    <message>
        <source>You can&apos;t exec selected file. Do you want to choose another one?</source>
        <translation>El archivo elegido no se puede ejecutar. ¿Quiere elegir otro?</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Atención</translation>
    </message>
</context>
<context>
    <name>ZemHelpMenu</name>
    <message>
        <source>&amp;Help</source>
        <translation>Ay&amp;uda</translation>
    </message>
    <message>
        <source>About Zem hotkeys editor</source>
        <translation>Acerca del editor de atajos de Zem</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>Acerca de Qt</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Zem hotkeys editor %1&lt;/h3&gt;&lt;p&gt;Edits the keyboard shortcuts of the zem-wm window manager.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Editor de atajos de Zem %1&lt;/h3&gt;&lt;p&gt;Edita los atajos de teclado del gestor de ventanas zem-wm.&lt;/p&gt;</translation>
    </message>
</context>
<context>
    <name>ZemHotkeys</name>
    <message>
        <source>unknown option %1</source>
        <translation>opción desconocida %1</translation>
    </message>
    <message>
        <source>cannot read the key &quot;%1&quot;</source>
        <translation>no se puede leer el atajo «%1»</translation>
    </message>
    <message>
        <source>no [ShortCutKeys] section</source>
        <translation>sin sección [ShortCutKeys]</translation>
    </message>
    <message>
        <source>%1 is no function of the window manager</source>
        <translation>%1 no es una función del gestor de ventanas</translation>
    </message>
    <message>
        <source>%1 already does %2</source>
        <translation>%1 ya hace %2</translation>
    </message>
    <message>
        <source>%1 is held by %2; --force takes it over</source>
        <translation>%1 lo tiene %2; --force se lo quita</translation>
    </message>
    <message>
        <source>no binding holds %1</source>
        <translation>ningún atajo usa %1</translation>
    </message>
    <message>
        <source>no X display; the window manager cannot be told</source>
        <translation>no hay pantalla X; no se puede avisar al gestor de ventanas</translation>
    </message>
    <message>
        <source>the X display refused the command</source>
        <translation>la pantalla X rechazó la orden</translation>
    </message>
    <message>
        <source>--file needs a file name</source>
        <translation>--file necesita un nombre de archivo</translation>
    </message>
    <message>
        <source>the argument %1 is not valid in the locale&apos;s encoding</source>
        <translation>el argumento %1 no es válido en la codificación de la configuración regional</translation>
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
        <translation>Desarrollo</translation>
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
        <source>Internet</source>
        <translation>Internet</translation>
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
        <translation>Configuración</translation>
    </message>
    <message>
        <source>System</source>
        <translation>Sistema</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Accesorios</translation>
    </message>
    <message>
        <source>Other</source>
        <translation>Otras</translation>
    </message>
    <message>
        <source>Choose an application</source>
        <translation>Elegir una aplicación</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Filtrar</translation>
    </message>
    <message>
        <source>No installed applications were found. Applications appear here when their desktop entries are installed in an applications directory.</source>
        <translation>No se encontraron aplicaciones instaladas. Las aplicaciones aparecen aquí cuando sus archivos .desktop están instalados en un directorio applications.</translation>
    </message>
</context>
<context>
    <name>commandDialog</name>
    <message>
        <source>Command:</source>
        <translation>Orden:</translation>
    </message>
    <message>
        <source>...</source>
        <translation>…</translation>
    </message>
</context>
</TS>

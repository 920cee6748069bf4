<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ru_RU">
<context>
    <name>EditedFile</name>
    <message>
        <source>No file name</source>
        <translation>Нет имени файла</translation>
    </message>
</context>
<context>
    <name>FilterBar</name>
    <message>
        <source>Filter by action, function, command or key</source>
        <translation>Фильтр по действию, функции, команде или сочетанию</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Фильтр</translation>
    </message>
    <message>
        <source>Press a key combination to find what it does</source>
        <translation>Нажмите сочетание клавиш, чтобы узнать, что оно делает</translation>
    </message>
    <message>
        <source>Find key</source>
        <translation>Найти сочетание</translation>
    </message>
    <message numerus="yes">
        <source>%1 of %n bindings</source>
        <extracomment>Shown while a filter is active, for example &quot;3 of 186 bindings&quot;.</extracomment>
        <translation>
            <numerusform>%1 из %n сочетания</numerusform>
            <numerusform>%1 из %n сочетаний</numerusform>
            <numerusform>%1 из %n сочетаний</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 is disabled</source>
        <translation>%1 отключено</translation>
    </message>
    <message>
        <source>%1 is free</source>
        <translation>%1 свободно</translation>
    </message>
    <message>
        <source>%1 is taken from the system file</source>
        <translation>%1 взято из системного файла</translation>
    </message>
</context>
<context>
    <name>Handbook</name>
    <message>
        <source>Zem hotkeys editor Handbook</source>
        <translation>Руководство редактора горячих клавиш Zem</translation>
    </message>
    <message>
        <source>&lt;h2&gt;Zem hotkeys editor&lt;/h2&gt;&lt;p&gt;The editor shows every function of the zem-wm window manager in its group, and below &lt;i&gt;Command Keybindings&lt;/i&gt; the command lines of your own, each with its key. &lt;b&gt;Current Key&lt;/b&gt; is the key combination that starts it; &lt;b&gt;Source&lt;/b&gt; says whether the binding comes from your own hotkeys file (&lt;i&gt;user&lt;/i&gt;) or from the system-wide one (&lt;i&gt;system&lt;/i&gt;), which gives every user&apos;s defaults.&lt;/p&gt;</source>
        <translation>&lt;h2&gt;Редактор горячих клавиш Zem&lt;/h2&gt;&lt;p&gt;Редактор показывает каждую функцию оконного менеджера zem-wm в её группе, а в разделе &lt;i&gt;Сочетания для команд&lt;/i&gt; — ваши собственные команды, каждую с её сочетанием. &lt;b&gt;Текущее сочетание&lt;/b&gt; — комбинация клавиш, которая её запускает; &lt;b&gt;Источник&lt;/b&gt; говорит, взято ли сочетание из вашего собственного файла (&lt;i&gt;пользователь&lt;/i&gt;) или из системного (&lt;i&gt;система&lt;/i&gt;), который задаёт значения по умолчанию для всех пользователей.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Finding&lt;/h3&gt;&lt;p&gt;Type into the field above the tree (Ctrl+F) to see only the rows whose action, function, command or key holds the text; a key may be typed as Ctrl+Alt+T or Ctrl|Alt|t. &lt;b&gt;Find key&lt;/b&gt; records a combination and shows who holds it, or says that it is free.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Поиск&lt;/h3&gt;&lt;p&gt;Введите текст в поле над списком (Ctrl+F), чтобы видеть только строки, чьё действие, функция, команда или сочетание содержат этот текст; сочетание можно записать как Ctrl+Alt+T или Ctrl|Alt|t. &lt;b&gt;Найти сочетание&lt;/b&gt; записывает комбинацию и показывает, кто её занимает, или сообщает, что она свободна.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Commands&lt;/h3&gt;&lt;p&gt;&lt;b&gt;New action&lt;/b&gt; adds a command line of your own: type it, choose a program file with the first button beside the field, or an installed application with the second. &lt;b&gt;Clone&lt;/b&gt; gives a function or a command a further row for another key; &lt;b&gt;Edit&lt;/b&gt; and &lt;b&gt;Delete&lt;/b&gt; change or remove a command.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Команды&lt;/h3&gt;&lt;p&gt;&lt;b&gt;Новое действие&lt;/b&gt; добавляет вашу собственную команду: введите её, выберите файл программы первой кнопкой рядом с полем или установленное приложение второй. &lt;b&gt;Клонировать&lt;/b&gt; даёт функции или команде ещё одну строку для другого сочетания; &lt;b&gt;Правка&lt;/b&gt; и &lt;b&gt;Удалить&lt;/b&gt; изменяют или удаляют команду.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Files&lt;/h3&gt;&lt;p&gt;Your hotkeys file is keyshortcutrc in ~/.config/zem (or $XDG_CONFIG_HOME/zem); the system one is in the zem directory of the system configuration, /etc/zem for most installations. The window size and layout are kept in ~/.config/zem/zem-admin-hotkeys.conf. The command &lt;tt&gt;zem-hotkeys&lt;/tt&gt; lists, checks and changes the same files from a shell.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Файлы&lt;/h3&gt;&lt;p&gt;Ваш файл горячих клавиш — keyshortcutrc в ~/.config/zem (или $XDG_CONFIG_HOME/zem); системный лежит в каталоге zem системной конфигурации, в большинстве установок это /etc/zem. Размер и вид окна хранятся в ~/.config/zem/zem-admin-hotkeys.conf. Команда &lt;tt&gt;zem-hotkeys&lt;/tt&gt; показывает, проверяет и изменяет те же файлы из командной строки.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Keys&lt;/h3&gt;&lt;p&gt;Select a row and click &lt;b&gt;Assign Key:&lt;/b&gt;, then press the combination. A combination that another row holds is refused; &lt;b&gt;Reassign&lt;/b&gt; in that message moves it to your row and leaves the other without a key. &lt;b&gt;Clear Key&lt;/b&gt; takes the key away. A system key you clear or change is written into your file as &lt;i&gt;Disable&lt;/i&gt;, which switches the system binding of that key off. &lt;b&gt;Revert to System Binding&lt;/b&gt; in the Edit menu gives a function or a command back what the system file gives it, and a key that Reassign took goes back to the row it came from. Every edit can be undone and redone (Ctrl+Z, Ctrl+Shift+Z), wherever the focus is.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Клавиши&lt;/h3&gt;&lt;p&gt;Выберите строку, нажмите &lt;b&gt;Назначить:&lt;/b&gt; и затем комбинацию. Комбинация, занятая другой строкой, отклоняется; &lt;b&gt;Переназначить&lt;/b&gt; в этом сообщении отдаёт её вашей строке, оставляя другую без клавиши. &lt;b&gt;Очистить&lt;/b&gt; убирает клавишу. Системная клавиша, которую вы очистили или изменили, записывается в ваш файл как &lt;i&gt;Disable&lt;/i&gt;, что отключает её системное назначение. &lt;b&gt;Вернуть системное сочетание&lt;/b&gt; в меню «Правка» возвращает функции или команде то, что даёт им системный файл, а клавиша, отнятая переназначением, возвращается в свою строку. Любое изменение можно отменить и повторить (Ctrl+Z, Ctrl+Shift+Z), где бы ни был фокус.&lt;/p&gt;</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Save and Apply&lt;/h3&gt;&lt;p&gt;&lt;b&gt;Save&lt;/b&gt; (Ctrl+S) writes your hotkeys file; only the lines of the keys you edited change, and a file that cannot be written whole is left untouched. &lt;b&gt;Apply&lt;/b&gt; (Ctrl+Return) saves and tells the running window manager to read the file again; a file saved but not yet applied can still be applied. When another program changed the file since it was loaded, you are asked before it is overwritten. &lt;b&gt;Restore&lt;/b&gt; replaces your file with the system one and keeps the old one beside it as keyshortcutrc~.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Сохранение и применение&lt;/h3&gt;&lt;p&gt;&lt;b&gt;Сохранить&lt;/b&gt; (Ctrl+S) записывает ваш файл горячих клавиш; меняются только строки изменённых вами клавиш, а файл, который нельзя записать целиком, остаётся нетронутым. &lt;b&gt;Применить&lt;/b&gt; (Ctrl+Enter) сохраняет и просит работающий оконный менеджер перечитать файл; сохранённый, но ещё не применённый файл по-прежнему можно применить. Если другая программа изменила файл после загрузки, перед перезаписью вас спросят. &lt;b&gt;Восстановить&lt;/b&gt; заменяет ваш файл системным и сохраняет старый рядом как keyshortcutrc~.&lt;/p&gt;</translation>
    </message>
</context>
<context>
    <name>HotkeysCheck</name>
    <message>
        <source>no [ShortCutKeys] section</source>
        <translation>нет раздела [ShortCutKeys]</translation>
    </message>
    <message>
        <source>the key %1 cannot be read</source>
        <translation>сочетание %1 не читается</translation>
    </message>
    <message>
        <source>the key %1 does not count: line %2 binds the same key</source>
        <translation>клавиша %1 не действует: строка %2 назначает ту же клавишу</translation>
    </message>
    <message>
        <source>%1 is no function of the window manager</source>
        <translation>%1 — не функция оконного менеджера</translation>
    </message>
    <message>
        <source>the program of &quot;%1&quot; is not installed</source>
        <translation>программа команды «%1» не установлена</translation>
    </message>
    <message>
        <source>the key %1 alone takes a character from typing</source>
        <translation>сочетание %1 без модификаторов отнимает символ у ввода</translation>
    </message>
</context>
<context>
    <name>HotkeysFile</name>
    <message>
        <source>No file name</source>
        <translation>Нет имени файла</translation>
    </message>
    <message>
        <source>Not a regular file</source>
        <translation>Не обычный файл</translation>
    </message>
    <message>
        <source>The file is larger than 16 MiB</source>
        <translation>Файл больше 16 МиБ</translation>
    </message>
    <message>
        <source>The file holds NUL bytes</source>
        <translation>Файл содержит байты NUL</translation>
    </message>
    <message>
        <source>The key &quot;%1&quot; cannot be written to a hotkeys file</source>
        <translation>Сочетание «%1» нельзя записать в файл горячих клавиш</translation>
    </message>
    <message>
        <source>The action &quot;%1&quot; cannot be written to a hotkeys file</source>
        <translation>Действие «%1» нельзя записать в файл горячих клавиш</translation>
    </message>
    <message>
        <source>No [ShortCutKeys] section</source>
        <translation>Нет раздела [ShortCutKeys]</translation>
    </message>
    <message>
        <source>The command is empty</source>
        <translation>Команда пуста</translation>
    </message>
    <message>
        <source>The command holds the control character %1, which a hotkeys file cannot hold</source>
        <translation>Команда содержит управляющий символ %1, который файл горячих клавиш не может хранить</translation>
    </message>
    <message>
        <source>The file name holds control characters</source>
        <translation>Имя файла содержит управляющие символы</translation>
    </message>
    <message>
        <source>The file name cannot be written in the locale&apos;s encoding</source>
        <translation>Имя файла нельзя записать в кодировке локали</translation>
    </message>
    <message>
        <source>The file name is too long to be handed to the window manager</source>
        <translation>Имя файла слишком длинное, чтобы передать его оконному менеджеру</translation>
    </message>
    <message>
        <source>%1 is a symbolic link of another account</source>
        <translation>%1 — символическая ссылка другой учётной записи</translation>
    </message>
    <message>
        <source>%1 is read-only: its owner&apos;s write permission is off</source>
        <translation>%1 доступен только для чтения: у владельца нет права записи</translation>
    </message>
    <message>
        <source>%1 belongs to another account</source>
        <translation>%1 принадлежит другой учётной записи</translation>
    </message>
    <message>
        <source>%1 has %2 hard links; replacing it would part it from the others</source>
        <translation>У %1 %2 жёстких ссылки; замена отделила бы его от остальных</translation>
    </message>
    <message>
        <source>The file would be larger than 16 MiB</source>
        <translation>Файл стал бы больше 16 МиБ</translation>
    </message>
    <message>
        <source>Another program is writing a hotkeys file in %1; gave up waiting after %2 seconds</source>
        <translation>Другая программа записывает файл горячих клавиш в %1; ожидание прекращено через %2 с</translation>
    </message>
</context>
<context>
    <name>KKeySequenceButton</name>
    <message>
        <source>Unsupported Key</source>
        <translation>Неподдерживаемая клавиша</translation>
    </message>
    <message>
        <source>The key you just pressed is not supported by Qt.</source>
        <translation>Только что нажатая клавиша не поддерживается Qt.</translation>
    </message>
    <message>
        <source>Clear the key</source>
        <translation>Очистить клавишу</translation>
    </message>
</context>
<context>
    <name>KKeySequenceWidgetPrivate</name>
    <message>
        <source>Input</source>
        <translation>Ввод</translation>
    </message>
    <message>
        <source>None</source>
        <translation>Нет</translation>
    </message>
</context>
<context>
    <name>KeysConfForm</name>
    <message>
        <source>Window decoration (on/off)</source>
        <translation>Оформление окон (вкл./выкл.)</translation>
    </message>
    <message>
        <source>toggle switch of a border</source>
        <translation>включить/выключить рамку</translation>
    </message>
    <message>
        <source>toggle switch of a border edge</source>
        <translation>включить/выключить край рамки</translation>
    </message>
    <message>
        <source>toggle switch of a minimize button</source>
        <translation>включить/выключить кнопку сворачивания</translation>
    </message>
    <message>
        <source>toggle switch of a restore button</source>
        <translation>включить/выключить кнопку восстановления</translation>
    </message>
    <message>
        <source>toggle switch of a close button</source>
        <translation>включить/выключить кнопку закрытия</translation>
    </message>
    <message>
        <source>toggle switch of a control button</source>
        <translation>включить/выключить кнопку управления</translation>
    </message>
    <message>
        <source>toggle switch of a taskbar button</source>
        <translation>включить/выключить кнопку на панели задач</translation>
    </message>
    <message>
        <source>toggle switch of a title bar</source>
        <translation>включить/выключить заголовок</translation>
    </message>
    <message>
        <source>toggle switch of all decorations</source>
        <translation>включить/выключить всё оформление</translation>
    </message>
    <message>
        <source>Taskbar</source>
        <translation>Панель задач</translation>
    </message>
    <message>
        <source>move the taskbar to bottom</source>
        <translation>переместить панель задач вниз</translation>
    </message>
    <message>
        <source>move the taskbar to top</source>
        <translation>переместить панель задач вверх</translation>
    </message>
    <message>
        <source>move the taskbar to left</source>
        <translation>переместить панель задач влево</translation>
    </message>
    <message>
        <source>move the taskbar to right</source>
        <translation>переместить панель задач вправо</translation>
    </message>
    <message>
        <source>toggle switch of TaskbarAutoHide</source>
        <translation>включить/выключить автоскрытие панели задач</translation>
    </message>
    <message>
        <source>enable TaskbarAutoHide</source>
        <translation>включить автоскрытие панели задач</translation>
    </message>
    <message>
        <source>disable TaskbarAutoHide</source>
        <translation>выключить автоскрытие панели задач</translation>
    </message>
    <message>
        <source>toggle switch of the taskbar show/hide</source>
        <translation>показать/скрыть панель задач</translation>
    </message>
    <message>
        <source>show the taskbar</source>
        <translation>показать панель задач</translation>
    </message>
    <message>
        <source>hide the taskbar</source>
        <translation>скрыть панель задач</translation>
    </message>
    <message>
        <source>appear the taskbar when TaskbarAutoHide</source>
        <translation>показать автоматически скрытую панель задач</translation>
    </message>
    <message>
        <source>disappear the taskbar when TaskbarAutoHide</source>
        <translation>убрать автоматически скрываемую панель задач</translation>
    </message>
    <message>
        <source>toggle switch of the taskbar top/botton</source>
        <translation>панель задач поверх/под всеми окнами</translation>
    </message>
    <message>
        <source>taskbar on top of all</source>
        <translation>панель задач поверх всех окон</translation>
    </message>
    <message>
        <source>taskbar on bottom of all</source>
        <translation>панель задач под всеми окнами</translation>
    </message>
    <message>
        <source>Desktop Icon</source>
        <translation>Значки рабочего стола</translation>
    </message>
    <message>
        <source>line up icons</source>
        <translation>выровнять значки</translation>
    </message>
    <message>
        <source>order icons</source>
        <translation>упорядочить значки</translation>
    </message>
    <message>
        <source>select all icons</source>
        <translation>выделить все значки</translation>
    </message>
    <message>
        <source>find icons</source>
        <translation>найти значки</translation>
    </message>
    <message>
        <source>execute the icon</source>
        <translation>запустить значок</translation>
    </message>
    <message>
        <source>execute the icon with</source>
        <translation>запустить значок с помощью</translation>
    </message>
    <message>
        <source>send the icon by email</source>
        <translation>отправить значок по почте</translation>
    </message>
    <message>
        <source>delete the icon</source>
        <translation>удалить значок</translation>
    </message>
    <message>
        <source>show icon properties</source>
        <translation>показать свойства значка</translation>
    </message>
    <message>
        <source>create an icon</source>
        <translation>создать значок</translation>
    </message>
    <message>
        <source>create a text file</source>
        <translation>создать текстовый файл</translation>
    </message>
    <message>
        <source>create a session script file</source>
        <translation>создать файл сценария сеанса</translation>
    </message>
    <message>
        <source>cretae a folder</source>
        <translation>создать папку</translation>
    </message>
    <message>
        <source>send icon to home folder</source>
        <translation>отправить значок в домашнюю папку</translation>
    </message>
    <message>
        <source>send icon to My documents folder</source>
        <translation>отправить значок в папку «Мои документы»</translation>
    </message>
    <message>
        <source>send icon trash can</source>
        <translation>отправить значок в корзину</translation>
    </message>
    <message>
        <source>send icon start menu</source>
        <translation>отправить значок в меню «Пуск»</translation>
    </message>
    <message>
        <source>send icon to toolbar</source>
        <translation>отправить значок на панель инструментов</translation>
    </message>
    <message>
        <source>send icon to folder</source>
        <translation>отправить значок в папку</translation>
    </message>
    <message>
        <source>cut icon(s)</source>
        <translation>вырезать значки</translation>
    </message>
    <message>
        <source>copy icon(s)</source>
        <translation>копировать значки</translation>
    </message>
    <message>
        <source>paste icon(s)</source>
        <translation>вставить значки</translation>
    </message>
    <message>
        <source>navigate up</source>
        <translation>перейти вверх</translation>
    </message>
    <message>
        <source>navigate down</source>
        <translation>перейти вниз</translation>
    </message>
    <message>
        <source>navigate left</source>
        <translation>перейти влево</translation>
    </message>
    <message>
        <source>navigate right</source>
        <translation>перейти вправо</translation>
    </message>
    <message>
        <source>rename icon</source>
        <translation>переименовать значок</translation>
    </message>
    <message>
        <source>undo last operation on desktop</source>
        <translation>отменить последнее действие на рабочем столе</translation>
    </message>
    <message>
        <source>Keyboard</source>
        <translation>Клавиатура</translation>
    </message>
    <message>
        <source>switch to base keyboard</source>
        <translation>переключиться на основную раскладку</translation>
    </message>
    <message>
        <source>switch to alt keyboard</source>
        <translation>переключиться на дополнительную раскладку</translation>
    </message>
    <message>
        <source>switch keyboard</source>
        <translation>переключить раскладку</translation>
    </message>
    <message>
        <source>Pager</source>
        <translation>Пейджер</translation>
    </message>
    <message>
        <source>toggle switch of the pager show/hide</source>
        <translation>показать/скрыть пейджер</translation>
    </message>
    <message>
        <source>show the pager</source>
        <translation>показать пейджер</translation>
    </message>
    <message>
        <source>hide the pager</source>
        <translation>скрыть пейджер</translation>
    </message>
    <message>
        <source>toggle switch of the pager top/botton</source>
        <translation>пейджер поверх/под всеми окнами</translation>
    </message>
    <message>
        <source>pager on top of all</source>
        <translation>пейджер поверх всех окон</translation>
    </message>
    <message>
        <source>pager on botton of all</source>
        <translation>пейджер под всеми окнами</translation>
    </message>
    <message>
        <source>add row to the pager</source>
        <translation>добавить строку в пейджер</translation>
    </message>
    <message>
        <source>remove row from the pager</source>
        <translation>удалить строку из пейджера</translation>
    </message>
    <message>
        <source>add column to the pager</source>
        <translation>добавить столбец в пейджер</translation>
    </message>
    <message>
        <source>remove column from the pager</source>
        <translation>удалить столбец из пейджера</translation>
    </message>
    <message>
        <source>update the pager</source>
        <translation>обновить пейджер</translation>
    </message>
    <message>
        <source>maximize the pager (fullscreen)</source>
        <translation>развернуть пейджер (во весь экран)</translation>
    </message>
    <message>
        <source>restore the pager (small window)</source>
        <translation>восстановить пейджер (маленькое окно)</translation>
    </message>
    <message>
        <source>toggle pager fullscreen mode</source>
        <translation>переключить полноэкранный режим пейджера</translation>
    </message>
    <message>
        <source>Paging</source>
        <translation>Переключение страниц</translation>
    </message>
    <message>
        <source>switch to the left page</source>
        <translation>перейти на левую страницу</translation>
    </message>
    <message>
        <source>switch to the right page</source>
        <translation>перейти на правую страницу</translation>
    </message>
    <message>
        <source>switch to the up page</source>
        <translation>перейти на верхнюю страницу</translation>
    </message>
    <message>
        <source>switch to the down page</source>
        <translation>перейти на нижнюю страницу</translation>
    </message>
    <message>
        <source>Search panel</source>
        <translation>Панель поиска</translation>
    </message>
    <message>
        <source>toggle search panel</source>
        <translation>показать/скрыть панель поиска</translation>
    </message>
    <message>
        <source>Menu</source>
        <translation>Меню</translation>
    </message>
    <message>
        <source>pop up the start menu</source>
        <translation>открыть меню «Пуск»</translation>
    </message>
    <message>
        <source>pop up the desktop menu</source>
        <translation>открыть меню рабочего стола</translation>
    </message>
    <message>
        <source>pop up a window ctrl menu</source>
        <translation>открыть меню окна</translation>
    </message>
    <message>
        <source>pop down a menu</source>
        <translation>закрыть меню</translation>
    </message>
    <message>
        <source>pop down all menus</source>
        <translation>закрыть все меню</translation>
    </message>
    <message>
        <source>Rearrangement</source>
        <translation>Упорядочивание</translation>
    </message>
    <message>
        <source>overlap all windows</source>
        <translation>расположить все окна каскадом</translation>
    </message>
    <message>
        <source>overlap windows within the screen</source>
        <translation>расположить окна экрана каскадом</translation>
    </message>
    <message>
        <source>horizontally tile all windows</source>
        <translation>расположить все окна по горизонтали</translation>
    </message>
    <message>
        <source>horizontally tile windows within the screen</source>
        <translation>расположить окна экрана по горизонтали</translation>
    </message>
    <message>
        <source>vertically tile all windows</source>
        <translation>расположить все окна по вертикали</translation>
    </message>
    <message>
        <source>vertically tile windows within the screen</source>
        <translation>расположить окна экрана по вертикали</translation>
    </message>
    <message>
        <source>tile all windows in matrix</source>
        <translation>расположить все окна сеткой</translation>
    </message>
    <message>
        <source>tile windows in matrix within the screen</source>
        <translation>расположить окна экрана сеткой</translation>
    </message>
    <message>
        <source>minimize all windows</source>
        <translation>свернуть все окна</translation>
    </message>
    <message>
        <source>minimize windows within the screen</source>
        <translation>свернуть окна экрана</translation>
    </message>
    <message>
        <source>minimize/restore all windows</source>
        <translation>свернуть/восстановить все окна</translation>
    </message>
    <message>
        <source>minimize/restore windows within the screen</source>
        <translation>свернуть/восстановить окна экрана</translation>
    </message>
    <message>
        <source>restore all windows</source>
        <translation>восстановить все окна</translation>
    </message>
    <message>
        <source>restore windows within the screen</source>
        <translation>восстановить окна экрана</translation>
    </message>
    <message>
        <source>close all windows</source>
        <translation>закрыть все окна</translation>
    </message>
    <message>
        <source>close windows within the screen</source>
        <translation>закрыть окна экрана</translation>
    </message>
    <message>
        <source>Window placement</source>
        <translation>Размещение окон</translation>
    </message>
    <message>
        <source>move a window</source>
        <translation>переместить окно</translation>
    </message>
    <message>
        <source>move a window to the next screen</source>
        <translation>переместить окно на следующий экран</translation>
    </message>
    <message>
        <source>move a window to the previous screen</source>
        <translation>переместить окно на предыдущий экран</translation>
    </message>
    <message>
        <source>resize a window</source>
        <translation>изменить размер окна</translation>
    </message>
    <message>
        <source>minimize a window</source>
        <translation>свернуть окно</translation>
    </message>
    <message>
        <source>restore a window size</source>
        <translation>восстановить размер окна</translation>
    </message>
    <message>
        <source>maximize a window</source>
        <translation>развернуть окно</translation>
    </message>
    <message>
        <source>maximize/restore a window</source>
        <translation>развернуть/восстановить окно</translation>
    </message>
    <message>
        <source>fullscreen/restore a window</source>
        <translation>окно во весь экран/восстановить</translation>
    </message>
    <message>
        <source>swallow to tray</source>
        <translation>убрать в системный лоток</translation>
    </message>
    <message>
        <source>move taskbar btn left(up)</source>
        <translation>сдвинуть кнопку на панели задач влево (вверх)</translation>
    </message>
    <message>
        <source>move taskbar btn right(down)</source>
        <translation>сдвинуть кнопку на панели задач вправо (вниз)</translation>
    </message>
    <message>
        <source>expand a window to all directions</source>
        <translation>растянуть окно во все стороны</translation>
    </message>
    <message>
        <source>expand a window to a left direction</source>
        <translation>растянуть окно влево</translation>
    </message>
    <message>
        <source>expand a window to a right direction</source>
        <translation>растянуть окно вправо</translation>
    </message>
    <message>
        <source>expand a window to an up direction</source>
        <translation>растянуть окно вверх</translation>
    </message>
    <message>
        <source>expand a window to a down direction</source>
        <translation>растянуть окно вниз</translation>
    </message>
    <message>
        <source>snap a window to a right edge</source>
        <translation>прикрепить окно к правому краю</translation>
    </message>
    <message>
        <source>snap a window to a left edge</source>
        <translation>прикрепить окно к левому краю</translation>
    </message>
    <message>
        <source>snap a window to a bottom right corner</source>
        <translation>прикрепить окно к правому нижнему углу</translation>
    </message>
    <message>
        <source>snap a window to a botton left corner</source>
        <translation>прикрепить окно к левому нижнему углу</translation>
    </message>
    <message>
        <source>snap a window to a top right corner</source>
        <translation>прикрепить окно к правому верхнему углу</translation>
    </message>
    <message>
        <source>snap a window to a top left corner</source>
        <translation>прикрепить окно к левому верхнему углу</translation>
    </message>
    <message>
        <source>snap a window to a top edge</source>
        <translation>прикрепить окно к верхнему краю</translation>
    </message>
    <message>
        <source>snap a window to a bottom edge</source>
        <translation>прикрепить окно к нижнему краю</translation>
    </message>
    <message>
        <source>raise a window</source>
        <translation>поднять окно</translation>
    </message>
    <message>
        <source>lower a window</source>
        <translation>опустить окно</translation>
    </message>
    <message>
        <source>close a window (recommend)</source>
        <translation>закрыть окно (рекомендуется)</translation>
    </message>
    <message>
        <source>close all similar window</source>
        <translation>закрыть все похожие окна</translation>
    </message>
    <message>
        <source>close a window forcely</source>
        <translation>принудительно закрыть окно</translation>
    </message>
    <message>
        <source>toggle switch of an ONTOP attribute</source>
        <translation>включить/выключить атрибут «поверх всех»</translation>
    </message>
    <message>
        <source>toggle switch of an ONBOTTOM attribute</source>
        <translation>включить/выключить атрибут «под всеми»</translation>
    </message>
    <message>
        <source>toggle switch of a STICKY attribute</source>
        <translation>включить/выключить атрибут «на всех рабочих столах»</translation>
    </message>
    <message>
        <source>toggle switch of a focus attribute</source>
        <translation>включить/выключить атрибут фокуса</translation>
    </message>
    <message>
        <source>Window focus</source>
        <translation>Фокус окон</translation>
    </message>
    <message>
        <source>switch an active window</source>
        <translation>переключить активное окно</translation>
    </message>
    <message>
        <source>switch back an active window</source>
        <translation>переключить активное окно назад</translation>
    </message>
    <message>
        <source>change an active window</source>
        <translation>сменить активное окно</translation>
    </message>
    <message>
        <source>change back an active window</source>
        <translation>сменить активное окно назад</translation>
    </message>
    <message>
        <source>change an active window within a screen</source>
        <translation>сменить активное окно в пределах экрана</translation>
    </message>
    <message>
        <source>change back an active window in a screen</source>
        <translation>сменить активное окно экрана назад</translation>
    </message>
    <message>
        <source>make the desktop active</source>
        <translation>сделать рабочий стол активным</translation>
    </message>
    <message>
        <source>Window Manager</source>
        <translation>Оконный менеджер</translation>
    </message>
    <message>
        <source>restart zem-wm</source>
        <translation>перезапустить zem-wm</translation>
    </message>
    <message>
        <source>lock screen</source>
        <translation>заблокировать экран</translation>
    </message>
    <message>
        <source>standby</source>
        <translation>ждущий режим</translation>
    </message>
    <message>
        <source>suspend</source>
        <translation>приостановить</translation>
    </message>
    <message>
        <source>hibernate</source>
        <translation>спящий режим</translation>
    </message>
    <message>
        <source>change user</source>
        <translation>сменить пользователя</translation>
    </message>
    <message>
        <source>change/switch user</source>
        <translation>сменить/переключить пользователя</translation>
    </message>
    <message>
        <source>postpone session</source>
        <translation>отложить сеанс</translation>
    </message>
    <message>
        <source>suspend screensaver</source>
        <translation>приостановить хранитель экрана</translation>
    </message>
    <message>
        <source>resume screensaver</source>
        <translation>возобновить хранитель экрана</translation>
    </message>
    <message>
        <source>exit zem-wm</source>
        <translation>выйти из zem-wm</translation>
    </message>
    <message>
        <source>reboot</source>
        <translation>перезагрузить</translation>
    </message>
    <message>
        <source>shutdown</source>
        <translation>выключить</translation>
    </message>
    <message>
        <source>dpms on</source>
        <translation>энергосбережение экрана вкл.</translation>
    </message>
    <message>
        <source>dpms off</source>
        <translation>энергосбережение экрана выкл.</translation>
    </message>
    <message>
        <source>dpms toggle</source>
        <translation>переключить энергосбережение экрана</translation>
    </message>
    <message>
        <source>previous wallpaper</source>
        <translation>предыдущие обои</translation>
    </message>
    <message>
        <source>next wallpaper</source>
        <translation>следующие обои</translation>
    </message>
    <message>
        <source>Command Keybindings</source>
        <extracomment>The group row under which the user&apos;s command entries are listed.</extracomment>
        <translation>Сочетания для команд</translation>
    </message>
    <message>
        <source>Zem hotkeys editor</source>
        <translation>Редактор горячих клавиш Zem</translation>
    </message>
    <message>
        <source>user</source>
        <translation>пользователь</translation>
    </message>
    <message>
        <source>system</source>
        <translation>система</translation>
    </message>
    <message>
        <source>Action</source>
        <translation>Действие</translation>
    </message>
    <message>
        <source>Current Key</source>
        <translation>Текущее сочетание</translation>
    </message>
    <message>
        <source>zem-wm function</source>
        <translation>функция zem-wm</translation>
    </message>
    <message>
        <source>Source</source>
        <translation>Источник</translation>
    </message>
    <message>
        <source>Choose a Key for the Selected Action</source>
        <extracomment>The title of the key panel below the tree.</extracomment>
        <translation>Выберите сочетание для выбранного действия</translation>
    </message>
    <message>
        <source>Assign Key:</source>
        <translation>Назначить:</translation>
    </message>
    <message>
        <source>Clear Key</source>
        <translation>Очистить</translation>
    </message>
    <message>
        <source>&amp;New file</source>
        <translation>&amp;Новый файл</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>&amp;Открыть…</translation>
    </message>
    <message>
        <source>&amp;Restore...</source>
        <translation>&amp;Восстановить…</translation>
    </message>
    <message>
        <source>Restore user&apos;s keyshortcutrc file from system one</source>
        <translation>Восстановить файл keyshortcutrc пользователя из системного</translation>
    </message>
    <message>
        <source>&amp;Save</source>
        <translation>&amp;Сохранить</translation>
    </message>
    <message>
        <source>Save &amp;As...</source>
        <translation>Сохранить &amp;как…</translation>
    </message>
    <message>
        <source>E&amp;xit</source>
        <translation>В&amp;ыход</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Применить</translation>
    </message>
    <message>
        <source>&amp;New action</source>
        <translation>Новое &amp;действие</translation>
    </message>
    <message>
        <source>&amp;Clone</source>
        <translation>&amp;Клонировать</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>&amp;Правка</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>&amp;Удалить</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Файл</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Отменить</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Повторить</translation>
    </message>
    <message>
        <source>Revert to System Binding</source>
        <translation>Вернуть системное сочетание</translation>
    </message>
    <message>
        <source>Handbook</source>
        <translation>Руководство</translation>
    </message>
    <message>
        <source>Actions toolbar</source>
        <translation>Панель действий</translation>
    </message>
    <message>
        <source>Add command %1</source>
        <translation>Добавить команду %1</translation>
    </message>
    <message>
        <source>Edit command %1</source>
        <translation>Изменить команду %1</translation>
    </message>
    <message>
        <source>Clone %1</source>
        <translation>Клонировать %1</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Удаление</translation>
    </message>
    <message>
        <source>Are you sure to delete this action?</source>
        <translation>Удалить это действие?</translation>
    </message>
    <message>
        <source>Delete %1</source>
        <translation>Удалить %1</translation>
    </message>
    <message>
        <source>Revert %1 to the system binding</source>
        <translation>Вернуть системное сочетание для «%1»</translation>
    </message>
    <message numerus="yes">
        <source>%1 stays with the row that holds it now.</source>
        <translation>
            <numerusform>%1 остаётся у строки, которая его сейчас занимает.</numerusform>
            <numerusform>%1 остаются у строк, которые их сейчас занимают.</numerusform>
            <numerusform>%1 остаются у строк, которые их сейчас занимают.</numerusform>
        </translation>
    </message>
    <message>
        <source>Save ?</source>
        <translation>Сохранить?</translation>
    </message>
    <message>
        <source>Save previous changes?</source>
        <translation>Сохранить изменения?</translation>
    </message>
    <message>
        <source>Select hotkeys file</source>
        <translation>Выберите файл горячих клавиш</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Ошибка</translation>
    </message>
    <message>
        <source>Can&apos;t create file </source>
        <translation>Не удаётся создать файл </translation>
    </message>
    <message>
        <source>Can&apos;t copy %1
to %2</source>
        <translation>Не удаётся скопировать %1
в %2</translation>
    </message>
    <message>
        <source>No file name</source>
        <translation>Нет имени файла</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Внимание</translation>
    </message>
    <message>
        <source>Can&apos;t parse file:
%1</source>
        <translation>Не удаётся прочитать файл:
%1</translation>
    </message>
    <message>
        <source>Can&apos;t save in file </source>
        <translation>Не удаётся сохранить в файл </translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Восстановление</translation>
    </message>
    <message>
        <source>Replace your hotkeys file with the system one?
All your own bindings in it will be lost.</source>
        <translation>Заменить ваш файл горячих клавиш системным?
Все ваши собственные сочетания в нём будут потеряны.</translation>
    </message>
    <message>
        <source>All changes will be lost. Save them?</source>
        <translation>Все изменения будут потеряны. Сохранить их?</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Предупреждение</translation>
    </message>
    <message>
        <source>You current file is &quot;%1&quot;.
After restart zem-wm will use &quot;%2&quot;.</source>
        <translation>Текущий файл — «%1».
После перезапуска zem-wm будет использовать «%2».</translation>
    </message>
    <message>
        <source>The window manager could not be told to reload %1.</source>
        <translation>Не удалось попросить оконный менеджер перечитать %1.</translation>
    </message>
    <message>
        <source>Reassign %1 from %2 to %3</source>
        <translation>Переназначить %1 с «%2» на «%3»</translation>
    </message>
    <message>
        <source>Assign %1 to %2</source>
        <translation>Назначить %1 для «%2»</translation>
    </message>
    <message>
        <source>command</source>
        <extracomment>Names a command entry in &quot;to the %2 action (%3)&quot;, where %3 is its command line.</extracomment>
        <translation>команда</translation>
    </message>
    <message>
        <source>Whoopsie! Key conflict.</source>
        <translation>Ой! Конфликт сочетаний.</translation>
    </message>
    <message>
        <source>Ouch! The %1 key combination has already been allocated
to the %2 action (%3).

Please choose a unique key combination.</source>
        <translation>Ой! Сочетание %1 уже назначено
действию %2 (%3).

Выберите другое сочетание.</translation>
    </message>
    <message>
        <source>Reassign</source>
        <extracomment>Moves the key combination to the edited row, leaving the other one without a key.</extracomment>
        <translation>Переназначить</translation>
    </message>
    <message>
        <source>Clear the key of %1</source>
        <translation>Очистить сочетание «%1»</translation>
    </message>
    <message>
        <source>File changed on disk</source>
        <translation>Файл изменён на диске</translation>
    </message>
    <message>
        <source>%1 was deleted or renamed since it was loaded.
It is written anew.</source>
        <translation>%1 был удалён или переименован после загрузки.
Он будет записан заново.</translation>
    </message>
    <message>
        <source>%1 was changed by another program since it was loaded.
Overwrite it with your edits, reload it and drop them, or cancel?</source>
        <translation>%1 изменён другой программой после загрузки.
Перезаписать его вашими изменениями, перечитать и отбросить их или отменить?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>Перезаписать</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Перечитать</translation>
    </message>
    <message>
        <source>The window manager cannot be told to use this file.
Save it under another name.</source>
        <translation>Оконному менеджеру нельзя передать этот файл.
Сохраните его под другим именем.</translation>
    </message>
    <message>
        <source>The system hotkeys file %1 was changed by another program since it was loaded.
Overwrite %2 with your edits, reload both and drop them, or cancel?</source>
        <translation>Системный файл горячих клавиш %1 был изменён другой программой после загрузки.
Перезаписать %2 вашими правками, перезагрузить оба и отбросить их или отменить?</translation>
    </message>
    <message>
        <source>Saved %1</source>
        <translation>%1 сохранён</translation>
    </message>
    <message>
        <source>The window manager was told to reload %1</source>
        <translation>Оконному менеджеру сказано перечитать %1</translation>
    </message>
    <message>
        <source>Key of the selected action</source>
        <extracomment>Spoken by screen readers for the key recorder of the key panel.</extracomment>
        <translation>Клавиша выбранного действия</translation>
    </message>
    <message>
        <source>Bindings</source>
        <extracomment>Spoken by screen readers for the tree of bindings.</extracomment>
        <translation>Назначения</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Usage: zem-admin-hotkeys filepath - open/create file as hotkeys coll
</source>
        <translation>Использование: zem-admin-hotkeys файл — открыть/создать файл горячих клавиш
</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Предупреждение</translation>
    </message>
    <message>
        <source>File %1 doesn&apos;t exist. Create?</source>
        <translation>Файл %1 не существует. Создать?</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Внимание</translation>
    </message>
    <message>
        <source>Can&apos;t open/create file:
%1</source>
        <translation>Не удаётся открыть/создать файл:
%1</translation>
    </message>
    <message>
        <source>Can&apos;t parse file:
%1</source>
        <translation>Не удаётся прочитать файл:
%1</translation>
    </message>
    <message>
        <source>the file name is not valid in the locale&apos;s encoding</source>
        <translation>имя файла недопустимо в кодировке локали</translation>
    </message>
    <message>
        <source>an editor already runs on this display and was brought forward; %1 was not opened there</source>
        <translation>на этом дисплее уже работает редактор, он выведен на передний план; %1 в нём не открыт</translation>
    </message>
</context>
<context>
    <name>SelectCommandDialog</name>
    <message>
        <source>Choose a program file</source>
        <translation>Выбрать файл программы</translation>
    </message>
    <message>
        <source>Choose an application from the menu</source>
        <translation>Выбрать приложение из меню</translation>
    </message>
    <message>
        <source>Select Command</source>
        <translation>Выбор команды</translation>
    </message>
    <message>
        <source>Open executable</source>
        <translation>Открыть исполняемый файл</translation>
    </message>
    <message>
        <source>File doesn&apos;t exist</source>
        <translation>Файл не существует</translation>
    </message>
    <message>
        <source>File you have selected doesn&apos;t exist. Do you want to choose another one?</source>
        <translation>Выбранный файл не существует. Выбрать другой?</translation>
    </message>
    <message>
        <source>File isn&apos;t executable</source>
        <translation>Файл не исполняемый</translation>
    </message>
    <message>
        <source>You can&apos;t exec selected file. Do you want to choose another one?</source>
        <translation>Выбранный файл нельзя запустить. Выбрать другой?</translation>
    </message>
    <message>
        <source>Attention</source>
        <translation>Внимание</translation>
    </message>
</context>
<context>
    <name>ZemHelpMenu</name>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Справка</translation>
    </message>
    <message>
        <source>About Zem hotkeys editor</source>
        <translation>О редакторе горячих клавиш Zem</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>О Qt</translation>
    </message>
    <message>
        <source>&lt;h3&gt;Zem hotkeys editor %1&lt;/h3&gt;&lt;p&gt;Edits the keyboard shortcuts of the zem-wm window manager.&lt;/p&gt;</source>
        <translation>&lt;h3&gt;Редактор горячих клавиш Zem %1&lt;/h3&gt;&lt;p&gt;Изменяет сочетания клавиш оконного менеджера zem-wm.&lt;/p&gt;</translation>
    </message>
</context>
<context>
    <name>ZemHotkeys</name>
    <message>
        <source>unknown option %1</source>
        <translation>неизвестный параметр %1</translation>
    </message>
    <message>
        <source>cannot read the key &quot;%1&quot;</source>
        <translation>не удаётся прочитать сочетание «%1»</translation>
    </message>
    <message>
        <source>no [ShortCutKeys] section</source>
        <translation>нет раздела [ShortCutKeys]</translation>
    </message>
    <message>
        <source>%1 is no function of the window manager</source>
        <translation>%1 — не функция оконного менеджера</translation>
    </message>
    <message>
        <source>%1 already does %2</source>
        <translation>%1 уже выполняет %2</translation>
    </message>
    <message>
        <source>%1 is held by %2; --force takes it over</source>
        <translation>%1 занято «%2»; --force перехватывает его</translation>
    </message>
    <message>
        <source>no binding holds %1</source>
        <translation>%1 ничем не занято</translation>
    </message>
    <message>
        <source>no X display; the window manager cannot be told</source>
        <translation>нет X-дисплея; оконному менеджеру нельзя сообщить</translation>
    </message>
    <message>
        <source>the X display refused the command</source>
        <translation>X-дисплей отклонил команду</translation>
    </message>
    <message>
        <source>--file needs a file name</source>
        <translation>для --file нужно имя файла</translation>
    </message>
    <message>
        <source>the argument %1 is not valid in the locale&apos;s encoding</source>
        <translation>аргумент %1 недопустим в кодировке локали</translation>
    </message>
</context>
<context>
    <name>ZemMenuDialog</name>
    <message>
        <source>Multimedia</source>
        <translation>Мультимедиа</translation>
    </message>
    <message>
        <source>Development</source>
        <translation>Разработка</translation>
    </message>
    <message>
        <source>Education</source>
        <translation>Образование</translation>
    </message>
    <message>
        <source>Games</source>
        <translation>Игры</translation>
    </message>
    <message>
        <source>Graphics</source>
        <translation>Графика</translation>
    </message>
    <message>
        <source>Internet</source>
        <translation>Интернет</translation>
    </message>
    <message>
        <source>Office</source>
        <translation>Офис</translation>
    </message>
    <message>
        <source>Science</source>
        <translation>Наука</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Настройки</translation>
    </message>
    <message>
        <source>System</source>
        <translation>Система</translation>
    </message>
    <message>
        <source>Accessories</source>
        <translation>Стандартные</translation>
    </message>
    <message>
        <source>Other</source>
        <translation>Прочие</translation>
    </message>
    <message>
        <source>Choose an application</source>
        <translation>Выбор приложения</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>Фильтр</translation>
    </message>
    <message>
        <source>No installed applications were found. Applications appear here when their desktop entries are installed in an applications directory.</source>
        <translation>Установленные приложения не найдены. Приложения появляются здесь, когда их файлы .desktop установлены в каталог applications.</translation>
    </message>
</context>
<context>
    <name>commandDialog</name>
    <message>
        <source>Command:</source>
        <translation>Команда:</translation>
    </message>
    <message>
        <source>...</source>
        <translation>…</translation>
    </message>
</context>
</TS>

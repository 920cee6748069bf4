#include "handbook.h"

#include <QDialogButtonBox>
#include <QTextBrowser>
#include <QVBoxLayout>

Handbook::Handbook(QWidget* parent) : QDialog(parent)
{
    setObjectName(QStringLiteral("handbook"));
    setWindowTitle(tr("Zem hotkeys editor Handbook"));
    auto* text = new QTextBrowser(this);
    text->setOpenExternalLinks(false);
    text->setHtml(
        tr("<h2>Zem hotkeys editor</h2>"
           "<p>The editor shows every function of the zem-wm window manager in its group, and below "
           "<i>Command Keybindings</i> the command lines of your own, each with its key. "
           "<b>Current Key</b> is the key combination that starts it; <b>Source</b> says whether the "
           "binding comes from your own hotkeys file (<i>user</i>) or from the system-wide one "
           "(<i>system</i>), which gives every user's defaults.</p>") +
        tr("<h3>Keys</h3>"
           "<p>Select a row and click <b>Assign Key:</b>, then press the combination. A combination "
           "that another row holds is refused; <b>Reassign</b> in that message moves it to your row "
           "and leaves the other without a key. <b>Clear Key</b> takes the key away. A system key "
           "you clear or change is written into your file as <i>Disable</i>, which switches the "
           "system binding of that key off. <b>Revert to System Binding</b> in the Edit menu gives "
           "a function or a command back what the system file gives it, and a key that Reassign "
           "took goes back to the row it came from. Every edit can be undone and redone "
           "(Ctrl+Z, Ctrl+Shift+Z), wherever the focus is.</p>") +
        tr("<h3>Finding</h3>"
           "<p>Type into the field above the tree (Ctrl+F) to see only the rows whose action, "
           "function, command or key holds the text; a key may be typed as Ctrl+Alt+T or "
           "Ctrl|Alt|t. <b>Find key</b> records a combination and shows who holds it, or says that "
           "it is free.</p>") +
        tr("<h3>Commands</h3>"
           "<p><b>New action</b> adds a command line of your own: type it, choose a program file "
           "with the first button beside the field, or an installed application with the second. "
           "<b>Clone</b> gives a function or a command a further row for another key; <b>Edit</b> "
           "and <b>Delete</b> change or remove a command.</p>") +
        tr("<h3>Save and Apply</h3>"
           "<p><b>Save</b> (Ctrl+S) writes your hotkeys file; only the lines of the keys you edited "
           "change, and a file that cannot be written whole is left untouched. <b>Apply</b> "
           "(Ctrl+Return) saves and tells the running window manager to read the file again; a file "
           "saved but not yet applied can still be applied. When another program changed the file "
           "since it was loaded, you are asked before it is overwritten. <b>Restore</b> replaces "
           "your file with the system one and keeps the old one beside it as keyshortcutrc~.</p>") +
        tr("<h3>Files</h3>"
           "<p>Your hotkeys file is keyshortcutrc in ~/.config/zem (or $XDG_CONFIG_HOME/zem); the "
           "system one is in the zem directory of the system configuration, /etc/zem for most "
           "installations. The window size and layout are kept in "
           "~/.config/zem/zem-admin-hotkeys.conf. The command <tt>zem-hotkeys</tt> lists, checks and "
           "changes the same files from a shell.</p>"));
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Close, this);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::close);
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(text);
    layout->addWidget(buttons);
    resize(560, 520);
}

#pragma once

#include "keysconfform.h"

#include <QString>
#include <QStringList>

#include <memory>

class QAction;
class QTreeWidget;
class QTreeWidgetItem;

// Bound rows in tree order: "FUNCTION=key@source", "cmd:command line=key@source".
QStringList boundRows(QTreeWidget* tree);

// A main window over hotkeys files written by the test, as start-up would make it.
class FormFixture
{
public:
    static QString userPath();
    static QString systemPath();

    // Writes the user's file (and the system file) from their entries and opens the user's
    // file; "[ShortCutKeys]\n" is put in front of each.
    bool openUserFile(const QByteArray& userEntries, const QByteArray& systemEntries);
    // Writes a file of its own and opens it.
    bool openFile(const QString& path, const QByteArray& entries);

    KeysConfForm* form() const { return window.get(); }
    QTreeWidget* tree() const;
    QAction* action(const char* name) const;
    // The index-th row of a function, or of a command line with "cmd:" in front.
    QTreeWidgetItem* row(const QString& name, int index = 0) const;
    // Makes the row current and selected, as a click does.
    void select(QTreeWidgetItem* row) const;
    QStringList boundRows() const { return ::boundRows(tree()); }
    void reset() { window.reset(); }

private:
    bool open(const QString& path);
    std::unique_ptr<KeysConfForm> window;
};

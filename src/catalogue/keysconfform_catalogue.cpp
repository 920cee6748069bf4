#include "keysconfform.h"

#include "wmfunctioncatalogue.h"

#include <QTreeWidget>

void KeysConfForm::fillFunctionTree()
{
    const QVector<WmFunctionEntry> table = buildWmFunctionTable();

    commandGroupItem = nullptr;
    keysTree->clear();

    QList<QTreeWidgetItem*> groups;
    QTreeWidgetItem* group = nullptr;
    for (const WmFunctionEntry& entry : table) {
        if (entry.code != 0 && entry.keyName) {
            // A function listed before any group has nowhere to go; the table never does that.
            if (group)
                new QTreeWidgetItem(group, {entry.text, QString(), QString::fromLatin1(entry.keyName)});
        } else {
            group = new QTreeWidgetItem({entry.text, QString(), QString()});
            groups.append(group);
        }
    }
    // Handing the finished groups over at once spares the view one update per row.
    keysTree->addTopLevelItems(groups);

    commandGroupItem = new QTreeWidgetItem({tr("Command Keybindings"), QString(), QString()});
    keysTree->addTopLevelItem(commandGroupItem);
}

#include "keysconfform.h"

#include "hotkeysdocument.h"
#include "hotkeysfile.h"

#include <QAction>
#include <QHash>
#include <QSet>
#include <QTreeWidget>
#include <QTreeWidgetItemIterator>

#include <algorithm>
#include <cstdio>
#include <iterator>

namespace {

const QString disableValue = QStringLiteral("Disable");

QString unquoted(const QString& value)
{
    return value.startsWith(QLatin1Char('"')) ? value.mid(1, value.size() - 2) : value;
}

} // namespace

bool KeysConfForm::loadFile(const QString& path)
{
    if (path.isEmpty())
        return false;

    const QString systemPath = path == userHotkeysFilePath() ? systemHotkeysFilePath() : QString();
    HotkeysDocument mainDocument;
    if (!mainDocument.load(path))
        return false;
    // Editing the user's file needs the system file it is merged with.
    HotkeysDocument systemDocument;
    if (!systemPath.isEmpty() && !systemDocument.load(systemPath))
        return false;

    std::fprintf(stderr, "files %s %s\n", path.toLocal8Bit().constData(),
                 systemPath.toLocal8Bit().constData());

    currentFile = path;
    updateTitle();
    disabledKeys.clear();
    keysTree->setUpdatesEnabled(false);
    fillFunctionTree();

    // The first row of every function, and every key bound so far (lower-cased): looked up
    // once per entry, so that loading stays linear in the size of the files.
    QHash<QString, QTreeWidgetItem*> firstRowOf;
    for (QTreeWidgetItemIterator it(keysTree); *it; ++it) {
        const QString function = (*it)->text(2);
        if (!function.isEmpty() && !firstRowOf.contains(function))
            firstRowOf.insert(function, *it);
    }
    QSet<QString> boundKeys;
    QSet<QString> disabled;
    QList<QTreeWidgetItem*> commandRows;
    // Further rows of a function, in the order they were read; they join the tree in one go at
    // the end, since inserting them one by one in the middle of a group costs a shift each.
    QHash<QTreeWidgetItem*, QList<QTreeWidgetItem*>> furtherRows;

    const auto addEntries = [&](const HotkeysDocument& document, const QString& source) {
        for (const HotkeysEntry& entry : document.entries()) {
            const QString key = fromFileKey(entry.key);
            const QString value = unquoted(entry.value);
            // Whoever bound the key first keeps it: the user's file before the system one.
            if (!key.isEmpty() && boundKeys.contains(key.toLower()))
                continue;

            if (value.startsWith(QLatin1String("ZEMWM_"))) {
                QTreeWidgetItem* first = firstRowOf.value(value);
                if (!first)
                    continue;
                QTreeWidgetItem* row = first;
                if (!itemKey(first).isEmpty()) {
                    row = new QTreeWidgetItem({first->text(0), QString(), first->text(2)});
                    furtherRows[first].append(row);
                }
                setItemKey(row, key);
                row->setText(3, source);
            } else {
                auto* row = new QTreeWidgetItem({value, QString(), QStringLiteral("ExecCommand"), source});
                setItemKey(row, key);
                commandRows.append(row);
                if (value == disableValue && !disabled.contains(itemKey(row))) {
                    disabled.insert(itemKey(row));
                    disabledKeys.append(itemKey(row));
                }
            }
            if (!key.isEmpty())
                boundKeys.insert(key.toLower());
        }
    };
    addEntries(mainDocument, userSource);
    addEntries(systemDocument, systemSource);

    // A function's further rows follow its first row, the one read last nearest to it.
    for (int g = 0; g < keysTree->topLevelItemCount() && !furtherRows.isEmpty(); ++g) {
        QTreeWidgetItem* group = keysTree->topLevelItem(g);
        const QList<QTreeWidgetItem*> children = group->takeChildren();
        QList<QTreeWidgetItem*> ordered;
        ordered.reserve(children.size());
        for (QTreeWidgetItem* child : children) {
            ordered.append(child);
            const QList<QTreeWidgetItem*> extra = furtherRows.take(child);
            std::copy(extra.crbegin(), extra.crend(), std::back_inserter(ordered));
        }
        group->addChildren(ordered);
    }

    // Disabled keys are kept in disabledKeys, not shown as rows. No catalogue row reads
    // "Disable", so only command rows can be among them.
    QList<QTreeWidgetItem*> shownCommands;
    shownCommands.reserve(commandRows.size());
    for (QTreeWidgetItem* row : qAsConst(commandRows)) {
        if (row->text(0) == disableValue)
            delete row;
        else
            shownCommands.append(row);
    }
    commandGroupItem->addChildren(shownCommands);
    keysTree->setUpdatesEnabled(true);

    modified = false;
    fileSaveAction->setEnabled(false);
    fileApplyAction->setEnabled(false);
    return true;
}

#include "bindingtree.h"

#include "bindingfilter.h"
#include "functioncatalogue.h"

#include <QCoreApplication>
#include <QKeySequence>
#include <QTreeWidget>

BindingTree::BindingTree(QTreeWidget* tree, const HotkeysModel* model) : tree(tree), model(model) {}

void BindingTree::setSourceTexts(const QString& user, const QString& system)
{
    userText = user;
    systemText = system;
}

void BindingTree::rebuild()
{
    const QVector<WmFunctionEntry> table = buildWmFunctionTable();

    commandGroupRow = nullptr;
    searchedCurrent = false;
    ids.clear();
    rows.clear();
    tree->clear();
    groupOfFunction.clear();
    functionTexts.clear();

    QList<QTreeWidgetItem*> groups;
    QTreeWidgetItem* group = nullptr;
    for (const WmFunctionEntry& entry : table) {
        if (entry.code != 0 && entry.keyName) {
            // A function listed before any group has nowhere to go; the table never does that.
            if (!group)
                continue;
            const int function = functionTexts.size();
            functionTexts.append(entry.text);
            groupOfFunction.append(group);
            for (const Binding& binding : model->rowsOf(function))
                group->addChild(makeRow(binding));
        } else {
            group = new QTreeWidgetItem({entry.text, QString(), QString()});
            groups.append(group);
        }
    }
    //: The group row under which the user's command entries are listed.
    commandGroupRow = new QTreeWidgetItem(
        {QCoreApplication::translate("KeysConfForm", "Command Keybindings"), QString(), QString()});
    QList<QTreeWidgetItem*> commandRows;
    for (const Binding& binding : model->commands())
        commandRows.append(makeRow(binding));
    commandGroupRow->addChildren(commandRows);
    groups.append(commandGroupRow);
    // Handing the finished groups over at once spares the view one update per row.
    tree->addTopLevelItems(groups);
}

QTreeWidgetItem* BindingTree::makeRow(const Binding& binding)
{
    auto* row = new QTreeWidgetItem();
    ids.insert(row, binding.id);
    rows.insert(binding.id, row);
    show(row, binding);
    return row;
}

void BindingTree::show(QTreeWidgetItem* row, const Binding& binding)
{
    searchedCurrent = false;
    if (binding.isCommand()) {
        row->setText(0, binding.command);
        row->setText(2, QStringLiteral("ExecCommand"));
    } else {
        row->setText(0, functionTexts.value(binding.function));
        row->setText(2, HotkeysModel::functionNames().at(binding.function));
    }
    showKey(row, binding.key);
    if (binding.source != BindingSource::Unset)
        row->setText(3, binding.source == BindingSource::System ? systemText : userText);
}

void BindingTree::showKey(QTreeWidgetItem* row, const QString& key)
{
    if (!row)
        return;
    row->setData(1, Qt::UserRole, key);
    const QString shown =
        QKeySequence::fromString(key, QKeySequence::NativeText).toString(QKeySequence::NativeText);
    row->setText(1, shown.isEmpty() ? key : shown);
}

void BindingTree::refresh(BindingId id)
{
    const Binding* binding = model->find(id);
    QTreeWidgetItem* row = rowOf(id);
    if (binding && row)
        show(row, *binding);
}

void BindingTree::refreshCommands()
{
    for (const Binding& binding : model->commands())
        refresh(binding.id);
}

QTreeWidgetItem* BindingTree::insert(BindingId id)
{
    const Binding* binding = model->find(id);
    if (!binding || rows.contains(id))
        return rowOf(id);
    const QVector<Binding>& siblings =
        binding->isCommand() ? model->commands() : model->rowsOf(binding->function);
    QTreeWidgetItem* parent =
        binding->isCommand() ? commandGroupRow : groupOfFunction.value(binding->function);
    if (!parent)
        return nullptr;
    int place = 0;
    for (int i = 0; i < siblings.size(); ++i) {
        if (siblings.at(i).id == id) {
            QTreeWidgetItem* before = i > 0 ? rowOf(siblings.at(i - 1).id) : nullptr;
            place = before ? parent->indexOfChild(before) + 1 : 0;
            break;
        }
    }
    QTreeWidgetItem* row = makeRow(*binding);
    parent->insertChild(place, row);
    return row;
}

void BindingTree::remove(BindingId id)
{
    searchedCurrent = false;
    QTreeWidgetItem* row = rows.take(id);
    ids.remove(row);
    delete row;
}

const QVector<BindingTree::SearchRow>& BindingTree::searchRows()
{
    if (searchedCurrent)
        return searched;
    searched.clear();
    for (int g = 0; g < tree->topLevelItemCount(); ++g) {
        const QTreeWidgetItem* group = tree->topLevelItem(g);
        for (int i = 0; i < group->childCount(); ++i) {
            QTreeWidgetItem* row = group->child(i);
            // A command row's function column says only ExecCommand.
            const QString function = group == commandGroupRow ? QString() : row->text(2);
            searched.append({row, BindingFilter::searchText(row->text(0), function, row->text(1)),
                             row->data(1, Qt::UserRole).toString()});
        }
    }
    searchedCurrent = true;
    return searched;
}

#include "bindingtree.h"

#include "bindingfilter.h"
#include "functioncatalogue.h"

#include <QCoreApplication>
#include <QKeySequence>
#include <QSet>
#include <QTreeWidget>

#include <algorithm>

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
    // All columns at once: a new row is made often, and one by one its texts cost more.
    auto* row = new QTreeWidgetItem(columnsOf(binding));
    row->setData(1, Qt::UserRole, binding.key);
    ids.insert(row, binding.id);
    rows.insert(binding.id, row);
    searchedCurrent = false;
    return row;
}

QStringList BindingTree::columnsOf(const Binding& binding) const
{
    static const QString execCommand = QStringLiteral("ExecCommand");
    const QString source = binding.source == BindingSource::Unset    ? QString()
                           : binding.source == BindingSource::System ? systemText
                                                                     : userText;
    if (binding.isCommand())
        return {binding.command, shownKey(binding.key), execCommand, source};
    return {functionTexts.value(binding.function), shownKey(binding.key),
            HotkeysModel::functionNames().at(binding.function), source};
}

void BindingTree::show(QTreeWidgetItem* row, const Binding& binding)
{
    searchedCurrent = false;
    const QStringList columns = columnsOf(binding);
    for (int column = 0; column < columns.size(); ++column)
        row->setText(column, columns.at(column));
    row->setData(1, Qt::UserRole, binding.key);
}

QString BindingTree::shownKey(const QString& key)
{
    const QString shown =
        QKeySequence::fromString(key, QKeySequence::NativeText).toString(QKeySequence::NativeText);
    return shown.isEmpty() ? key : shown;
}

void BindingTree::showKey(QTreeWidgetItem* row, const QString& key)
{
    if (!row)
        return;
    row->setData(1, Qt::UserRole, key);
    row->setText(1, shownKey(key));
}

QString BindingTree::actionText(BindingId id) const
{
    const Binding* binding = model->find(id);
    if (!binding)
        return QString();
    return binding->isCommand() ? binding->command : functionTexts.value(binding->function);
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
    QTreeWidgetItem* parent =
        binding->isCommand() ? commandGroupRow : groupOfFunction.value(binding->function);
    if (!parent)
        return nullptr;
    QTreeWidgetItem* row = makeRow(*binding);
    parent->insertChild(placeOf(*binding, parent), row);
    return row;
}

int BindingTree::placeOf(const Binding& binding, QTreeWidgetItem* parent) const
{
    const QVector<Binding>& siblings =
        binding.isCommand() ? model->commands() : model->rowsOf(binding.function);
    const auto at = std::find_if(siblings.cbegin(), siblings.cend(),
                                 [&](const Binding& b) { return b.id == binding.id; });
    for (auto it = at; it != siblings.cbegin();) {
        if (QTreeWidgetItem* before = rowOf((--it)->id))
            return parent->indexOfChild(before) + 1;
    }
    for (int function = binding.function - 1; function >= 0 && groupOfFunction.value(function) == parent;
         --function) {
        const QVector<Binding>& earlier = model->rowsOf(function);
        for (auto it = earlier.crbegin(); it != earlier.crend(); ++it) {
            if (QTreeWidgetItem* before = rowOf(it->id))
                return parent->indexOfChild(before) + 1;
        }
    }
    return 0;
}

void BindingTree::remove(BindingId id)
{
    searchedCurrent = false;
    QTreeWidgetItem* row = rows.take(id);
    ids.remove(row);
    delete row;
}

void BindingTree::follow(const HotkeysModel& before)
{
    QHash<BindingId, const Binding*> previous;
    for (const Binding* old : before.rows())
        previous.insert(old->id, old);
    const QVector<const Binding*> now = model->rows();
    QSet<BindingId> present;
    for (const Binding* binding : now)
        present.insert(binding->id);
    for (auto it = previous.cbegin(); it != previous.cend(); ++it) {
        if (!present.contains(it.key()))
            remove(it.key());
    }
    for (const Binding* binding : now) {
        const Binding* was = previous.value(binding->id);
        if (!rowOf(binding->id))
            insert(binding->id);
        else if (!was || was->key != binding->key || was->source != binding->source ||
                 was->command != binding->command)
            refresh(binding->id);
    }
}

const QVector<BindingTree::SearchRow>& BindingTree::searchRows()
{
    if (searchedCurrent)
        return searched;
    searched.clear();
    // What a filter looks at comes from the bindings, not from what the rows show.
    for (const Binding* binding : model->rows()) {
        QTreeWidgetItem* row = rowOf(binding->id);
        if (!row)
            continue;
        const QString action =
            binding->isCommand() ? binding->command : functionTexts.value(binding->function);
        // A command has no function name to be found by.
        const QString function =
            binding->isCommand() ? QString() : HotkeysModel::functionNames().at(binding->function);
        searched.append(
            {row, BindingFilter::searchText(action, function, shownKey(binding->key)), binding->key});
    }
    searchedCurrent = true;
    return searched;
}

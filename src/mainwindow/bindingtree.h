#pragma once

#include "hotkeysmodel.h"

#include <QHash>
#include <QString>
#include <QStringList>
#include <QVector>

class QTreeWidget;
class QTreeWidgetItem;

// Projects the bindings of a HotkeysModel into the window's tree: group rows and function rows
// in catalogue order, the command group row last with the command rows below it. It is the
// only code that writes tree items; everything else changes the model and asks it to follow.
class BindingTree
{
public:
    BindingTree(QTreeWidget* tree, const HotkeysModel* model);
    Q_DISABLE_COPY(BindingTree)

    void setSourceTexts(const QString& user, const QString& system);
    // Empties the tree and builds it anew from the catalogue and the model.
    void rebuild();
    QTreeWidgetItem* commandGroup() const { return commandGroupRow; }

    // 0 for group rows and rows the tree does not know.
    BindingId bindingAt(const QTreeWidgetItem* row) const { return ids.value(row, 0); }
    QTreeWidgetItem* rowOf(BindingId id) const { return rows.value(id, nullptr); }

    // What a binding's row says in its first column: the function's description, or the
    // command line.
    QString actionText(BindingId id) const;
    // A stored key in the desktop's own words, or, when Qt cannot read it, as it stands.
    static QString shownKey(const QString& key);

    // Puts a stored key into a row: at Qt::UserRole of the key column, and as its shown text, which
    // is the key in the desktop's own words or, when Qt cannot read it, the text as it stands.
    static void showKey(QTreeWidgetItem* row, const QString& key);
    // The row shows the binding as the model now has it.
    void refresh(BindingId id);
    void refreshCommands();
    // A row for a binding the model has just gained, in the model's place for it.
    QTreeWidgetItem* insert(BindingId id);
    // Deletes the row of a binding the model has just lost.
    void remove(BindingId id);
    // Makes the rows what the model now holds, touching only the rows that differ from the
    // state before.
    void follow(const HotkeysModel& before);

    // Every binding row with what a filter looks at, made anew after the tree changed.
    struct SearchRow
    {
        QTreeWidgetItem* row;
        QString text;
        QString key;
    };
    const QVector<SearchRow>& searchRows();

private:
    QTreeWidgetItem* makeRow(const Binding& binding);
    QStringList columnsOf(const Binding& binding) const;
    // Where a new row of the binding goes under its parent: after the row of the binding before
    // it, or of the last binding of an earlier function of the same group.
    int placeOf(const Binding& binding, QTreeWidgetItem* parent) const;
    void show(QTreeWidgetItem* row, const Binding& binding);

    QTreeWidget* tree;
    const HotkeysModel* model;
    QString userText;
    QString systemText;
    QTreeWidgetItem* commandGroupRow = nullptr;
    QVector<QTreeWidgetItem*> groupOfFunction;
    QVector<QString> functionTexts;
    QHash<const QTreeWidgetItem*, BindingId> ids;
    QHash<BindingId, QTreeWidgetItem*> rows;
    QVector<SearchRow> searched;
    bool searchedCurrent = false;
};

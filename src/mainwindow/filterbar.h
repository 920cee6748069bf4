#pragma once

#include <QList>
#include <QWidget>

class BindingTree;
class HotkeysModel;
class KKeySequenceWidget;
class QKeySequence;
class QLabel;
class QLineEdit;
class QTimer;
class QTreeWidget;

// Finding a binding: the field above the tree, whose text shows only the rows it matches, and
// Find key, which looks a combination up by pressing it. Escape empties the field, Down goes to
// the first row shown, Ctrl+F comes back to the field; the count of rows shown stands in a label
// the window puts in its status bar.
class FilterBar : public QWidget
{
    Q_OBJECT
    Q_DISABLE_COPY(FilterBar)

public:
    FilterBar(QTreeWidget* tree, BindingTree* rows, const HotkeysModel* model, QWidget* parent);

    QLabel* countLabel() const { return count; }
    // Shows the rows the text matches; a row that stops matching through an edit stays until
    // the text changes or a file is loaded.
    void apply();

signals:
    // The selected row was hidden, and is no longer selected.
    void selectionHidden();
    // What Find key found out, for the status bar.
    void found(const QString& message);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void findKey(const QKeySequence& seq);
    void resetFindKey();
    bool focusFirstRow();

    QTreeWidget* tree;
    BindingTree* rows;
    const HotkeysModel* model;
    QLineEdit* edit = nullptr;
    KKeySequenceWidget* findKeyWidget = nullptr;
    QLabel* count = nullptr;
    QTimer* timer = nullptr;
    QList<bool> expandedBefore;
    bool wasFiltering = false;
};

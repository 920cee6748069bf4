#include "filterbar.h"

#include "bindingfilter.h"
#include "bindingtree.h"
#include "hotkeysmodel.h"
#include "kkeysequencewidget.h"

#include <QAction>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QSignalBlocker>
#include <QTimer>
#include <QToolButton>
#include <QTreeWidget>
#include <QTreeWidgetItemIterator>

FilterBar::FilterBar(QTreeWidget* tree, BindingTree* rows, const HotkeysModel* model, QWidget* parent)
    : QWidget(parent), tree(tree), rows(rows), model(model)
{
    edit = new QLineEdit(this);
    edit->setObjectName(QStringLiteral("filterEdit"));
    edit->setClearButtonEnabled(true);
    edit->setPlaceholderText(tr("Filter by action, function, command or key"));
    edit->installEventFilter(this);
    edit->setAccessibleName(tr("Filter"));
    // The editor's own recorder, showing what it is for while idle.
    findKeyWidget = new KKeySequenceWidget(this);
    findKeyWidget->setObjectName(QStringLiteral("findKeyWidget"));
    findKeyWidget->setMultiKeyShortcutsAllowed(false);
    findKeyWidget->setToolTip(tr("Press a key combination to find what it does"));
    findKeyWidget->setAccessibleName(tr("Find key"));
    if (auto* clear = findKeyWidget->findChild<QToolButton*>(QStringLiteral("clearSequenceButton")))
        clear->hide();
    resetFindKey();
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->addWidget(edit);
    row->addWidget(findKeyWidget);

    count = new QLabel(this);
    // Typing never waits for the tree: the filter follows once the keystroke is shown.
    timer = new QTimer(this);
    timer->setSingleShot(true);
    timer->setInterval(30);
    connect(edit, &QLineEdit::textChanged, timer, qOverload<>(&QTimer::start));
    connect(timer, &QTimer::timeout, this, &FilterBar::apply);
    connect(findKeyWidget, &KKeySequenceWidget::keySequenceChanged, this, &FilterBar::findKey);

    auto* find = new QAction(this);
    find->setShortcut(QKeySequence::Find);
    find->setShortcutContext(Qt::WindowShortcut);
    connect(find, &QAction::triggered, this, [this] {
        edit->setFocus(Qt::ShortcutFocusReason);
        edit->selectAll();
    });
    addAction(find);
}

void FilterBar::resetFindKey()
{
    // Cleared quietly, so that pressing the same combination again is news again.
    const QSignalBlocker quiet(findKeyWidget);
    findKeyWidget->clearKeySequence();
    findKeyWidget->showKeyText(tr("Find key"));
}

void FilterBar::apply()
{
    timer->stop();
    const BindingFilter filter(edit->text());
    const bool filtering = !filter.isEmpty();
    // Nothing is hidden while there is no filter, so a new tree needs nothing then.
    if (!filtering && !wasFiltering) {
        count->clear();
        return;
    }
    tree->setUpdatesEnabled(false);
    // The groups the user had open come back when the filter is emptied.
    if (filtering && !wasFiltering) {
        expandedBefore.clear();
        for (int g = 0; g < tree->topLevelItemCount(); ++g)
            expandedBefore << tree->topLevelItem(g)->isExpanded();
    }
    int shown = 0;
    QHash<const QTreeWidgetItem*, bool> groupsShown;
    const QVector<BindingTree::SearchRow>& searched = rows->searchRows();
    for (const BindingTree::SearchRow& row : searched) {
        const bool match = filter.matches(row.text, row.key);
        if (row.row->isHidden() == match)
            row.row->setHidden(!match);
        groupsShown[row.row->parent()] |= match;
        shown += match;
    }
    const int total = searched.size();
    for (int g = 0; g < tree->topLevelItemCount(); ++g) {
        QTreeWidgetItem* group = tree->topLevelItem(g);
        const bool any = groupsShown.value(group);
        group->setHidden(filtering && !any);
        if (filtering)
            group->setExpanded(any);
        else if (wasFiltering)
            group->setExpanded(expandedBefore.value(g));
    }
    wasFiltering = filtering;
    tree->setUpdatesEnabled(true);
    // The key panel acts only on a row that is shown: a row the filter hides is let go.
    QTreeWidgetItem* current = tree->currentItem();
    if (current && (current->isHidden() || (current->parent() && current->parent()->isHidden()))) {
        tree->setCurrentItem(nullptr);
        tree->clearSelection();
        emit selectionHidden();
    }
    //: Shown while a filter is active, for example "3 of 186 bindings".
    count->setText(filtering ? tr("%1 of %n bindings", nullptr, total).arg(shown) : QString());
}

void FilterBar::findKey(const QKeySequence& seq)
{
    if (seq.isEmpty())
        return;
    const QString key = seq.toString(QKeySequence::PortableText);
    const QString shown = seq.toString(QKeySequence::NativeText);
    // The recorder shows the sequence once this returns; "Find key" comes back after that.
    QTimer::singleShot(0, this, &FilterBar::resetFindKey);
    edit->setText(shown);
    apply();
    const Binding* holder = model->find(model->holderOf(key));
    if (!holder)
        emit found(model->isDisabled(key) ? tr("%1 is disabled").arg(shown) : tr("%1 is free").arg(shown));
    else if (holder->source == BindingSource::System)
        emit found(tr("%1 is taken from the system file").arg(shown));
    else
        emit found(QString());
}

bool FilterBar::eventFilter(QObject* watched, QEvent* event)
{
    // Undo and redo are the bindings' everywhere in the window: the field does not claim them
    // for its text, so the Edit menu's shortcuts take them.
    if (watched == edit && event->type() == QEvent::ShortcutOverride) {
        const auto* press = static_cast<QKeyEvent*>(event);
        if (press->matches(QKeySequence::Undo) || press->matches(QKeySequence::Redo))
            return true;
    }
    if (watched != edit || event->type() != QEvent::KeyPress)
        return QWidget::eventFilter(watched, event);
    const int key = static_cast<QKeyEvent*>(event)->key();
    if (key == Qt::Key_Escape && !edit->text().isEmpty()) {
        edit->clear();
        return true;
    }
    if (key == Qt::Key_Down && focusFirstRow())
        return true;
    return QWidget::eventFilter(watched, event);
}

bool FilterBar::focusFirstRow()
{
    for (QTreeWidgetItemIterator it(tree, QTreeWidgetItemIterator::NotHidden); *it; ++it) {
        if (rows->bindingAt(*it)) {
            tree->setCurrentItem(*it);
            tree->setFocus(Qt::TabFocusReason);
            return true;
        }
    }
    return false;
}

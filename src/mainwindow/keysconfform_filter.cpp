// Finding a binding: the filter field above the tree, and looking a key up by pressing it.
#include "keysconfform.h"

#include "bindingfilter.h"
#include "bindingtree.h"
#include "kkeysequencewidget.h"

#include <QAction>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QStatusBar>
#include <QTimer>
#include <QToolButton>
#include <QTreeWidget>
#include <QTreeWidgetItemIterator>
#include <QVBoxLayout>

void KeysConfForm::createFilter(QWidget* parent)
{
    filterEdit = new QLineEdit(parent);
    filterEdit->setObjectName(QStringLiteral("filterEdit"));
    filterEdit->setClearButtonEnabled(true);
    filterEdit->setPlaceholderText(tr("Filter by action, function, command or key"));
    filterEdit->installEventFilter(this);
    // The editor's own recorder, showing what it is for while idle.
    findKeyWidget = new KKeySequenceWidget(parent);
    findKeyWidget->setObjectName(QStringLiteral("findKeyWidget"));
    findKeyWidget->setMultiKeyShortcutsAllowed(false);
    findKeyWidget->setToolTip(tr("Press a key combination to find what it does"));
    if (auto* clear = findKeyWidget->findChild<QToolButton*>(QStringLiteral("clearSequenceButton")))
        clear->hide();
    resetFindKey();
    auto* row = new QHBoxLayout;
    row->addWidget(filterEdit);
    row->addWidget(findKeyWidget);
    mainLayout->addLayout(row);

    filterStatus = new QLabel(this);
    statusBar()->addPermanentWidget(filterStatus);
    // Typing never waits for the tree: the filter follows once the keystroke is shown.
    filterTimer = new QTimer(this);
    filterTimer->setSingleShot(true);
    filterTimer->setInterval(30);
    connect(filterEdit, &QLineEdit::textChanged, filterTimer, qOverload<>(&QTimer::start));
    connect(filterTimer, &QTimer::timeout, this, &KeysConfForm::applyFilter);
    connect(findKeyWidget, &KKeySequenceWidget::keySequenceChanged, this, &KeysConfForm::findKey);

    auto* find = new QAction(this);
    find->setShortcut(QKeySequence::Find);
    connect(find, &QAction::triggered, this, [this] {
        filterEdit->setFocus(Qt::ShortcutFocusReason);
        filterEdit->selectAll();
    });
    addAction(find);
}

void KeysConfForm::resetFindKey()
{
    // Cleared quietly, so that pressing the same combination again is news again.
    const QSignalBlocker quiet(findKeyWidget);
    findKeyWidget->clearKeySequence();
    findKeyWidget->showKeyText(tr("Find key"));
}

void KeysConfForm::applyFilter()
{
    filterTimer->stop();
    const BindingFilter filter(filterEdit->text());
    const bool filtering = !filter.isEmpty();
    // Nothing is hidden while there is no filter, so a new tree needs nothing then.
    if (!filtering && !wasFiltering) {
        filterStatus->clear();
        return;
    }
    keysTree->setUpdatesEnabled(false);
    // The groups the user had open come back when the filter is emptied.
    if (filtering && !wasFiltering) {
        expandedBeforeFilter.clear();
        for (int g = 0; g < keysTree->topLevelItemCount(); ++g)
            expandedBeforeFilter << keysTree->topLevelItem(g)->isExpanded();
    }
    int shown = 0;
    QHash<const QTreeWidgetItem*, bool> groupsShown;
    const QVector<BindingTree::SearchRow>& rows = bindingTree->searchRows();
    for (const BindingTree::SearchRow& row : rows) {
        const bool match = filter.matches(row.text, row.key);
        if (row.row->isHidden() == match)
            row.row->setHidden(!match);
        groupsShown[row.row->parent()] |= match;
        shown += match;
    }
    const int total = rows.size();
    for (int g = 0; g < keysTree->topLevelItemCount(); ++g) {
        QTreeWidgetItem* group = keysTree->topLevelItem(g);
        const bool any = groupsShown.value(group);
        group->setHidden(filtering && !any);
        if (filtering)
            group->setExpanded(any);
        else if (wasFiltering)
            group->setExpanded(expandedBeforeFilter.value(g));
    }
    wasFiltering = filtering;
    keysTree->setUpdatesEnabled(true);
    // The key panel acts only on a row that is shown: a row the filter hides is let go.
    QTreeWidgetItem* current = keysTree->currentItem();
    if (current && (current->isHidden() || (current->parent() && current->parent()->isHidden()))) {
        keysTree->setCurrentItem(nullptr);
        keysTree->clearSelection();
        itemSelected(nullptr);
    }
    //: Shown while a filter is active, for example "3 of 186 bindings".
    filterStatus->setText(filtering ? tr("%1 of %n bindings", nullptr, total).arg(shown) : QString());
}

void KeysConfForm::findKey(const QKeySequence& seq)
{
    if (seq.isEmpty())
        return;
    const QString key = seq.toString(QKeySequence::PortableText);
    const QString shown = seq.toString(QKeySequence::NativeText);
    // The recorder shows the sequence once this returns; "Find key" comes back after that.
    QTimer::singleShot(0, this, &KeysConfForm::resetFindKey);
    filterEdit->setText(shown);
    applyFilter();
    const Binding* holder = model.find(model.holderOf(key));
    if (!holder)
        statusBar()->showMessage(model.isDisabled(key) ? tr("%1 is disabled").arg(shown)
                                                       : tr("%1 is free").arg(shown));
    else if (holder->source == BindingSource::System)
        statusBar()->showMessage(tr("%1 is taken from the system file").arg(shown));
    else
        statusBar()->clearMessage();
}

bool KeysConfForm::eventFilter(QObject* watched, QEvent* event)
{
    // Undo and redo are the bindings' everywhere in the window: the field does not claim them
    // for its text, so the Edit menu's shortcuts take them.
    if (watched == filterEdit && event->type() == QEvent::ShortcutOverride) {
        const auto* press = static_cast<QKeyEvent*>(event);
        if (press->matches(QKeySequence::Undo) || press->matches(QKeySequence::Redo))
            return true;
    }
    if (watched != filterEdit || event->type() != QEvent::KeyPress)
        return QMainWindow::eventFilter(watched, event);
    const int key = static_cast<QKeyEvent*>(event)->key();
    if (key == Qt::Key_Escape && !filterEdit->text().isEmpty()) {
        filterEdit->clear();
        return true;
    }
    if (key == Qt::Key_Down) {
        for (QTreeWidgetItemIterator it(keysTree, QTreeWidgetItemIterator::NotHidden); *it; ++it) {
            if (bindingAt(*it)) {
                keysTree->setCurrentItem(*it);
                keysTree->setFocus(Qt::TabFocusReason);
                return true;
            }
        }
    }
    return QMainWindow::eventFilter(watched, event);
}

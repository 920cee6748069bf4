#include "formfixture.h"

#include "testenvironment.h"

#include <QAction>
#include <QTreeWidget>
#include <QTreeWidgetItemIterator>

QString FormFixture::userPath()
{
    return QString::fromLocal8Bit(qgetenv("ZEM_USER_DIR")) + QLatin1String("/keyshortcutrc");
}

QString FormFixture::systemPath()
{
    return QString::fromLocal8Bit(qgetenv("ZEM_SYSTEM_DIR")) + QLatin1String("/keyshortcutrc");
}

bool FormFixture::openUserFile(const QByteArray& userEntries, const QByteArray& systemEntries)
{
    return writeFile(systemPath(), "[ShortCutKeys]\n" + systemEntries) &&
           writeFile(userPath(), "[ShortCutKeys]\n" + userEntries) && open(userPath());
}

bool FormFixture::openFile(const QString& path, const QByteArray& entries)
{
    return writeFile(path, "[ShortCutKeys]\n" + entries) && open(path);
}

bool FormFixture::open(const QString& path)
{
    window.reset();
    window = std::make_unique<KeysConfForm>();
    return window->init(path);
}

QTreeWidget* FormFixture::tree() const
{
    return window->findChild<QTreeWidget*>(QStringLiteral("keysTree"));
}

QAction* FormFixture::action(const char* name) const
{
    return window->findChild<QAction*>(QLatin1String(name));
}

QTreeWidgetItem* FormFixture::row(const QString& name, int index) const
{
    const bool command = name.startsWith(QLatin1String("cmd:"));
    for (QTreeWidgetItemIterator it(tree()); *it; ++it) {
        const bool match =
            command ? (*it)->parent() == KeysConfForm::commandGroup() && (*it)->text(0) == name.mid(4)
                    : (*it)->text(2) == name;
        if (match && index-- == 0)
            return *it;
    }
    return nullptr;
}

void FormFixture::select(QTreeWidgetItem* item) const
{
    tree()->setCurrentItem(item);
}

QStringList boundRows(QTreeWidget* tree)
{
    QStringList rows;
    for (QTreeWidgetItemIterator it(tree); *it; ++it) {
        const QTreeWidgetItem* item = *it;
        if (item->text(2).isEmpty() || (item->text(3).isEmpty() && KeysConfForm::itemKey(item).isEmpty()))
            continue;
        const QString name = item->text(2) == QLatin1String("ExecCommand")
                                 ? QLatin1String("cmd:") + item->text(0)
                                 : item->text(2);
        rows << name + QLatin1Char('=') + KeysConfForm::itemKey(item) + QLatin1Char('@') + item->text(3);
    }
    return rows;
}

// The desktop-menu chooser over application directories written by the test.
#include "testenvironment.h"
#include "zemmenudialog.h"

#include <QDialogButtonBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTreeWidget>
#include <QtTest>

class TestMenuDialog : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void entriesShown();
    void grouping();
    void filter();
    void chosenCommandLine();
    void execFieldCodes_data();
    void execFieldCodes();
    void noApplications();

private:
    void writeEntry(const QString& dir, const QString& id, const QByteArray& body);
    QStringList shownNames(QTreeWidget* tree) const;
    QTemporaryDir scratch;
    QString home;
    QString first;
    QString second;
};

void TestMenuDialog::init()
{
    static int counter = 0;
    const QString base = scratch.filePath(QStringLiteral("data %1").arg(++counter));
    home = base + "/home";
    first = base + "/usr local";
    second = base + "/usr";
    qputenv("XDG_DATA_HOME", QFile::encodeName(home));
    qputenv("XDG_DATA_DIRS", QFile::encodeName(first + ":" + second));

    const QByteArray app = "[Desktop Entry]\nType=Application\n";
    writeEntry(second, "editor.desktop",
               app + "Name=Text Editor\nComment=Edit text\nExec=edit "
                     "%F\nIcon=accessories-text-editor\nCategories=Utility;TextEditor;\n");
    writeEntry(second, "browser.desktop",
               app + "Name=Web Browser\nName[de]=Netzbrowser\nExec=browse --new-window "
                     "%u\nCategories=Network;WebBrowser;\n");
    writeEntry(second, "hidden.desktop", app + "Name=Hidden One\nExec=hidden\nHidden=true\n");
    writeEntry(second, "nodisplay.desktop", app + "Name=No Display\nExec=nodisplay\nNoDisplay=true\n");
    writeEntry(second, "link.desktop", "[Desktop Entry]\nType=Link\nName=A Link\nURL=https://example.org\n");
    writeEntry(second, "dup.desktop", app + "Name=System Duplicate\nExec=dup-system\n");
    writeEntry(home, "dup.desktop", app + "Name=Home Duplicate\nExec=dup-home\n");
    writeEntry(first, "gone.desktop", app + "Name=Gone\nExec=gone\nHidden=true\n");
    writeEntry(second, "gone.desktop", app + "Name=Should Stay Gone\nExec=gone\n");
    writeEntry(second, "vendor/tool.desktop",
               app + "Name=Vendor Tool\nExec=vendor-tool\nCategories=Development;\n");
    writeEntry(second, "noexec.desktop", app + "Name=No Exec\n");
    writeEntry(second, "broken.desktop", "this is not a desktop entry at all\n\x01\x02");
    writeEntry(second, "binary.desktop", app + "Name=Bin" + QByteArray(1, '\0') + "ary\nExec=binary\n");
    writeEntry(second, "huge.desktop",
               app + "Name=Huge\nExec=huge\nComment=" + QByteArray(400 * 1024, 'x') + "\n");
    writeEntry(second, "percent.desktop",
               app + "Name=Percent\nExec=sh -c \"echo 100%%\" %i %c %k\nCategories=System;\n");
}

void TestMenuDialog::cleanup()
{
    QLocale::setDefault(QLocale::c());
}

void TestMenuDialog::writeEntry(const QString& dir, const QString& id, const QByteArray& body)
{
    QVERIFY(writeFile(dir + "/applications/" + id, body));
}

QStringList TestMenuDialog::shownNames(QTreeWidget* tree) const
{
    QStringList names;
    for (int g = 0; g < tree->topLevelItemCount(); ++g) {
        const QTreeWidgetItem* group = tree->topLevelItem(g);
        for (int i = 0; i < group->childCount(); ++i) {
            if (!group->isHidden() && !group->child(i)->isHidden())
                names << group->child(i)->text(0);
        }
    }
    names.sort();
    return names;
}

void TestMenuDialog::entriesShown()
{
    QStringList names;
    QStringList ids;
    for (const DesktopApplication& application : installedApplications()) {
        names << application.name;
        ids << application.id;
    }
    QCOMPARE(names, (QStringList{"Home Duplicate", "Percent", "Text Editor", "Vendor Tool", "Web Browser"}));
    QVERIFY(ids.contains("vendor-tool.desktop"));

    QLocale::setDefault(QLocale(QLocale::German, QLocale::Germany));
    bool localized = false;
    for (const DesktopApplication& application : installedApplications())
        localized |= application.name == QLatin1String("Netzbrowser");
    QVERIFY(localized);
}

void TestMenuDialog::grouping()
{
    ZemMenuDialog dialog;
    auto* tree = dialog.findChild<QTreeWidget*>("applicationTree");
    QStringList groups;
    for (int g = 0; g < tree->topLevelItemCount(); ++g)
        groups << tree->topLevelItem(g)->text(0) + ":" + QString::number(tree->topLevelItem(g)->childCount());
    QCOMPARE(groups, (QStringList{"Accessories:1", "Development:1", "Internet:1", "Other:1", "System:1"}));
    QVERIFY(!dialog.findChild<QLabel*>("emptyLabel")->isVisibleTo(&dialog));
    // Nothing chosen yet: OK waits for a choice.
    QVERIFY(!dialog.findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok)->isEnabled());
}

void TestMenuDialog::filter()
{
    ZemMenuDialog dialog;
    auto* tree = dialog.findChild<QTreeWidget*>("applicationTree");
    auto* filterEdit = dialog.findChild<QLineEdit*>("filterEdit");
    QTest::keyClicks(filterEdit, "ED");
    QCOMPARE(shownNames(tree), (QStringList{"Text Editor"}));
    filterEdit->clear();
    QTest::keyClicks(filterEdit, "tool");
    QCOMPARE(shownNames(tree), (QStringList{"Vendor Tool"}));
    QTest::keyClicks(filterEdit, "zzz");
    QCOMPARE(shownNames(tree), QStringList());
    filterEdit->clear();
    QCOMPARE(shownNames(tree).size(), 5);
}

void TestMenuDialog::chosenCommandLine()
{
    ZemMenuDialog dialog;
    auto* tree = dialog.findChild<QTreeWidget*>("applicationTree");
    const QList<QTreeWidgetItem*> found =
        tree->findItems("Web Browser", Qt::MatchExactly | Qt::MatchRecursive);
    QCOMPARE(found.size(), 1);
    tree->setCurrentItem(found.first());
    QVERIFY(dialog.findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok)->isEnabled());
    QCOMPARE(dialog.selectedItemExec(QString(), QString(), nullptr, nullptr),
             QStringLiteral("browse --new-window"));
    tree->setCurrentItem(tree->topLevelItem(0)); // a group is no choice
    QVERIFY(dialog.selectedItemExec(QString(), QString(), nullptr, nullptr).isEmpty());
}

void TestMenuDialog::execFieldCodes_data()
{
    QTest::addColumn<QString>("exec");
    QTest::addColumn<QString>("command");

    QTest::newRow("trailing %U") << "firefox %U"
                                 << "firefox";
    QTest::newRow("code between arguments") << "app %f --x"
                                            << "app --x";
    QTest::newRow("every code") << "a %f %F %u %U %i %c %k %d %D %n %N %v %m b"
                                << "a b";
    QTest::newRow("codes side by side") << "a %d%D b"
                                        << "a b";
    QTest::newRow("percent sign") << "sh -c \"echo 100%%\""
                                  << "sh -c \"echo 100%\"";
    QTest::newRow("inner spacing kept") << "sh -c \"a  b\" %f"
                                        << "sh -c \"a  b\"";
    QTest::newRow("lone percent at the end") << "calc 5%"
                                             << "calc 5%";
}

void TestMenuDialog::execFieldCodes()
{
    QFETCH(QString, exec);
    QFETCH(QString, command);
    QCOMPARE(execWithoutFieldCodes(exec), command);
}

void TestMenuDialog::noApplications()
{
    qputenv("XDG_DATA_HOME", QFile::encodeName(scratch.filePath("empty home")));
    qputenv("XDG_DATA_DIRS", QFile::encodeName(scratch.filePath("empty system")));
    ZemMenuDialog dialog;
    QCOMPARE(dialog.findChild<QTreeWidget*>("applicationTree")->topLevelItemCount(), 0);
    QVERIFY(dialog.findChild<QLabel*>("emptyLabel")->isVisibleTo(&dialog));
    QVERIFY(!dialog.findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok)->isEnabled());
    QVERIFY(dialog.selectedItemExec(QString(), QString(), nullptr, nullptr).isEmpty());
}

ZEM_TEST_MAIN(TestMenuDialog)
#include "tst_menudialog.moc"

// The window manager's function catalogue and the tree it rebuilds at every load.
#include "formfixture.h"
#include "keysconfform.h"
#include "testenvironment.h"
#include "wmfunctioncatalogue.h"

#include <QSet>
#include <QTreeWidget>
#include <QtTest>

class TestCatalogue : public QObject
{
    Q_OBJECT

private slots:
    void tableShape();
    void groupTitles();
    void descriptions_data();
    void descriptions();
    void treeRows();
    void secondFillReplaces();

private:
    QTemporaryDir scratch;
};

void TestCatalogue::tableShape()
{
    const QVector<WmFunctionEntry> table = buildWmFunctionTable();
    QCOMPARE(table.size(), 166);
    QVERIFY(!table.first().keyName);
    QCOMPARE(table.first().code, 0);

    QSet<QByteArray> names;
    QSet<qint32> codes;
    QSet<QString> descriptions;
    int groups = 0;
    for (const WmFunctionEntry& entry : table) {
        if (!entry.keyName) {
            QCOMPARE(entry.code, 0);
            ++groups;
            continue;
        }
        QVERIFY2(entry.code >= 1 && entry.code <= 173, entry.keyName);
        QVERIFY2(QByteArray(entry.keyName).startsWith("ZEMWM_"), entry.keyName);
        names.insert(entry.keyName);
        codes.insert(entry.code);
        descriptions.insert(entry.text);
    }
    QCOMPARE(groups, 12);
    QCOMPARE(names.size(), 154);
    QCOMPARE(codes.size(), 154);
    QCOMPARE(descriptions.size(), 154);
}

void TestCatalogue::groupTitles()
{
    QStringList titles;
    QList<int> sizes;
    for (const WmFunctionEntry& entry : buildWmFunctionTable()) {
        if (!entry.keyName) {
            titles << entry.text;
            sizes << 0;
        } else {
            ++sizes.last();
        }
    }
    QCOMPARE(titles, (QStringList{"Window decoration (on/off)", "Taskbar", "Desktop Icon", "Keyboard",
                                  "Pager", "Paging", "Search panel", "Menu", "Rearrangement",
                                  "Window placement", "Window focus", "Window Manager"}));
    QCOMPARE(sizes, (QList<int>{9, 15, 28, 3, 14, 4, 1, 5, 16, 34, 7, 18}));
}

void TestCatalogue::descriptions_data()
{
    QTest::addColumn<QString>("keyName");
    QTest::addColumn<QString>("description");
    QTest::addColumn<int>("code");

    QTest::newRow("first") << "ZEMWM_TOGGLE_BORDER"
                           << "toggle switch of a border" << 48;
    QTest::newRow("restore all") << "ZEMWM_RESTORE_ALL"
                                 << "restore all windows" << 76;
    QTest::newRow("toggle minimize all") << "ZEMWM_TOGGLE_MINIMIZE_ALL"
                                         << "minimize/restore all windows" << 74;
    QTest::newRow("folder, as spelled") << "ZEMWM_ICON_FOLDER_CREATE"
                                        << "cretae a folder" << 140;
    QTest::newRow("pager bottom, as spelled") << "ZEMWM_DISABLE_ONTOP_PAGER"
                                              << "pager on botton of all" << 0;
    QTest::newRow("kill, as spelled") << "ZEMWM_KILL"
                                      << "close a window forcely" << 43;
    QTest::newRow("last") << "ZEMWM_NEXT_WALLPAPER"
                          << "next wallpaper" << 0;
}

void TestCatalogue::descriptions()
{
    QFETCH(QString, keyName);
    QFETCH(QString, description);
    QFETCH(int, code);
    for (const WmFunctionEntry& entry : buildWmFunctionTable()) {
        if (entry.keyName && QLatin1String(entry.keyName) == keyName) {
            QCOMPARE(entry.text, description);
            if (code)
                QCOMPARE(entry.code, code);
            return;
        }
    }
    QFAIL("not in the catalogue");
}

void TestCatalogue::treeRows()
{
    FormFixture f;
    QVERIFY(f.openFile(scratch.filePath(QStringLiteral("empty.rc")), QByteArray()));
    QTreeWidget* tree = f.tree();

    const QVector<WmFunctionEntry> table = buildWmFunctionTable();
    QCOMPARE(tree->topLevelItemCount(), 13);
    int index = 0;
    for (int g = 0; g < 12; ++g) {
        const QTreeWidgetItem* group = tree->topLevelItem(g);
        QCOMPARE(group->text(0), table.at(index).text);
        QVERIFY(group->text(1).isEmpty() && group->text(2).isEmpty());
        QVERIFY(!group->data(3, Qt::DisplayRole).isValid());
        ++index;
        for (int f = 0; f < group->childCount(); ++f, ++index) {
            const QTreeWidgetItem* row = group->child(f);
            QCOMPARE(row->text(0), table.at(index).text);
            QCOMPARE(row->text(2), QLatin1String(table.at(index).keyName));
            QVERIFY(row->text(1).isEmpty() && KeysConfForm::itemKey(row).isEmpty());
            QVERIFY(!row->data(3, Qt::DisplayRole).isValid());
            QCOMPARE(row->childCount(), 0);
        }
    }
    QCOMPARE(index, table.size());
    QTreeWidgetItem* commands = tree->topLevelItem(12);
    QCOMPARE(KeysConfForm::commandGroup(), commands);
    QCOMPARE(commands->text(0), QStringLiteral("Command Keybindings"));
    QVERIFY(commands->text(1).isEmpty() && commands->text(2).isEmpty());
    QCOMPARE(commands->childCount(), 0);
}

void TestCatalogue::secondFillReplaces()
{
    const QString first = scratch.filePath(QStringLiteral("first.rc"));
    const QString second = scratch.filePath(QStringLiteral("second.rc"));
    QVERIFY(writeFile(first, "[ShortCutKeys]\nAlt|x=\"xterm\"\nAlt|F5=ZEMWM_CLOSE\nAlt|F6=ZEMWM_CLOSE\n"));
    QVERIFY(writeFile(second, "[ShortCutKeys]\nAlt|y=\"xclock\"\n"));
    KeysConfForm form;
    auto* tree = form.findChild<QTreeWidget*>(QStringLiteral("keysTree"));
    QVERIFY(form.loadFile(first));
    QVERIFY(form.loadFile(second));

    QCOMPARE(tree->topLevelItemCount(), 13);
    int functionRows = 0;
    for (int g = 0; g < 12; ++g)
        functionRows += tree->topLevelItem(g)->childCount();
    QCOMPARE(functionRows, 154);
    QCOMPARE(KeysConfForm::commandGroup(), tree->topLevelItem(12));
    QCOMPARE(KeysConfForm::commandGroup()->childCount(), 1);
    QCOMPARE(KeysConfForm::commandGroup()->child(0)->text(0), QStringLiteral("xclock"));
}

ZEM_TEST_MAIN(TestCatalogue)
#include "tst_catalogue.moc"

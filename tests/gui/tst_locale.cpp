// The editor under a German locale: its own catalogue, the function catalogue's descriptions
// included, found beside the program as an installed one would find it.
#include "keysconfform.h"
#include "testenvironment.h"
#include "zemcore.h"

#include <QMenuBar>
#include <QTreeWidget>
#include <QTreeWidgetItemIterator>
#include <QtTest>

class TestLocale : public QObject
{
    Q_OBJECT

private slots:
    void german();
};

void TestLocale::german()
{
    zemInit(ZEM_VERSION_STRING, "Zem hotkeys editor");
    QVERIFY(writeFile(QString::fromLocal8Bit(qgetenv("ZEM_SYSTEM_DIR")) + "/keyshortcutrc",
                      "[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n"));
    QVERIFY(
        writeFile(QString::fromLocal8Bit(qgetenv("ZEM_USER_DIR")) + "/keyshortcutrc", "[ShortCutKeys]\n"));
    KeysConfForm form;
    QVERIFY(form.init(QString::fromLocal8Bit(qgetenv("ZEM_USER_DIR")) + "/keyshortcutrc"));
    QCOMPARE(form.menuWidget()->findChildren<QMenu*>().first()->title(), QStringLiteral("&Datei"));
    for (QTreeWidgetItemIterator it(form.findChild<QTreeWidget*>()); *it; ++it) {
        if ((*it)->text(2) == QLatin1String("ZEMWM_CLOSE")) {
            QCOMPARE((*it)->text(0), QStringLiteral("Fenster schließen (empfohlen)"));
            QCOMPARE((*it)->text(3), QStringLiteral("System"));
            return;
        }
    }
    QFAIL("no row for ZEMWM_CLOSE");
}

int main(int argc, char** argv)
{
    qputenv("LANG", "de_DE.UTF-8");
    qputenv("LC_ALL", "de_DE.UTF-8");
    TestEnvironment environment;
    QApplication app(argc, argv);
    TestLocale test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_locale.moc"

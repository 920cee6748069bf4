// The command selection dialog: the command line, its remembered sizes, picking an executable
// and picking from the desktop menu.
#include "modalanswerer.h"
#include "selectcommanddialog.h"
#include "testenvironment.h"

#include <QDialogButtonBox>
#include <QDir>
#include <QLineEdit>
#include <QPushButton>
#include <QSettings>
#include <QToolButton>
#include <QTreeWidget>
#include <QtTest>

using Answers = QList<QMessageBox::StandardButton>;
Q_DECLARE_METATYPE(Answers)

class TestCommandDialog : public QObject
{
    Q_OBJECT

private slots:
    void init();

    void layout();
    void setCommandSelectsArguments_data();
    void setCommandSelectsArguments();
    void acceptSimplifiesWhiteSpace();
    void sizeRemembered_data();
    void sizeRemembered();
    void executableLoop_data();
    void executableLoop();
    void fileDialogSizeStoredOnCancel();
    void fromDesktopMenu();

private:
    QTemporaryDir scratch;
};

void TestCommandDialog::init()
{
    QSettings().clear();
}

void TestCommandDialog::layout()
{
    SelectCommandDialog dialog(nullptr);
    QCOMPARE(dialog.objectName(), QStringLiteral("commandDialog"));
    QCOMPARE(dialog.windowTitle(), QStringLiteral("Select Command"));
    for (const char* name : {"verticalLayout", "gridLayout", "commandLabel", "commandLineEdit",
                             "selectCommandFileButton", "selectFromMenuButton", "buttonBox"})
        QVERIFY2(dialog.findChild<QObject*>(QLatin1String(name)), name);
    QCOMPARE(dialog.findChild<QToolButton*>("selectCommandFileButton")->text(), QStringLiteral("..."));
    QCOMPARE(dialog.sizePolicy().verticalPolicy(), QSizePolicy::Fixed);
    QCOMPARE(dialog.findChild<QDialogButtonBox*>("buttonBox")->standardButtons(),
             QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
}

void TestCommandDialog::setCommandSelectsArguments_data()
{
    QTest::addColumn<QString>("command");
    QTest::addColumn<QString>("selected");

    QTest::newRow("program and arguments") << "xterm -e top"
                                           << "-e top";
    QTest::newRow("program alone") << "xterm"
                                   << "";
    QTest::newRow("leading blank") << " xterm -e top"
                                   << "";
    QTest::newRow("two blanks after the program") << "xterm  -e"
                                                  << " -e";
    QTest::newRow("trailing blank only") << "xterm "
                                         << "";
}

void TestCommandDialog::setCommandSelectsArguments()
{
    QFETCH(QString, command);
    QFETCH(QString, selected);
    SelectCommandDialog dialog(nullptr);
    auto* edit = dialog.findChild<QLineEdit*>("commandLineEdit");
    edit->setText(QStringLiteral("old text"));
    edit->selectAll();
    dialog.setCommand(command);
    QCOMPARE(dialog.command(), command);
    QCOMPARE(edit->selectedText(), selected);
}

void TestCommandDialog::acceptSimplifiesWhiteSpace()
{
    SelectCommandDialog dialog(nullptr);
    dialog.findChild<QLineEdit*>("commandLineEdit")->setText(QStringLiteral("  xterm \t -e    top  "));
    QTimer::singleShot(0, &dialog,
                       [&] { dialog.findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok)->click(); });
    QCOMPARE(dialog.exec(), int(QDialog::Accepted));
    QCOMPARE(dialog.command(), QStringLiteral("xterm -e top"));
    QCOMPARE(dialog.findChild<QLineEdit*>("commandLineEdit")->text(), QStringLiteral("xterm -e top"));
}

void TestCommandDialog::sizeRemembered_data()
{
    QTest::addColumn<int>("width");
    QTest::addColumn<int>("height");
    QTest::addColumn<bool>("minimum");

    QTest::newRow("first use") << -1 << -1 << true;
    QTest::newRow("width 0") << 0 << 300 << true;
    QTest::newRow("height 0") << 700 << 0 << true;
    QTest::newRow("stored size") << 640 << 150 << false;
}

void TestCommandDialog::sizeRemembered()
{
    QFETCH(int, width);
    QFETCH(int, height);
    QFETCH(bool, minimum);
    if (width >= 0) {
        QSettings settings;
        settings.setValue("SelectCommandDialog/Width", width);
        settings.setValue("SelectCommandDialog/Height", height);
    }
    {
        SelectCommandDialog dialog(nullptr);
        QCOMPARE(dialog.size(), minimum ? dialog.minimumSizeHint() : QSize(width, height));
        dialog.resize(610, 140);
        static_cast<QDialog&>(dialog).reject(); // the close button and Escape come here too
    }
    QSettings settings;
    QCOMPARE(settings.value("SelectCommandDialog/Width").toInt(), 610);
    QCOMPARE(settings.value("SelectCommandDialog/Height").toInt(), 140);
    SelectCommandDialog again(nullptr);
    QCOMPARE(again.size(), QSize(610, 140));
}

void TestCommandDialog::executableLoop_data()
{
    QTest::addColumn<QStringList>("choices"); // files chosen in turn, relative to the scratch dir
    QTest::addColumn<Answers>("answers");
    QTest::addColumn<QStringList>("boxTitles");
    QTest::addColumn<QString>("command"); // relative to the scratch dir; empty: unchanged

    QTest::newRow("missing file, Cancel") << QStringList{"no-such-program"} << Answers{QMessageBox::Cancel}
                                          << QStringList{"File doesn't exist"} << "";
    QTest::newRow("not executable, Cancel") << QStringList{"plain.txt"} << Answers{QMessageBox::Cancel}
                                            << QStringList{"File isn't executable"} << "";
    QTest::newRow("directory is no program")
        << QStringList{"bin"} << Answers{QMessageBox::Cancel} << QStringList{"File isn't executable"} << "";
    QTest::newRow("missing, then another choice")
        << QStringList{"no-such-program", "bin/tool"} << Answers{QMessageBox::Yes}
        << QStringList{"File doesn't exist"} << "bin/tool";
    QTest::newRow("link to an executable is resolved")
        << QStringList{"links/tool link"} << Answers{} << QStringList() << "bin/tool";
    QTest::newRow("file dialog cancelled") << QStringList{""} << Answers{} << QStringList() << "";
}

void TestCommandDialog::executableLoop()
{
    QFETCH(QStringList, choices);
    QFETCH(Answers, answers);
    QFETCH(QStringList, boxTitles);
    QFETCH(QString, command);

    const QDir dir(scratch.path());
    QVERIFY(writeFile(dir.filePath("bin/tool"), "#!/bin/sh\n"));
    QVERIFY(QFile::setPermissions(dir.filePath("bin/tool"), QFileDevice::ReadOwner | QFileDevice::ExeOwner));
    QVERIFY(writeFile(dir.filePath("plain.txt"), "text\n"));
    QDir().mkpath(dir.filePath("links"));
    QFile::link(dir.filePath("bin/tool"), dir.filePath("links/tool link"));

    QStringList files;
    for (const QString& choice : choices)
        files << (choice.isEmpty() ? QString() : dir.filePath(choice));
    SelectCommandDialog dialog(nullptr);
    dialog.setCommand(QStringLiteral("before"));
    auto answering = std::make_unique<ModalAnswerer>(answers, files);
    const ModalAnswerer& answerer = *answering;
    QMetaObject::invokeMethod(dialog.findChild<QToolButton*>("selectCommandFileButton"), "click");

    QCOMPARE(answerer.titles(), boxTitles);
    for (const ModalAnswerer::Box& box : answerer.boxes()) {
        QCOMPARE(box.parent, &dialog);
        QCOMPARE(box.buttons, QMessageBox::Yes | QMessageBox::Cancel);
    }
    QCOMPARE(answerer.fileDialogs().size(), choices.size());
    QVERIFY(!answerer.fileDialogs().isEmpty());
    QCOMPARE(answerer.fileDialogs().first().caption, QStringLiteral("Open executable"));
    QCOMPARE(answerer.fileDialogs().first().directory, QStringLiteral("/usr/bin"));
    QCOMPARE(answerer.fileDialogs().first().size, QSize(600, 400));
    QVERIFY(answerer.fileDialogs().first().listView);

    const QString canonicalDir = QFileInfo(dir.filePath("bin")).canonicalFilePath();
    if (command.isEmpty()) {
        QCOMPARE(dialog.command(), QStringLiteral("before"));
        QVERIFY(!QSettings().contains("SelectCommandDialog/defaultSelectDialogDir"));
    } else {
        QCOMPARE(dialog.command(), QFileInfo(dir.filePath(command)).canonicalFilePath());
        QCOMPARE(QSettings().value("SelectCommandDialog/defaultSelectDialogDir").toString(), canonicalDir);
        // The next file dialog starts where the last executable was.
        answering.reset();
        ModalAnswerer next({}, {QString()});
        QMetaObject::invokeMethod(dialog.findChild<QToolButton*>("selectCommandFileButton"), "click");
        QCOMPARE(next.fileDialogs().size(), 1);
        QCOMPARE(next.fileDialogs().first().directory, canonicalDir);
    }
}

void TestCommandDialog::fileDialogSizeStoredOnCancel()
{
    QSettings().setValue("SelectCommandDialog/fileDialogSize", QSize(700, 500));
    SelectCommandDialog dialog(nullptr);
    {
        ModalAnswerer answerer({}, {QString()});
        QMetaObject::invokeMethod(dialog.findChild<QToolButton*>("selectCommandFileButton"), "click");
        QCOMPARE(answerer.fileDialogs().size(), 1);
        QCOMPARE(answerer.fileDialogs().first().size, QSize(700, 500));
    }
    // Stored again after the cancelled run: the size the dialog had.
    QSettings().remove("SelectCommandDialog/fileDialogSize");
    ModalAnswerer again({}, {QString()});
    QMetaObject::invokeMethod(dialog.findChild<QToolButton*>("selectCommandFileButton"), "click");
    QCOMPARE(again.fileDialogs().size(), 1);
    QCOMPARE(QSettings().value("SelectCommandDialog/fileDialogSize").toSize(), QSize(600, 400));
}

void TestCommandDialog::fromDesktopMenu()
{
    const QString data = scratch.filePath("menu data");
    QVERIFY(writeFile(data + "/applications/calc.desktop",
                      "[Desktop Entry]\nType=Application\nName=Calculator\nExec=galc --mode=sci %U\n"
                      "Categories=Utility;\n"));
    qputenv("XDG_DATA_HOME", QFile::encodeName(data));
    qputenv("XDG_DATA_DIRS", QFile::encodeName(scratch.filePath("nothing here")));

    SelectCommandDialog dialog(nullptr);
    dialog.setCommand(QStringLiteral("old command --flag"));
    ModalAnswerer answerer;
    answerer.onOtherDialog([](QDialog* menu) {
        auto* tree = menu->findChild<QTreeWidget*>("applicationTree");
        tree->setCurrentItem(tree->topLevelItem(0)->child(0));
        menu->accept();
    });
    QMetaObject::invokeMethod(dialog.findChild<QToolButton*>("selectFromMenuButton"), "click");
    QCOMPARE(answerer.otherDialogCount(), 1);
    QCOMPARE(dialog.command(), QStringLiteral("galc --mode=sci"));
    QVERIFY(dialog.findChild<QLineEdit*>("commandLineEdit")->selectedText().isEmpty());

    // Cancelling the menu changes nothing.
    ModalAnswerer cancelling;
    cancelling.onOtherDialog([](QDialog* menu) { menu->reject(); });
    QMetaObject::invokeMethod(dialog.findChild<QToolButton*>("selectFromMenuButton"), "click");
    QCOMPARE(dialog.command(), QStringLiteral("galc --mode=sci"));
}

ZEM_TEST_MAIN(TestCommandDialog)
#include "tst_commanddialog.moc"

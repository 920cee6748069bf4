#include "modalanswerer.h"

#include <QAbstractButton>
#include <QApplication>
#include <QFileDialog>
#include <QLineEdit>
#include <QPushButton>

ModalAnswerer::ModalAnswerer(QList<QMessageBox::StandardButton> answers, QStringList files)
    : answers(std::move(answers)), files(std::move(files))
{
    // Polled from the nested event loop of the box itself.
    connect(&timer, &QTimer::timeout, this, &ModalAnswerer::poll);
    timer.start(10);
    live().append(this);
}

ModalAnswerer::~ModalAnswerer()
{
    live().removeOne(this);
}

QList<ModalAnswerer*>& ModalAnswerer::live()
{
    static QList<ModalAnswerer*> answerers;
    return answerers;
}

QStringList ModalAnswerer::titles() const
{
    QStringList result;
    for (const Box& box : seen)
        result << box.title;
    return result;
}

void ModalAnswerer::poll()
{
    // While a test has two answerers, the one made last does the answering.
    if (live().last() != this)
        return;
    QWidget* modal = QApplication::activeModalWidget();
    if (!modal || !modal->isVisible() || modal->property("zemAnswered").toBool())
        return;

    if (auto* dialog = qobject_cast<QFileDialog*>(modal)) {
        dialog->setProperty("zemAnswered", true);
        dialogs.append({dialog->windowTitle(), dialog->directory().absolutePath(),
                        dialog->acceptMode() == QFileDialog::AcceptSave, dialog->size(),
                        dialog->viewMode() == QFileDialog::List});
        const QString file = files.isEmpty() ? QString() : files.takeFirst();
        if (file.isEmpty()) {
            dialog->reject();
        } else {
            // Accepted as chosen, without the dialog's own questions about replacing a file.
            // Typed into the name field in full, as a user may; the directory need not exist.
            if (auto* name = dialog->findChild<QLineEdit*>(QStringLiteral("fileNameEdit")))
                name->setText(file);
            else
                dialog->selectFile(file);
            static_cast<QDialog*>(dialog)->done(QDialog::Accepted);
        }
        return;
    }

    auto* box = qobject_cast<QMessageBox*>(modal);
    if (!box) {
        if (auto* dialog = qobject_cast<QDialog*>(modal); dialog && otherDialogs) {
            dialog->setProperty("zemAnswered", true);
            ++othersSeen;
            otherDialogs(dialog);
        }
        return;
    }
    box->setProperty("zemAnswered", true);

    Box record;
    record.title = box->windowTitle();
    record.text = box->text();
    record.parent = box->parentWidget();
    record.buttons = box->standardButtons();
    if (QAbstractButton* preset = box->defaultButton())
        record.defaultButton = box->standardButton(preset);
    const QMessageBox::StandardButton answer = answers.isEmpty()              ? QMessageBox::Ok
                                               : seen.size() < answers.size() ? answers.at(seen.size())
                                                                              : answers.last();
    seen.append(record);

    if (QAbstractButton* button = box->button(answer))
        button->click();
    else
        box->reject();
}

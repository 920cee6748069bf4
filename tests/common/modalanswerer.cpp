#include "modalanswerer.h"

#include <QAbstractButton>
#include <QApplication>
#include <QFileDialog>
#include <QLineEdit>

ModalAnswerer::ModalAnswerer(QList<QMessageBox::StandardButton> answers, QStringList files)
    : answers(std::move(answers)), files(std::move(files))
{
    // Polled from the nested event loop of the box itself.
    connect(&timer, &QTimer::timeout, this, &ModalAnswerer::poll);
    timer.start(10);
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
    QWidget* modal = QApplication::activeModalWidget();
    if (!modal || !modal->isVisible() || modal->property("zemAnswered").toBool())
        return;
    modal->setProperty("zemAnswered", true);

    if (auto* dialog = qobject_cast<QFileDialog*>(modal)) {
        const QString file = files.isEmpty() ? QString() : files.takeFirst();
        auto* name = dialog->findChild<QLineEdit*>(QStringLiteral("fileNameEdit"));
        if (file.isEmpty() || !name) {
            dialog->reject();
            return;
        }
        // Typed into the name field in full, as a user may, and taken without further questions.
        name->setText(file);
        static_cast<QDialog*>(dialog)->done(QDialog::Accepted);
        return;
    }
    auto* box = qobject_cast<QMessageBox*>(modal);
    if (!box) {
        if (auto* dialog = qobject_cast<QDialog*>(modal); dialog && otherDialogs)
            otherDialogs(dialog);
        return;
    }
    const QMessageBox::StandardButton answer =
        answers.isEmpty() ? QMessageBox::Ok : answers.value(seen.size(), answers.last());
    seen.append({box->windowTitle(), box->text()});
    if (QAbstractButton* button = box->button(answer))
        button->click();
    else
        box->reject();
}

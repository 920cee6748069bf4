#include "modalanswerer.h"

#include <QAbstractButton>
#include <QApplication>
#include <QPushButton>

ModalAnswerer::ModalAnswerer(QList<QMessageBox::StandardButton> answers)
    : answers(std::move(answers))
{
    // Polled from the nested event loop of the box itself.
    connect(&timer, &QTimer::timeout, this, &ModalAnswerer::poll);
    timer.start(10);
}

ModalAnswerer::~ModalAnswerer() = default;

void ModalAnswerer::poll()
{
    auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
    if (!box || !box->isVisible() || box->property("zemAnswered").toBool())
        return;
    box->setProperty("zemAnswered", true);

    Box record;
    record.title = box->windowTitle();
    record.text = box->text();
    record.parent = box->parentWidget();
    record.buttons = box->standardButtons();
    if (QAbstractButton* preset = box->defaultButton())
        record.defaultButton = box->standardButton(preset);
    const QMessageBox::StandardButton answer = answers.isEmpty() ? QMessageBox::Ok
        : seen.size() < answers.size()                          ? answers.at(seen.size())
                                                                 : answers.last();
    seen.append(record);

    if (QAbstractButton* button = box->button(answer))
        button->click();
    else
        box->reject();
}

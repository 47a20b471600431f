#include "Update/UpdateMessage.h"

#include <QCheckBox>
#include <QPushButton>
#include <QTextEdit>
#include <QVBoxLayout>

namespace orvela {

namespace {

QTextEdit* messageOf(const QString& text) {
    auto* message = new QTextEdit;
    message->setPlainText(text); // what came from the server is no markup
    message->setReadOnly(true);
    message->setTabChangesFocus(true);
    message->setAccessibleName(UpdateMessage::tr("Message"));
    message->setStyleSheet(QStringLiteral("border:0px;"));
    message->viewport()->setAutoFillBackground(false); // it is no place to type
    message->setFixedHeight(50);
    message->setMinimumWidth(420); // for two lines of it
    return message;
}

} // namespace

UpdateMessage::UpdateMessage(const QString& text)
    : mDoNotShow(new QCheckBox(tr("Do not show this message again"))) {
    auto* ok = new QPushButton(tr("Ok"));
    ok->setDefault(true);
    auto* choice = new QHBoxLayout;
    choice->addWidget(mDoNotShow);
    choice->addStretch();
    auto* buttons = new QHBoxLayout;
    buttons->addStretch();
    buttons->addWidget(ok);
    buttons->addStretch();
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(messageOf(text));
    layout->addLayout(choice);
    layout->addLayout(buttons);
    ok->setFocus();
    connect(ok, &QPushButton::clicked, this, &QDialog::accept);
}

} // namespace orvela

// SPDX-License-Identifier: MIT
#include "templates/KvUserMessages.h"

#include <QMessageBox>

KvUserMessages::~KvUserMessages() = default;

void KvMessageBoxes::warn(const QString &title, const QString &text)
{
    QMessageBox box(QMessageBox::Warning, title, text, QMessageBox::Ok);
    // File names stand in the text, and they may look like markup.
    box.setTextFormat(Qt::PlainText);
    box.exec();
}

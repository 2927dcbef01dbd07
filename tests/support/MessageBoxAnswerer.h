// SPDX-License-Identifier: MIT
#pragma once

#include <QApplication>
#include <QMessageBox>
#include <QTimer>
#include <QVector>

/** What a modal message box looked like. */
struct SeenMessageBox
{
    QString title;
    QString text;
    QMessageBox::Icon icon = QMessageBox::NoIcon;
    QMessageBox::StandardButtons buttons = QMessageBox::NoButton;
    bool isModal = false;
    bool hasParent = false;
};

/** While it lives, notes every modal message box and presses one of its buttons. */
class MessageBoxAnswerer
{
public:
    explicit MessageBoxAnswerer(QMessageBox::StandardButton answer = QMessageBox::Ok)
        : m_answer(answer)
    {
        QObject::connect(&m_timer, &QTimer::timeout, &m_timer, [this]() { answerBox(); });
        m_timer.start(5);
    }

    /** Presses the button with a text. */
    explicit MessageBoxAnswerer(const QString &buttonText)
        : MessageBoxAnswerer(QMessageBox::NoButton)
    {
        m_buttonText = buttonText;
    }

    const QVector<SeenMessageBox> &boxes() const { return m_boxes; }

private:
    void answerBox()
    {
        auto *box = qobject_cast<QMessageBox *>(QApplication::activeModalWidget());
        if (!box || !box->isVisible())
            return;
        m_boxes.append({box->windowTitle(), box->text(), box->icon(), box->standardButtons(), box->isModal(),
                        box->parentWidget() != nullptr});
        if (QAbstractButton *button = m_buttonText.isEmpty() ? box->button(m_answer) : buttonWithText(*box))
            button->click();
        else
            box->reject();
    }

    QAbstractButton *buttonWithText(const QMessageBox &box) const
    {
        for (QAbstractButton *button : box.buttons()) {
            if (button->text().remove(QLatin1Char('&')) == m_buttonText)
                return button;
        }
        return nullptr;
    }

    QMessageBox::StandardButton m_answer;
    QString m_buttonText;
    QTimer m_timer;
    QVector<SeenMessageBox> m_boxes;
};

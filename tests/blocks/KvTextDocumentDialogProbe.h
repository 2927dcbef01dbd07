// SPDX-License-Identifier: MIT
#pragma once

#include <QApplication>
#include <QTimer>

#include <functional>

/** While it lives, hands each modal dialog of one type, once it is up, to a function that answers it. */
template <typename Dialog>
class KvTextDocumentDialogProbe
{
public:
    explicit KvTextDocumentDialogProbe(const std::function<void(Dialog *)> &answer)
        : m_answer(answer)
    {
        QObject::connect(&m_timer, &QTimer::timeout, &m_timer, [this]() { answerDialog(); });
        m_timer.start(5);
    }

    int count() const { return m_count; }

private:
    void answerDialog()
    {
        auto *dialog = qobject_cast<Dialog *>(QApplication::activeModalWidget());
        if (!dialog || !dialog->isVisible())
            return;
        ++m_count;
        m_answer(dialog);
    }

    std::function<void(Dialog *)> m_answer;
    QTimer m_timer;
    int m_count = 0;
};

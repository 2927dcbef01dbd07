// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

/** How the user is told of a failure. Programs without a display install another one in the template model.
 */
class KvUserMessages
{
public:
    virtual ~KvUserMessages();

    /** A fault that the user has to know of before anything goes on. */
    virtual void warn(const QString &title, const QString &text) = 0;
};

/** Shows modal warning boxes with a single Ok button. */
class KvMessageBoxes : public KvUserMessages
{
public:
    void warn(const QString &title, const QString &text) override;
};

// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

#include <memory>

class ZtAravisControl;
class ZtFrameMailbox;

/** The work of the thread that talks to an Aravis camera, from opening it to closing it. */
class ZtAravisCapture
{
public:
    /** \param title what the user calls the camera, for faults */
    ZtAravisCapture(const QString &deviceId, const QString &title, std::shared_ptr<ZtAravisControl> control,
                    std::shared_ptr<ZtFrameMailbox> mailbox);

    /** Delivers frames until the mailbox is closed or the camera is gone; failures go to the mailbox. */
    void run();

private:
    QString m_deviceId;
    QString m_title;
    std::shared_ptr<ZtAravisControl> m_control;
    std::shared_ptr<ZtFrameMailbox> m_mailbox;
};

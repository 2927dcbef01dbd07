// SPDX-License-Identifier: MIT
#pragma once

#include "support/StatReportTest.h"

#include <QFile>
#include <QFileInfo>

#include <unistd.h>

/**
 * While it lives, file permissions count, also for tests that run as the superuser, who may read every file.
 * The folder of the test's temporary files stays open to it.
 */
class UnprivilegedUser
{
public:
    UnprivilegedUser()
        : m_isSuperuser(geteuid() == 0)
    {
        const QString folder = QFileInfo(StatReportTest::temporaryPath(QStringLiteral("any"))).path();
        // The superuser's group stays.
        QFile::setPermissions(folder, QFile::permissions(folder) | QFileDevice::ReadGroup | QFileDevice::ExeGroup |
                                          QFileDevice::ReadOther | QFileDevice::ExeOther);
        m_isUnprivileged = !m_isSuperuser || seteuid(kNobody) == 0;
    }
    ~UnprivilegedUser()
    {
        if (m_isSuperuser && seteuid(0) != 0)
            qFatal("the superuser's rights did not come back");
    }
    UnprivilegedUser(const UnprivilegedUser &) = delete;
    UnprivilegedUser &operator=(const UnprivilegedUser &) = delete;

    bool isUnprivileged() const { return m_isUnprivileged; }

private:
    static constexpr uid_t kNobody = 65534;

    bool m_isSuperuser;
    bool m_isUnprivileged = false;
};

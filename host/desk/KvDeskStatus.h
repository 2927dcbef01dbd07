// SPDX-License-Identifier: MIT
#pragma once

#include <QColor>
#include <QCoreApplication>
#include <QString>

/** How the categories of the status log are shown, and a short way of logging. */
class KvDeskStatus
{
    Q_DECLARE_TR_FUNCTIONS(KvDeskStatus)
public:
    /** \a category is a ZtAppStatus::Category, \a source is "Class::method". */
    static void log(int category, const QString &message, const QString &source);

    /** Name of a category; numbers that are none count as information. */
    static QString categoryName(int category);
    /** The category's icon for acss::createIcon(). */
    static QString iconPath(int category);
    /** The colour of the category's name in the current theme. */
    static QColor color(int category);
};

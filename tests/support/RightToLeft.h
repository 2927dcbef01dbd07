// SPDX-License-Identifier: MIT
#pragma once

#include <QGuiApplication>
#include <QString>

/** While it lives, the program runs from right to left. */
class RightToLeft
{
public:
    RightToLeft() { QGuiApplication::setLayoutDirection(Qt::RightToLeft); }
    ~RightToLeft() { QGuiApplication::setLayoutDirection(Qt::LeftToRight); }
    RightToLeft(const RightToLeft &) = delete;
    RightToLeft &operator=(const RightToLeft &) = delete;

    /** A text that keeps its own direction among others. */
    static QString isolated(const QString &text) { return QChar(0x2066) + text + QChar(0x2069); }
};

// SPDX-License-Identifier: MIT
#pragma once

#include <QCoreApplication>
#include <QTranslator>

/**
 * "Translates" every text of one context by putting it in brackets, while it lives. Shows which texts of a
 * class are translated, and under which context.
 */
class BracketTranslator : public QTranslator
{
public:
    explicit BracketTranslator(const QString &context)
        : m_context(context)
    {
        QCoreApplication::installTranslator(this);
    }
    ~BracketTranslator() override { QCoreApplication::removeTranslator(this); }

    bool isEmpty() const override { return false; }
    QString translate(const char *context, const char *sourceText, const char *disambiguation,
                      int n) const override
    {
        Q_UNUSED(disambiguation)
        Q_UNUSED(n)
        return m_context == QLatin1String(context)
                   ? QLatin1Char('[') + QString::fromUtf8(sourceText) + QLatin1Char(']')
                   : QString();
    }

private:
    QString m_context;
};

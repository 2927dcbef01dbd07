// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>
#include <QVector>

#include <functional>

class ZtAppSettings;

/** One placeholder that texts of a report may hold. */
struct KvReportKeyword
{
    QString label;                  ///< translated, for the list that inserts it
    QString keyword;                ///< as it stands in texts, "${" and "}" included
    std::function<QString()> value; ///< computes the replacement, anew at each call
};

/** The fixed table of the placeholders ${NAME} and their replacement in texts. */
class KvReportKeywords : public QObject
{
    Q_OBJECT
public:
    explicit KvReportKeywords(QObject *parent = nullptr);

    /** All keywords in their fixed order. */
    const QVector<KvReportKeyword> &keywords() const { return m_keywords; }

    /**
     * Replaces every keyword in \a text, case-sensitively, keyword by keyword over the already replaced text:
     * a program name that holds "${PROGRAM_VENDOR}" is expanded too, not the other way round. Values are not
     * escaped. Anything else of the form ${...} stays.
     */
    void expand(QString &text) const;

private:
    void addDateKeywords();
    void addProgramKeywords();

    ZtAppSettings *m_settings;
    QVector<KvReportKeyword> m_keywords;
};

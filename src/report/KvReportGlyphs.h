// SPDX-License-Identifier: MIT
#pragma once

#include <QCoreApplication>

class KvTemplateModel;
class QString;

/** Finds the characters of a report that would vanish from its pages, as no installed font has them. */
class KvReportGlyphs
{
    Q_DECLARE_TR_FUNCTIONS(KvReportGlyphs)

public:
    /** Names the characters and what to install, in the status log; nothing when every character is there. */
    static void logMissing(const KvTemplateModel &model);

private:
    static QString missingCharacters(const KvTemplateModel &model);
    static QString warning(const QString &characters);
};

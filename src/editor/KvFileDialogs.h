// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

class QWidget;

/** What a file dialog asks for. */
struct KvFileQuestion
{
    QString caption;   ///< translated
    QString directory; ///< where the dialog starts
    QString filter;    ///< translated, such as "Pdf file (*.pdf)"
    QString suffix;    ///< of saved files, without a dot
    QString fileName;  ///< suggested for saving; may be empty
};

/** The modal file dialogs of the templates editor. An empty answer means that the user cancelled. */
namespace KvFileDialogs {

QString openFileName(QWidget *parent, const KvFileQuestion &question);

/**
 * The name ends with the suffix. Where that had to be appended the dialog has asked about another file, so
 * the user is asked again before one that exists is overwritten.
 */
QString saveFileName(QWidget *parent, const KvFileQuestion &question);

/**
 * \a path with the suffix appended unless that is all of its suffix: "a" and "a.b.rtp" become "a.rtp" and
 * "a.b.rtp.rtp".
 */
QString withSuffix(const QString &path, const QString &suffix);

} // namespace KvFileDialogs

// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

class QPixmap;

/** Pictures that stand inside of a text and are saved with it. */
namespace KvTextDocumentPicture {

/** A picture on a line of its text, without text flowing around it. */
const char NotFloating[] = "style=\"float:none;\"";

/**
 * An image element that holds \a picture as PNG data and shows it \a width pixels wide.
 *
 * The picture keeps up to three times the pixels it is shown with, for print. Empty if it cannot be encoded.
 * \param placement the element's style attribute
 */
QString html(const QPixmap &picture, int width, const QString &placement);

} // namespace KvTextDocumentPicture

// SPDX-License-Identifier: MIT
#include "measuring/ZtTextDecoder.h"

#include "measuring/ZtFault.h"

#include <QCoreApplication>
#include <QTextCodec>

#include <memory>

namespace {

/// Gives the functions of this file a tr() whose context can be seen by the tool that collects the texts.
class Text
{
    Q_DECLARE_TR_FUNCTIONS(ZtTextDecoder)
};

// Lines end with LF, CR LF or CR.
int lineOfByte(const QByteArray &bytes, int position)
{
    int line = 1;
    for (int i = 0; i < position; ++i) {
        const bool isPairStart = bytes.at(i) == '\r' && i + 1 < bytes.size() && bytes.at(i + 1) == '\n';
        if (bytes.at(i) == '\n' || (bytes.at(i) == '\r' && !isPairStart))
            ++line;
    }
    return line;
}

bool isContinuation(unsigned char byte)
{
    return (byte & 0xC0u) == 0x80u;
}

// Bytes that follow a lead byte, or -1 for a byte that cannot lead.
int continuationCount(unsigned char lead)
{
    if (lead < 0x80)
        return 0;
    if (lead >= 0xC2 && lead <= 0xDF)
        return 1;
    if (lead >= 0xE0 && lead <= 0xEF)
        return 2;
    return lead >= 0xF0 && lead <= 0xF4 ? 3 : -1;
}

// The second byte excludes overlong forms, surrogates and code points above U+10FFFF.
bool isSecondByteAllowed(unsigned char lead, unsigned char second)
{
    switch (lead) {
    case 0xE0:
        return second >= 0xA0;
    case 0xED:
        return second <= 0x9F;
    case 0xF0:
        return second >= 0x90;
    case 0xF4:
        return second <= 0x8F;
    default:
        return true;
    }
}

bool isUtf16(const QByteArray &bytes)
{
    return bytes.startsWith("\xFF\xFE") || bytes.startsWith("\xFE\xFF");
}

bool fromUtf16(const QByteArray &bytes, QByteArray *utf8, ZtFault *fault)
{
    QTextCodec *codec = QTextCodec::codecForName("UTF-16");
    QTextCodec::ConverterState state;
    const QString text = codec->toUnicode(bytes.constData(), bytes.size(), &state);
    // Qt hands single surrogates through; they have no UTF-8 form.
    const bool hasLoneSurrogate = !text.isValidUtf16();
    if (state.invalidChars > 0 || state.remainingChars > 0 || hasLoneSurrogate) {
        fault->message = Text::tr("The file is not valid UTF-16 text");
        return false;
    }
    *utf8 = text.toUtf8();
    return true;
}

bool checkUtf8(const QByteArray &bytes, ZtFault *fault)
{
    const int invalid = ZtTextDecoder::firstInvalidByte(bytes);
    if (invalid < 0)
        return true;
    fault->line = lineOfByte(bytes, invalid);
    fault->message = Text::tr("The text is not valid UTF-8");
    return false;
}

} // namespace

int ZtTextDecoder::firstInvalidByte(const QByteArray &bytes)
{
    const auto *data = reinterpret_cast<const unsigned char *>(bytes.constData());
    const int size = bytes.size();
    int i = 0;
    while (i < size) {
        const int more = continuationCount(data[i]);
        if (more < 0 || i + more >= size)
            return i;
        if (more > 0 && !isSecondByteAllowed(data[i], data[i + 1]))
            return i;
        for (int k = 1; k <= more; ++k) {
            if (!isContinuation(data[i + k]))
                return i;
        }
        i += more + 1;
    }
    return -1;
}

bool ZtTextDecoder::toUtf8(const QByteArray &bytes, QByteArray *utf8, ZtFault *fault)
{
    if (isUtf16(bytes)) {
        if (!fromUtf16(bytes, utf8, fault))
            return false;
    } else {
        *utf8 = bytes.startsWith("\xEF\xBB\xBF") ? bytes.mid(3) : bytes;
    }
    const int nul = utf8->indexOf('\0');
    if (nul >= 0) {
        fault->line = lineOfByte(*utf8, nul);
        fault->message = Text::tr("The file is not a text file: it holds a NUL character");
        return false;
    }
    return checkUtf8(*utf8, fault);
}

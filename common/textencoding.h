// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QString>

/// The encoding of one text file.
///
/// A file is read in the locale's encoding where it is valid there, else as UTF-8 where it is valid there, else as
/// Latin-1 (in which any bytes are valid), and written back in the same, so that text nobody edited keeps its bytes. A
/// character that the encoding lacks (typed into a Latin-1 file) is written as UTF-8.
class TextEncoding final
{
public:
    /// The most bytes that a text may have: whatever they are, the text fits into a QString, and as UTF-8 into a
    /// QByteArray.
    static constexpr int longestText{1 << 29};

    /// UTF-8: the encoding of a file that does not exist yet.
    TextEncoding() = default;

    /// The encoding in which `bytes` are read; it decodes and encodes them without loss.
    static TextEncoding detect(const QByteArray &bytes);

    /// The same in a locale of another charset.
    static TextEncoding detect(const QByteArray &bytes, const QByteArray &charset);

    QString decode(const QByteArray &bytes) const;
    QByteArray encode(const QString &text) const;

    /// As decode() and encode(), with the text as UTF-8; neither copies when the file is UTF-8.
    QByteArray toUtf8(const QByteArray &bytes) const;
    QByteArray fromUtf8(const QByteArray &utf8) const;

private:
    explicit TextEncoding(const QByteArray &charset);

    QByteArray m_charset; // as the C library names it; empty: UTF-8
};

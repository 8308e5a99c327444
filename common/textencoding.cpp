// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/textencoding.h"

TextEncoding::TextEncoding(QTextCodec *codec)
    : m_codec{codec}
{
}

TextEncoding TextEncoding::detect(const QByteArray & /*bytes*/) { return {}; }

QString TextEncoding::decode(const QByteArray &bytes) const { return QString::fromUtf8(toUtf8(bytes)); }

QByteArray TextEncoding::encode(const QString &text) const { return fromUtf8(text.toUtf8()); }

QByteArray TextEncoding::toUtf8(const QByteArray &bytes) const { return bytes; }

QByteArray TextEncoding::fromUtf8(const QByteArray &utf8) const { return utf8; }

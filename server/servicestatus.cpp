// SPDX-License-Identifier: GPL-3.0-or-later
#include "server/servicestatus.h"

#include <QByteArray>
#include <QRegularExpression>
#include <QString>

namespace {

// The text without null bytes and without the escape sequences of colours and links, which could part a phrase.
QString plainText(const QByteArray &printed)
{
    static const QRegularExpression sequence{
        QStringLiteral("\x1b(?:\\[[0-?]*[ -/]*[@-~]|\\][^\x07\x1b]*(?:\x07|\x1b\\\\))")};
    QString text{QString::fromUtf8(printed.constData(), printed.size())};
    text.remove(QChar{});
    return text.remove(sequence);
}

} // namespace

ServiceStatus::ServiceStatus(const QByteArray &printed)
{
    const QString text{plainText(printed)};
    exited = text.contains(QLatin1String{"Active: active (exited)"});
    failed = text.contains(QLatin1String{"Active: failed"});
    stopped = exited || failed || text.contains(QLatin1String{"Active: inactive (dead)"});
    running = text.contains(QLatin1String{"Active: active (running)"});
}

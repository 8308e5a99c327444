// SPDX-License-Identifier: GPL-3.0-or-later
#include "platform/displaycheck.h"

#include <QByteArrayList>
#include <QString>
#include <QStringList>

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace {

QtMessageHandler handlerBefore{};

// What the platform plugins have said. The first of it is the reason of a failure, the rest what came of that.
QStringList &said()
{
    static QStringList lines;
    return lines;
}

bool isAnyNamed()
{
    const QByteArrayList names{QByteArrayLiteral("DISPLAY"), QByteArrayLiteral("WAYLAND_DISPLAY"),
                               QByteArrayLiteral("QT_QPA_PLATFORM")};
    return std::any_of(names.begin(), names.end(),
                       [](const QByteArray &name) { return !qEnvironmentVariableIsEmpty(name.constData()); });
}

QString reason(const QString &fatal)
{
    if (!isAnyNamed())
        return QStringLiteral("there is no display: neither DISPLAY nor WAYLAND_DISPLAY is set");
    const QString first{said().isEmpty() ? fatal : said().constFirst()};
    return QStringLiteral("the display cannot be opened: ") + first.section(QLatin1Char{'\n'}, 0, 0).trimmed();
}

void handle(QtMsgType type, const QMessageLogContext &context, const QString &message)
{
    if (type == QtFatalMsg) {
        std::fprintf(stderr, "%s: %s\n", program_invocation_short_name, reason(message).toLocal8Bit().constData());
        std::_Exit(EXIT_FAILURE); // half of Qt is made, and none of it can be taken down
    }
    if (std::strncmp(context.category, "qt.qpa.", 7) == 0)
        said().append(message);
    else
        handlerBefore(type, context, message);
}

} // namespace

DisplayCheck::DisplayCheck() { handlerBefore = qInstallMessageHandler(handle); }

DisplayCheck::~DisplayCheck()
{
    qInstallMessageHandler(handlerBefore);
    for (const QString &line : qAsConst(said()))
        qWarning("%s", qPrintable(line));
}

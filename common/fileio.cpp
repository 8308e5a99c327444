// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/fileio.h"

#include <QFile>
#include <QSaveFile>

namespace fileio {

std::optional<QByteArray> readFile(const QString &path, QString *reason)
{
    QFile file{path};
    if (!file.open(QIODevice::ReadOnly)) {
        if (reason)
            *reason = file.errorString();
        return std::nullopt;
    }
    return file.readAll();
}

bool replaceFile(const QString &path, const QByteArray &content, QString *reason)
{
    QSaveFile file{path};
    const bool done = file.open(QIODevice::WriteOnly) && file.write(content) == content.size() && file.commit();
    if (!done && reason)
        *reason = file.errorString();
    return done;
}

} // namespace fileio

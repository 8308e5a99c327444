// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/busycursor.h"

#include <QCursor>
#include <QFileInfo>
#include <QGuiApplication>

namespace {

constexpr qint64 momentaryBytes{qint64{4} << 20U};

} // namespace

BusyCursor::BusyCursor(qint64 bytes)
    : m_shown{bytes > momentaryBytes}
{
    if (m_shown)
        QGuiApplication::setOverrideCursor(QCursor{Qt::WaitCursor});
}

BusyCursor::BusyCursor(const QString &path)
    : BusyCursor{QFileInfo{path}.size()}
{
}

BusyCursor::~BusyCursor()
{
    if (m_shown)
        QGuiApplication::restoreOverrideCursor();
}

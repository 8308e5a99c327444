// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/busycursor.h"

#include <QCursor>
#include <QFileInfo>
#include <QGuiApplication>

namespace {

constexpr qint64 momentaryBytes = qint64{4} << 20U;

} // namespace

BusyCursor::BusyCursor(const QString &path)
    : m_shown{QFileInfo{path}.size() > momentaryBytes}
{
    if (m_shown)
        QGuiApplication::setOverrideCursor(QCursor{Qt::WaitCursor});
}

BusyCursor::~BusyCursor()
{
    if (m_shown)
        QGuiApplication::restoreOverrideCursor();
}

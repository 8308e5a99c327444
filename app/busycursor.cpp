// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/busycursor.h"

#include <QCursor>
#include <QFileInfo>
#include <QGuiApplication>

namespace {

constexpr qint64 momentaryBytes = 4 * 1024 * 1024;

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

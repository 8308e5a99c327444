// SPDX-License-Identifier: GPL-3.0-or-later
// What Qt 5 and Qt 6 do differently. Nothing else asks for the version.
#pragma once

#include <QCoreApplication>
#include <QProcess>
#include <QRegularExpression>
#include <QSortFilterProxyModel>

/// A process whose child prepares itself before it becomes the program.
class PreparedProcess : public QProcess
{
public:
    explicit PreparedProcess(QObject *parent = nullptr)
        : QProcess{parent}
    {
#if QT_VERSION >= QT_VERSION_CHECK(6, 0, 0)
        setChildProcessModifier([this] { prepareChild(); });
#endif
    }
    Q_DISABLE_COPY_MOVE(PreparedProcess)

protected:
    /// Called in the child, where only what a signal handler may call is safe.
    virtual void prepareChild() = 0;

#if QT_VERSION < QT_VERSION_CHECK(6, 0, 0)
private:
    void setupChildProcess() final { prepareChild(); }
#endif
};

/// Has windows and pictures follow the screen's density, as they always do from Qt 6 on. To be called before there is
/// an application.
inline void enableHighDpi()
{
#if QT_VERSION < QT_VERSION_CHECK(6, 0, 0)
    QCoreApplication::setAttribute(Qt::AA_EnableHighDpiScaling);
    QCoreApplication::setAttribute(Qt::AA_UseHighDpiPixmaps);
#endif
}

/// Has a screen reader find the program through the display, as it does without this up to Qt 5: the superuser has no
/// session bus, on which later ones ask whether there is one. To be called before there is an application.
inline void enableScreenReaders()
{
#if QT_VERSION >= QT_VERSION_CHECK(6, 0, 0)
    if (!qEnvironmentVariableIsSet("QT_LINUX_ACCESSIBILITY_ALWAYS_ON"))
        qputenv("QT_LINUX_ACCESSIBILITY_ALWAYS_ON", "1");
#endif
}

/// Whether the model's own filter accepts every row.
inline bool hasEmptyFilter(const QSortFilterProxyModel &model)
{
#if QT_VERSION < QT_VERSION_CHECK(6, 0, 0)
    if (!model.filterRegExp().isEmpty())
        return false;
#endif
    return model.filterRegularExpression().pattern().isEmpty();
}

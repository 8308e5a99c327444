// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QObject>

class QProcess;

/// The DHCP server's own verdict on the text of a configuration, asked from a child process that is never waited for.
///
/// The text is handed over in a memory file that the child inherits, so nothing is staged on disk. Where the server is
/// not found, or the check dies or does not come to a verdict, nothing is told. The destructor ends a check that still
/// runs, without waiting: what is left of it goes with the parent at the latest.
class ConfigCheck final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(ConfigCheck)

public:
    explicit ConfigCheck(QObject *parent);
    ~ConfigCheck() override;

    /// Starts the check of `content`, once.
    void start(const QByteArray &content);

signals:
    /// The server refuses the configuration: its first complaint, with the line where it names one, and all that it
    /// said.
    void refused(const QString &complaint, const QString &output);

private:
    void judge();

    QProcess *m_process{};
    QString m_candidate; // the path under which the child finds the text
};

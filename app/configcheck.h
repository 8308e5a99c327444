// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QObject>
#include <QString>

class QProcess;

/// The DHCP server's own verdict on the text of a configuration, asked from a child process that is never waited for.
///
/// The child inherits the text in a memory file, so nothing is staged on disk. Nothing is told where the server is not
/// found, or where the check dies or comes to no verdict. The destructor ends a check that is still running, without
/// waiting: what is left of it goes with the parent at the latest.
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
    /// The server refuses the configuration: its first complaint, with the line where it names one, and what it said,
    /// which is not read to the end where it is very long.
    void refused(const QString &complaint, const QString &output);

private:
    void readOutput();
    void readVerdict();

    QProcess *m_process{};
    QByteArray m_output;
    QString m_candidate; // the path under which the child finds the text
};

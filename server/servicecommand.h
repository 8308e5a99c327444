// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QByteArray>
#include <QProcess>
#include <QString>

/// One call of `systemctl` after the other for the DHCP server's service. Of each channel 64 KiB are read at most; a
/// call that prints more is ended.
class ServiceCommand final : public QProcess
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(ServiceCommand)

public:
    explicit ServiceCommand(QObject *parent = nullptr);
    ~ServiceCommand() override;

    /// Starts `systemctl` with a verb such as "start", and forgets what the call before printed.
    void send(const QString &verb);
    /// Starts "status" in an environment that makes its output plain: no colours, links, pager or translation.
    void askForStatus();

    /// What was read from standard output.
    const QByteArray &output() const { return m_output; }
    /// What was read from standard error, as text.
    QString complaint() const;
    /// Whether the call was ended because it printed too much; its exit status is a crash then.
    bool printedTooMuch() const { return m_printedTooMuch; }

private:
    void collect(QByteArray &collected, const QByteArray &printed);

    QByteArray m_output;
    QByteArray m_errors;
    bool m_printedTooMuch{};
};

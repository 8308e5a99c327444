// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/configcheck.h"

#include <QProcess>
#include <QStandardPaths>

#include <fcntl.h>
#include <sys/mman.h>
#include <unistd.h>

namespace {

QString findServer()
{
    const QString name = QStringLiteral("dhcpd");
    const QString inPath = QStandardPaths::findExecutable(name);
    return inPath.isEmpty() ? QStandardPaths::findExecutable(name, {QStringLiteral("/usr/sbin")}) : inPath;
}

/// A memory file with `content`, closed in children that do not ask for it; -1 when the system has none to give.
int makeMemoryFile(const QByteArray &content)
{
    const int descriptor = memfd_create("dhcpd.conf", MFD_CLOEXEC);
    if (descriptor < 0)
        return -1;
    qint64 done = 0;
    while (done < content.size()) {
        const ssize_t written =
            write(descriptor, content.constData() + done, static_cast<std::size_t>(content.size() - done));
        if (written < 0 && errno == EINTR)
            continue;
        if (written <= 0) {
            close(descriptor);
            return -1;
        }
        done += written;
    }
    return descriptor;
}

/// A child process that inherits one descriptor, and takes it along when it is destroyed.
class CheckProcess final : public QProcess
{
public:
    CheckProcess(int descriptor, QObject *parent)
        : QProcess{parent}
        , m_descriptor{descriptor}
    {
    }
    ~CheckProcess() override
    {
        // A process object takes it for a mistake to be destroyed before its child has gone.
        kill();
        waitForFinished();
        ::close(m_descriptor);
    }
    Q_DISABLE_COPY_MOVE(CheckProcess)

protected:
    void setupChildProcess() override { fcntl(m_descriptor, F_SETFD, 0); }

private:
    int m_descriptor;
};

/// The first line of the server's output that says what is wrong: behind its banner, and no warning.
QString firstComplaint(const QString &output, const QString &candidate)
{
    const QString banner = QStringLiteral("For info, please visit");
    QStringList lines = output.split(QLatin1Char{'\n'});
    for (int i = 0; i < lines.size(); ++i) {
        if (lines.at(i).startsWith(banner)) {
            lines = lines.mid(i + 1);
            break;
        }
    }
    const QString place = candidate + QStringLiteral(" line ");
    for (const QString &line : qAsConst(lines)) {
        if (line.startsWith(place))
            return ConfigCheck::tr("line %1").arg(line.mid(place.size()));
        if (!line.trimmed().isEmpty() && !line.startsWith(QLatin1String{"WARNING"}))
            return line;
    }
    return {};
}

} // namespace

ConfigCheck::ConfigCheck(QObject *parent)
    : QObject{parent}
{
}

ConfigCheck::~ConfigCheck()
{
    if (!m_process)
        return;
    // Not waited for: the process object goes when the child has gone, or with its parent.
    m_process->disconnect(this);
    if (m_process->state() == QProcess::NotRunning) {
        delete m_process;
        return;
    }
    connect(m_process, qOverload<int, QProcess::ExitStatus>(&QProcess::finished), m_process, &QObject::deleteLater);
    m_process->kill();
}

void ConfigCheck::start(const QByteArray &content)
{
    const QString server = findServer();
    const int descriptor = server.isEmpty() ? -1 : makeMemoryFile(content);
    if (descriptor < 0)
        return;
    m_candidate = QStringLiteral("/proc/self/fd/%1").arg(descriptor);
    m_process = new CheckProcess{descriptor, parent()};
    m_process->setProcessChannelMode(QProcess::MergedChannels);
    m_process->setStandardInputFile(QProcess::nullDevice());
    connect(m_process, qOverload<int, QProcess::ExitStatus>(&QProcess::finished), this, &ConfigCheck::judge);
    m_process->start(server, {QStringLiteral("-t"), QStringLiteral("-cf"), m_candidate});
}

void ConfigCheck::judge()
{
    if (m_process->exitStatus() != QProcess::NormalExit || m_process->exitCode() == 0)
        return;
    const QString output = QString::fromUtf8(m_process->readAll());
    const QString complaint = firstComplaint(output, m_candidate);
    // A server that cannot read the text says so, which is no verdict on it.
    if (!complaint.isEmpty() && !complaint.startsWith(QStringLiteral("Can't open ") + m_candidate))
        emit refused(complaint, output);
}

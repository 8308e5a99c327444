// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/configcheck.h"

#include "common/posix.h"
#include "common/qtversions.h"

#include <QStandardPaths>

#include <csignal>
#include <utility>

#include <fcntl.h>
#include <sys/prctl.h>

namespace {

constexpr int longestOutput{64 * 1024};

QString findServer()
{
    const QString name{QStringLiteral("dhcpd")};
    const QString inPath{QStandardPaths::findExecutable(name)};
    return inPath.isEmpty() ? QStandardPaths::findExecutable(name, {QStringLiteral("/usr/sbin")}) : inPath;
}

/// A child process that inherits one open file, and is ended when it is destroyed.
class CheckProcess final : public PreparedProcess
{
public:
    CheckProcess(FileDescriptor file, QObject *parent)
        : PreparedProcess{parent}
        , m_file{std::move(file)}
    {
    }
    ~CheckProcess() override
    {
        // QProcess warns when it is destroyed before its child has gone.
        kill();
        waitForFinished();
    }
    Q_DISABLE_COPY_MOVE(CheckProcess)

protected:
    void prepareChild() override
    {
        fcntl(m_file.get(), F_SETFD, 0);
        prctl(PR_SET_PDEATHSIG, SIGKILL); // a server that hangs goes with the program, however that ends
    }

private:
    FileDescriptor m_file;
};

/// What a complaint of the server about a line of the text begins with.
QString lineOf(const QString &candidate) { return candidate + QStringLiteral(" line "); }

/// The first line of the server's output that says what is wrong: behind its banner, and no warning.
QString firstComplaint(const QString &output, const QString &candidate)
{
    const QString banner{QStringLiteral("For info, please visit")};
    QStringList lines{output.split(QLatin1Char{'\n'})};
    for (int i{0}; i < lines.size(); ++i) {
        if (lines.at(i).startsWith(banner)) {
            lines = lines.mid(i + 1);
            break;
        }
    }
    const QString place{lineOf(candidate)};
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
    const QString server{findServer()};
    FileDescriptor file{server.isEmpty() ? FileDescriptor{} : posix::memoryFile("dhcpd.conf", content)};
    if (!file.isOpen())
        return;
    m_candidate = QStringLiteral("/proc/self/fd/%1").arg(file.get());
    m_process = new CheckProcess{std::move(file), parent()};
    m_process->setProcessChannelMode(QProcess::MergedChannels);
    m_process->setStandardInputFile(QProcess::nullDevice());
    connect(m_process, &QProcess::readyRead, this, &ConfigCheck::readOutput);
    connect(m_process, qOverload<int, QProcess::ExitStatus>(&QProcess::finished), this, &ConfigCheck::readVerdict);
    m_process->start(server, {QStringLiteral("-t"), QStringLiteral("-cf"), m_candidate});
}

void ConfigCheck::readOutput()
{
    m_output += m_process->read(longestOutput - m_output.size());
    if (m_output.size() == longestOutput)
        m_process->kill();
}

void ConfigCheck::readVerdict()
{
    readOutput();
    const QString output{QString::fromUtf8(m_output)};
    const QString complaint{firstComplaint(output, m_candidate)};
    // A server that was ended because it has so much to say has refused the text if it complains of a line.
    const bool isRefused{m_process->exitStatus() == QProcess::NormalExit
                             ? m_process->exitCode() != 0
                             : m_output.size() == longestOutput && output.contains(lineOf(m_candidate))};
    // That the server cannot read the text is no verdict on it.
    if (isRefused && !complaint.isEmpty() && !complaint.startsWith(QStringLiteral("Can't open ") + m_candidate))
        emit refused(complaint, output);
}

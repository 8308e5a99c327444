// SPDX-License-Identifier: GPL-3.0-or-later
// The served interfaces: the machine's, and the line of the service's defaults file that names them.
#include "server/dhcpservermanager.h"

#include "common/fileio.h"

#include <QFileInfo>

#include <ifaddrs.h>
#include <memory>
#include <net/if.h>
#include <sys/socket.h>

namespace {

const QLatin1String interfacesKey{"INTERFACESv4"};

// The lines of `text` with their terminators; the last one may have none.
QStringList linesOf(const QString &text)
{
    QStringList lines;
    for (QString::size_type begin{0}; begin < text.size(); begin += lines.constLast().size()) {
        const QString::size_type end{text.indexOf(QLatin1Char{'\n'}, begin)};
        lines.append(text.mid(begin, end < 0 ? -1 : end + 1 - begin));
    }
    return lines;
}

// What ends `line`: LF, CR LF, or nothing at the end of the file.
QString terminatorOf(const QString &line)
{
    for (const QLatin1String terminator : {QLatin1String{"\r\n"}, QLatin1String{"\n"}}) {
        if (line.endsWith(terminator))
            return terminator;
    }
    return {};
}

// Replaces `pieces` by the names between the first quotes after the first equals sign of `line`. Returns false where
// the line lacks one of these, with the parts of the last split left in `pieces`.
bool splitInterfacesLine(const QString &line, QStringList &pieces)
{
    pieces = line.chopped(terminatorOf(line).size()).split(QLatin1Char{'='});
    if (pieces.size() < 2)
        return false;
    pieces = pieces.at(1).split(QLatin1Char{'"'});
    if (pieces.size() < 2)
        return false;
    pieces = pieces.at(1).split(QLatin1Char{' '});
    if (pieces == QStringList{QString{}})
        pieces.clear();
    return true;
}

QString interfacesLine(const QMap<QString, bool> &interfaces)
{
    QString line{interfacesKey + QLatin1String{"=\""}};
    for (auto entry = interfaces.cbegin(); entry != interfaces.cend(); ++entry) {
        if (!entry.value())
            continue;
        line += entry.key();
        // Deliberately a space after every name but the map's last, whether or not that one is served.
        if (std::next(entry) != interfaces.cend())
            line += QLatin1Char{' '};
    }
    return line + QLatin1Char{'"'};
}

} // namespace

void DhcpServerManager::updateInterfaces()
{
    collectSystemInterfaces();
    readInterfacesFile(paths::serverDefaults());
}

void DhcpServerManager::collectSystemInterfaces()
{
    m_interfaces.clear();
    ifaddrs *first{};
    if (getifaddrs(&first) == -1)
        return;
    const std::unique_ptr<ifaddrs, decltype(&freeifaddrs)> list{first, &freeifaddrs};
    for (const ifaddrs *entry{list.get()}; entry; entry = entry->ifa_next) {
        const bool isIpv4{entry->ifa_addr && entry->ifa_addr->sa_family == AF_INET};
        if (isIpv4 && !(entry->ifa_flags & IFF_LOOPBACK))
            m_interfaces.insert(QString::fromLatin1(entry->ifa_name), false);
    }
}

void DhcpServerManager::readInterfacesFile(const QString &path)
{
    m_filePath = path;
    m_fileLines.clear();
    QString reason;
    const std::optional<QByteArray> content{fileio::readFile(path, &reason)};
    m_fileWasRead = content.has_value();
    if (!content) {
        report(QObject::tr("Unable to open file '%1' for read").arg(path), reason);
        return;
    }
    const QStringList served{adoptFile(*content)};
    for (const QString &name : served)
        m_interfaces.insert(name, true);
}

// Takes over the lines of the defaults file, and returns the names that it serves.
QStringList DhcpServerManager::adoptFile(const QByteArray &content)
{
    m_fileEncoding = TextEncoding::detect(content);
    m_fileLines.clear();
    // Deliberately one list for all lines: the last line with the key decides, even one that cannot be taken apart.
    // Such a line is dropped, so that the next write leaves it out, but its pieces count as names.
    QStringList served;
    const QStringList lines{linesOf(m_fileEncoding.decode(content))};
    for (const QString &line : lines) {
        if (!line.contains(interfacesKey) || splitInterfacesLine(line, served))
            m_fileLines.append(line);
    }
    return served;
}

const QMap<QString, bool> &DhcpServerManager::interfaces() const { return m_interfaces; }

void DhcpServerManager::setInterfaces(const QMap<QString, bool> &interfaces)
{
    if (interfaces.isEmpty() || interfaces == m_interfaces)
        return;
    m_interfaces = interfaces;
    emit interfacesChanged(paths::serverDefaults());
}

void DhcpServerManager::writeDHCPServerConfig(const QString &path)
{
    QString reason;
    const bool isFileRead{path == m_filePath};
    bool mayReplace{true};
    if (QFileInfo::exists(path) && (isFileRead || !m_fileWasRead)) {
        // What others have changed since, while the choice was made, stays.
        const std::optional<QByteArray> content{fileio::readFile(path, &reason)};
        mayReplace = m_fileWasRead && content;
        if (mayReplace)
            adoptFile(*content);
    }
    // Deliberately replaces commented lines with the key too.
    bool isStored{false};
    for (QString &line : m_fileLines) {
        if (!line.contains(interfacesKey))
            continue;
        line = interfacesLine(m_interfaces) + terminatorOf(line);
        isStored = true;
    }
    if (!mayReplace || !fileio::replaceFile(path, m_fileEncoding.encode(m_fileLines.join(QString{})), &reason)) {
        updateInterfaces();
        report(QObject::tr("Unable to open file '%1' for write").arg(path), reason);
    } else if (isFileRead && !isStored) {
        report(QObject::tr("The choice of interfaces is not stored, since file '%1' has no line with '%2'")
                   .arg(path, interfacesKey));
    }
}

// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/configurationfile.h"

#include "app/busycursor.h"
#include "app/configcheck.h"
#include "app/pathwatch.h"
#include "app/plainmessagebox.h"
#include "app/windowtext.h"
#include "common/fileio.h"
#include "common/paths.h"
#include "config/dhcpdconfigmodel.h"

#include <QTextEdit>

namespace {

constexpr std::size_t mostLinesTold{10};

/// The numbers of lines in words, for one of two sentences with %1 in its place.
QString told(const std::vector<int> &lines, const QString &oneLine, const QString &severalLines)
{
    if (lines.empty())
        return {};
    if (lines.size() == 1)
        return oneLine.arg(lines.front());
    QStringList numbers;
    for (std::size_t i{0}; i < lines.size() && i < mostLinesTold; ++i)
        numbers += QString::number(lines[i]);
    const QString last{lines.size() > mostLinesTold ? WindowText::tr("%1 more").arg(lines.size() - mostLinesTold)
                                                    : numbers.takeLast()};
    return severalLines.arg(WindowText::tr("%1 and %2").arg(numbers.join(QLatin1String{", "}), last));
}

} // namespace

ConfigurationFile::ConfigurationFile(DhcpdConfigModel *model, QWidget *window)
    : m_model{model}
    , m_window{window}
{
    m_readStamp = FileStamp{paths::configuration()};
    m_model->read();
    m_watch = new PathWatch{paths::configuration(), paths::configurationDirectory(), window};
    connect(m_watch, &PathWatch::changed, this, &ConfigurationFile::noteChange);
}

void ConfigurationFile::reload()
{
    const BusyCursor busy{paths::configuration()};
    m_readStamp = FileStamp{paths::configuration()};
    m_isOwnText = false;
    m_model->reload();
    emit reloaded();
}

void ConfigurationFile::noteChange()
{
    if (!m_ignoreNextChange)
        m_changedOutside = true;
    m_ignoreNextChange = false;
}

SaveResult ConfigurationFile::save()
{
    // Set before anything is asked and left set when the user cancels, deliberately: the next change by others then
    // goes unnoticed once.
    m_ignoreNextChange = true;
    const QByteArray content{m_model->fileContent()};
    for (bool isChanged{true}; isChanged;) {
        const FileStamp asked{paths::configuration()};
        if (!askToWrite(content, asked == m_readStamp && !m_isOwnText))
            return {SaveResult::Declined};
        isChanged = FileStamp{paths::configuration()} != asked;
        m_changedOutside = m_changedOutside || isChanged;
    }
    const BusyCursor busy{paths::configuration()};
    QString reason;
    if (!write(content, &reason)) {
        m_model->reportUnwritten(paths::configuration(), reason);
        return {SaveResult::Failed, content};
    }

    m_ignoreNextChange = true;
    m_changedOutside = false;
    // A notice that was due from before the write is about a version that is gone.
    m_watch->forget();
    // The notice of the write itself, which the paused watch did not give; a second one if somebody else wrote
    // meanwhile.
    QMetaObject::invokeMethod(this, &ConfigurationFile::noteChange, Qt::QueuedConnection);
    m_readStamp = FileStamp{paths::configuration()};
    const auto written = fileio::readFile(paths::configuration(), &reason);
    m_isOwnText = written == content;
    if (!m_isOwnText)
        QMetaObject::invokeMethod(this, &ConfigurationFile::noteChange, Qt::QueuedConnection);
    m_model->reloadFrom(written, paths::configuration(), reason);
    emit reloaded();
    return {SaveResult::Saved};
}

bool ConfigurationFile::write(const QByteArray &content, QString *reason)
{
    // Nothing replaces a file that does hold something when there is nothing that was read, or could be read again.
    if (content.isNull()) {
        *reason =
            m_model->rowCount() == 0
                ? WindowText::tr("The configuration could not be read, so there is nothing to save.")
                : WindowText::tr("The text would be too long, or its blocks nested too deeply, to be read again.");
        return false;
    }
    m_watch->pause();
    const bool isWritten{fileio::replaceFile(paths::configuration(), content, reason)};
    m_watch->resume();
    return isWritten;
}

bool ConfigurationFile::askToWrite(const QByteArray &content, bool tellsLosses)
{
    const QString text{
        m_changedOutside
            ? WindowText::tr("The configuration has been changed.\nDo you want to overwrite the configuration?")
            : WindowText::tr("Current configuration in file will be rewrited.\nDo you want to save changes?")};
    PlainMessageBox box{QMessageBox::Information, WindowText::tr("Information"), text,
                        QMessageBox::Save | QMessageBox::Cancel, m_window};
    box.setDefaultButton(QMessageBox::Save);
    const QString lost{tellsLosses ? losses() : QString{}};
    box.setPlainInformativeText(lost);

    ConfigCheck check{m_window};
    connect(&check, &ConfigCheck::refused, &box, [&](const QString &complaint, const QString &output) {
        const QString verdict{WindowText::tr("The DHCP server refuses this configuration:\n%1").arg(complaint)};
        box.setPlainInformativeText(lost.isEmpty() ? verdict : lost + QLatin1Char{'\n'} + verdict);
        box.setDetailedText(output);
        // Qt leaves the field for it without a name that could be said.
        if (auto *details = box.findChild<QTextEdit *>())
            details->setAccessibleName(WindowText::tr("Answer of the DHCP server"));
    });
    check.start(content);
    return box.exec() == QMessageBox::Save;
}

QString ConfigurationFile::losses() const
{
    const ReadingLosses &losses{m_model->losses()};
    QStringList sentences;
    if (losses.comments == 1)
        sentences += WindowText::tr("The comment of the file will not be kept.");
    else if (losses.comments > 1)
        sentences += WindowText::tr("The %1 comments of the file will not be kept.").arg(losses.comments);
    sentences += told(losses.quotedTextLines, WindowText::tr("The quoted text in line %1 will be changed."),
                      WindowText::tr("The quoted texts in lines %1 will be changed."));
    sentences += told(losses.statementLines, WindowText::tr("The statement in line %1 will be changed."),
                      WindowText::tr("The statements in lines %1 will be changed."));
    sentences +=
        told(losses.carriageReturnLines, WindowText::tr("The carriage return in line %1 will become part of a word."),
             WindowText::tr("The carriage returns in lines %1 will become parts of words."));
    sentences.removeAll(QString{});
    return sentences.join(QLatin1Char{'\n'});
}

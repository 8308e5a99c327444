// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "common/filestamp.h"

#include <QByteArray>
#include <QObject>

class DhcpdConfigModel;
class PathWatch;
class QString;
class QWidget;

/// What became of a save.
struct SaveResult final
{
    enum Outcome
    {
        Saved,
        Declined, ///< by the user
        Failed
    };

    Outcome outcome;
    QByteArray unwritten{}; ///< what a failed save did not write; null when there was nothing that could be written
};

/// The server's configuration as a file: it is read into the model, saved from it, and watched for changes by others.
class ConfigurationFile final : public QObject
{
    Q_OBJECT
    Q_DISABLE_COPY_MOVE(ConfigurationFile)

public:
    /// Reads the file into `model` and watches it from then on; `window` is the parent of questions and watchers.
    ConfigurationFile(DhcpdConfigModel *model, QWidget *window);

    /// Reads the file anew.
    void reload();
    /// Asks whether to write the model over the file, and tells what a save loses and whether the server refuses it;
    /// writes it and reads it again. A file that changes meanwhile is not written over before that is asked again. The
    /// model reports a failure.
    SaveResult save();

public slots:
    /// Takes note of a change of the file, for the next question.
    void noteChange();

signals:
    /// The file was read anew.
    void reloaded();

private:
    bool askToWrite(const QByteArray &content, bool tellsLosses);
    /// What the text of the file holds that the model does not keep, in words for the user.
    QString losses() const;
    /// Writes without noticing that as a change; false, with the system's `reason`, when that failed.
    bool write(const QByteArray &content, QString *reason);

    DhcpdConfigModel *m_model;
    QWidget *m_window;
    PathWatch *m_watch;    // the window's
    FileStamp m_readStamp; // of the file that the model holds
    bool m_isOwnText{};    // whether a save wrote that, so that the next one loses nothing
    bool m_ignoreNextChange{};
    bool m_changedOutside{};
};

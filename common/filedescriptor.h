// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QtGlobal>

/// An open file, closed with its owner.
class FileDescriptor final
{
public:
    explicit FileDescriptor(int descriptor = -1);
    ~FileDescriptor();
    FileDescriptor(FileDescriptor &&other) noexcept;
    FileDescriptor &operator=(FileDescriptor &&other) noexcept;
    Q_DISABLE_COPY(FileDescriptor)

    bool isOpen() const { return m_descriptor >= 0; }
    int get() const { return m_descriptor; }
    /// The descriptor, for another owner to close.
    int release();

private:
    int m_descriptor;
};

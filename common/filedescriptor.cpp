// SPDX-License-Identifier: GPL-3.0-or-later
#include "common/filedescriptor.h"

#include <utility>

#include <unistd.h>

FileDescriptor::FileDescriptor(int descriptor)
    : m_descriptor{descriptor}
{
}

FileDescriptor::~FileDescriptor()
{
    if (isOpen())
        close(m_descriptor);
}

FileDescriptor::FileDescriptor(FileDescriptor &&other) noexcept
    : m_descriptor{std::exchange(other.m_descriptor, -1)}
{
}

FileDescriptor &FileDescriptor::operator=(FileDescriptor &&other) noexcept
{
    std::swap(m_descriptor, other.m_descriptor);
    return *this;
}

int FileDescriptor::release() { return std::exchange(m_descriptor, -1); }

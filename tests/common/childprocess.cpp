// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/common/childprocess.h"

#include "common/filedescriptor.h"

#include <QFile>
#include <QVector>

#include <array>
#include <csignal>
#include <cstring>
#include <utility>

#include <fcntl.h>
#include <linux/filter.h>
#include <linux/seccomp.h>
#include <poll.h>
#include <sched.h>
#include <sys/ioctl.h>
#include <sys/mount.h>
#include <sys/prctl.h>
#include <sys/socket.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

constexpr int unsupervisable{125}; // what the child returns when its calls cannot be supervised

// Calls without effect on files; sendmsg passes the listener on.
constexpr std::array unsupervised{
    SYS_brk,          SYS_clock_gettime,   SYS_exit,        SYS_exit_group, SYS_futex,        SYS_getegid,
    SYS_geteuid,      SYS_getpid,          SYS_getrandom,   SYS_gettid,     SYS_madvise,      SYS_mmap,
    SYS_mprotect,     SYS_mremap,          SYS_munmap,      SYS_ppoll,      SYS_rt_sigaction, SYS_rt_sigprocmask,
    SYS_rt_sigreturn, SYS_rt_sigtimedwait, SYS_sched_yield, SYS_sendmsg,    SYS_sigaltstack,  SYS_umask};

// From now on, the calls of this process wait for a verdict from whoever reads the returned descriptor.
int startSupervision()
{
    QVector<sock_filter> program;
    program.append(BPF_STMT(BPF_LD | BPF_W | BPF_ABS, offsetof(seccomp_data, nr)));
    for (const long call : unsupervised) {
        program.append(BPF_JUMP(BPF_JMP | BPF_JEQ | BPF_K, static_cast<unsigned>(call), 0, 1));
        program.append(BPF_STMT(BPF_RET | BPF_K, SECCOMP_RET_ALLOW));
    }
    program.append(BPF_STMT(BPF_RET | BPF_K, SECCOMP_RET_USER_NOTIF));
    sock_fprog filter{static_cast<unsigned short>(program.size()), program.data()};
    prctl(PR_SET_NO_NEW_PRIVS, 1, 0, 0, 0);
    return static_cast<int>(syscall(SYS_seccomp, SECCOMP_SET_MODE_FILTER, SECCOMP_FILTER_FLAG_NEW_LISTENER, &filter));
}

struct DescriptorMessage
{
    explicit DescriptorMessage(int descriptor = -1)
    {
        header.msg_iov = &part;
        header.msg_iovlen = 1;
        header.msg_control = control.data();
        header.msg_controllen = control.size();
        auto *rights = reinterpret_cast<cmsghdr *>(control.data());
        rights->cmsg_level = SOL_SOCKET;
        rights->cmsg_type = SCM_RIGHTS;
        rights->cmsg_len = CMSG_LEN(sizeof descriptor);
        std::memcpy(CMSG_DATA(rights), &descriptor, sizeof descriptor);
    }

    char byte{};
    iovec part{&byte, 1};
    alignas(cmsghdr) std::array<char, CMSG_SPACE(sizeof(int))> control{};
    msghdr header{};
};

FileDescriptor receiveDescriptor(int socket)
{
    DescriptorMessage message;
    int descriptor{-1};
    if (recvmsg(socket, &message.header, MSG_CMSG_CLOEXEC) == 1 && CMSG_FIRSTHDR(&message.header))
        std::memcpy(&descriptor, CMSG_DATA(CMSG_FIRSTHDR(&message.header)), sizeof descriptor);
    return FileDescriptor{descriptor};
}

[[noreturn]] void runSupervised(int socket, const std::function<int()> &function)
{
    const int listener{startSupervision()};
    if (listener < 0)
        _exit(unsupervisable);
    const DescriptorMessage message{listener};
    sendmsg(socket, &message.header, 0);
    _exit(function());
}

// Answers the calls of `child` until it is gone.
void superviseCalls(pid_t child, int listener, const supervisor::Policy &policy)
{
    for (int index{};; ++index) {
        pollfd waiting{listener, POLLIN, 0};
        if (poll(&waiting, 1, -1) < 0 || (waiting.revents & POLLIN) == 0)
            return;
        seccomp_notif call{};
        if (ioctl(listener, SECCOMP_IOCTL_NOTIF_RECV, &call) < 0)
            return;
        const supervisor::Verdict verdict{policy(call.data.nr, index)};
        if (verdict == supervisor::kill) {
            kill(child, SIGKILL);
            return;
        }
        seccomp_notif_resp answer{};
        answer.id = call.id;
        answer.error = verdict == supervisor::pretend ? 0 : -verdict;
        answer.flags = verdict == supervisor::proceed ? SECCOMP_USER_NOTIF_FLAG_CONTINUE : 0;
        ioctl(listener, SECCOMP_IOCTL_NOTIF_SEND, &answer);
    }
}

bool writeText(const char *path, const QByteArray &text)
{
    QFile file{QString::fromLatin1(path)};
    return file.open(QIODevice::WriteOnly) && file.write(text) == text.size() && file.flush();
}

bool enterMountNamespace()
{
    const QByteArray user{QByteArray::number(geteuid())};
    const QByteArray group{QByteArray::number(getegid())};
    if (geteuid() == 0 ? unshare(CLONE_NEWNS) < 0 : unshare(CLONE_NEWNS | CLONE_NEWUSER) < 0)
        return false;
    if (user != "0" &&
        !(writeText("/proc/self/setgroups", "deny") && writeText("/proc/self/uid_map", "0 " + user + " 1") &&
          writeText("/proc/self/gid_map", "0 " + group + " 1")))
        return false;
    return mount("none", "/", nullptr, MS_REC | MS_PRIVATE, nullptr) == 0;
}

} // namespace

supervisor::Outcome supervisor::run(const std::function<int()> &function, const Policy &policy)
{
    std::array<int, 2> ends{};
    if (socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()) < 0)
        return {QStringLiteral("no socket pair")};
    FileDescriptor ours{ends[0]};
    FileDescriptor theirs{ends[1]};
    const pid_t child{fork()};
    if (child == 0)
        runSupervised(theirs.get(), function);
    theirs = FileDescriptor{};
    {
        const FileDescriptor listener{receiveDescriptor(ours.get())};
        if (listener.isOpen())
            superviseCalls(child, listener.get(), policy);
    }
    int status{};
    waitpid(child, &status, 0);
    if (WIFEXITED(status) && WEXITSTATUS(status) == unsupervisable)
        return {QStringLiteral("system calls cannot be supervised here")};
    return {{}, WIFSIGNALED(status) && WTERMSIG(status) == SIGKILL, WIFEXITED(status) ? WEXITSTATUS(status) : -1};
}

QString inChild(const std::function<QString()> &function)
{
    std::array<int, 2> ends{};
    if (pipe2(ends.data(), O_CLOEXEC) < 0)
        return QStringLiteral("no pipe");
    const FileDescriptor reading{ends[0]};
    FileDescriptor writing{ends[1]};
    const pid_t child{fork()};
    if (child == 0) {
        const QByteArray text{function().toUtf8()};
        const bool sent{write(writing.get(), text.constData(), static_cast<size_t>(text.size())) == text.size()};
        _exit(sent ? 0 : 1);
    }
    writing = FileDescriptor{};
    QFile answer;
    answer.open(reading.get(), QIODevice::ReadOnly);
    const QByteArray text{answer.readAll()};
    int status{};
    waitpid(child, &status, 0);
    return WIFEXITED(status) && WEXITSTATUS(status) == 0 ? QString::fromUtf8(text) : QStringLiteral("the child died");
}

QString inMountNamespace(const std::function<QString()> &function)
{
    return inChild([&] {
        return enterMountNamespace() ? function()
                                     : QStringLiteral("skip: no mount namespace of our own is permitted here");
    });
}

// SPDX-License-Identifier: GPL-3.0-or-later
// libFuzzer target: what systemctl prints, whatever its bytes, says of the service what its phrases say, also with
// colours and null bytes among them, and nothing where it has none.
#include "server/servicestatus.h"
#include "tests/fuzz/fuzztarget.h"

#include <QByteArray>

namespace {

struct Phrase
{
    const char *text;
    bool ServiceStatus::*says;
};

constexpr Phrase phrases[]{
    {"Active: active (running)", &ServiceStatus::running}, {"Active: inactive (dead)", &ServiceStatus::stopped},
    {"Active: failed", &ServiceStatus::stopped},           {"Active: active (exited)", &ServiceStatus::stopped},
    {"Active: active (exited)", &ServiceStatus::exited},   {"Active: failed", &ServiceStatus::failed},
};

bool areAlike(const ServiceStatus &first, const ServiceStatus &second)
{
    return first.running == second.running && first.stopped == second.stopped && first.exited == second.exited &&
           first.failed == second.failed;
}

// The text with colours switched on and off in front of each word and null bytes behind it.
QByteArray coloured(QByteArray printed) { return printed.replace(' ', QByteArrayLiteral("\x1b[0;1;32m \x1b[0m\0")); }

} // namespace

extern "C" int LLVMFuzzerInitialize(int * /*argc*/, char *** /*argv*/) { return 0; }

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const QByteArray printed{reinterpret_cast<const char *>(data), static_cast<int>(size)};
    const ServiceStatus status{printed};
    if (printed.contains('\x1b'))
        return 0; // what a sequence takes in is nobody's to foresee
    for (const Phrase &phrase : phrases) {
        if (printed.contains(phrase.text))
            require(status.*phrase.says);
        require(ServiceStatus{printed + '\n' + phrase.text}.*phrase.says);
    }
    if (!printed.contains("Active") && !printed.contains('\0'))
        require(areAlike(status, ServiceStatus{{}}));
    require(areAlike(ServiceStatus{coloured(printed)}, status));
    return 0;
}

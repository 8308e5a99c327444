// SPDX-License-Identifier: GPL-3.0-or-later
// libFuzzer target: a configuration, a zero byte, and a byte for each choice that a sequence of edits makes. After each
// edit the tree is whole, and it stays the same when it is written and read.
#include "tests/config/editsequence.h"
#include "tests/fuzz/fuzztarget.h"

#include <QTest>

#include <algorithm>

namespace {

constexpr int mostEdits{8};

/// Takes its choices from bytes, and the first one each time when there are none left.
class Bytes final : public Choices
{
public:
    explicit Bytes(QByteArray bytes)
        : m_bytes{std::move(bytes)}
    {
    }

    bool isEmpty() const { return m_position >= m_bytes.size(); }
    int below(int limit) override
    {
        return isEmpty() ? 0 : static_cast<unsigned char>(m_bytes.at(m_position++)) % limit;
    }

private:
    QByteArray m_bytes;
    int m_position{0};
};

} // namespace

extern "C" int LLVMFuzzerInitialize(int * /*argc*/, char *** /*argv*/) { return 0; }

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const std::uint8_t *end{data + size};
    const std::uint8_t *zero{std::find(data, end, 0)};
    const QString text{QString::fromUtf8(reinterpret_cast<const char *>(data), static_cast<int>(zero - data))};
    Bytes bytes{zero == end ? QByteArray{}
                            : QByteArray{reinterpret_cast<const char *>(zero) + 1, static_cast<int>(end - zero) - 1}};
    EditSequence sequence{text};
    if (sequence.model().rowCount() == 0)
        return 0; // nested too deep
    for (int edits{0}; edits < mostEdits && !bytes.isEmpty(); ++edits) {
        sequence.edit(bytes);
        require(!QTest::currentTestFailed());
    }
    return 0;
}

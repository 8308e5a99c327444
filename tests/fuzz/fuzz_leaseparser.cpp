// SPDX-License-Identifier: GPL-3.0-or-later
// libFuzzer target: the parser agrees with the reference on any bytes, given at once or in two pieces, and so it does
// where it continues after an end.
#include "leases/leaseparser.h"
#include "leases/leasetable.h"
#include "tests/fuzz/fuzztarget.h"
#include "tests/leases/referencereader.h"

#include <QByteArray>

#include <ctime>

extern "C" int LLVMFuzzerInitialize(int * /*argc*/, char *** /*argv*/)
{
    qputenv("TZ", "UTC"); // the reference knows no time that the local clock skips
    tzset();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const QByteArray text{reinterpret_cast<const char *>(data), static_cast<int>(size)};
    const int place{text.isEmpty() ? 0 : static_cast<unsigned char>(text[0]) % static_cast<int>(text.size() + 1)};
    const LeaseRows expected{referenceRows(text)};
    require(parsedRows(text) == expected);
    require(parsedRows(text, {place}) == expected);

    LeaseTable table;
    LeaseParser parser{table};
    const std::string_view bytes{text.constData(), size};
    parser.feed(bytes.substr(0, static_cast<std::size_t>(place)));
    parser.finish();
    if (parser.canContinue()) {
        parser.feed(bytes.substr(static_cast<std::size_t>(place)));
        parser.finish();
        table.settleAll();
        require(rowsOf(table) == expected);
    }
    return 0;
}

// SPDX-License-Identifier: GPL-3.0-or-later
// libFuzzer target: whatever a bind9 configuration holds, what is made of it are whole keys and zones, each zone behind
// its key, which stay the same when the configuration that they were added to is written and read.
#include "config/bind9reader.h"
#include "config/bind9words.h"
#include "config/values.h"
#include "tests/config/editedmodel.h"
#include "tests/fuzz/fuzztarget.h"

namespace {

const QStringList knownKeys{QStringLiteral("before"), QStringLiteral("_before.")};
const QStringList keysBehind{QStringLiteral("behind")};

void requireOrder(const QStringList &statements, const QStringList &leftOut)
{
    QStringList keys{knownKeys};
    require(statements.size() % 6 == 0);
    for (int i{0}; i < statements.size(); i += 6) {
        const QString name{values::unquoted(statements.at(i + 1)).toLower()};
        if (statements.at(i) == QLatin1String{"key"}) {
            require(statements.mid(i, 6).contains(QStringLiteral("secret")) && !leftOut.contains(name));
            keys += name;
        } else {
            require(statements.at(i) == QLatin1String{"zone"} && statements.at(i + 2) == QLatin1String{"primary"});
            require(keys.contains(values::unquoted(statements.at(i + 5)).toLower()));
        }
    }
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int * /*argc*/, char *** /*argv*/) { return 0; }

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const QString text{QString::fromUtf8(reinterpret_cast<const char *>(data), static_cast<int>(size))};
    bind9::statements(text);
    const QString withoutComments{bind9::withoutComments(text)};
    const bind9::Preparation preparation{bind9::preparedText(withoutComments, knownKeys, knownKeys + keysBehind)};
    requireOrder(preparation.statements, keysBehind);
    requireOrder(bind9::usable(bind9::statements(bind9::zonesAndKeys(withoutComments)), knownKeys), {});

    if (preparation.statements.isEmpty())
        return 0;
    EditedModel edited{QStringLiteral("authoritative;")};
    require(edited.model().addBind9(preparation.statements, edited.find({})));
    const EditedModel read{QString::fromUtf8(edited.model().fileContent())};
    require(read.outline() == edited.outline());
    return 0;
}

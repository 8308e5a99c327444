// SPDX-License-Identifier: GPL-3.0-or-later
// What holds after any sequence of edits.
#include "tests/config/editsequence.h"

#include <QRandomGenerator>
#include <QTest>

namespace {

constexpr int sequences{10'000};
constexpr int editsOfSequence{5};

constexpr auto base = R"(option domain-name "a.org";
subnet 10.0.0.0 netmask 255.255.255.0 { range 10.0.0.10 10.0.0.20; option routers 10.0.0.1; }
shared-network office { subnet 10.1.0.0 netmask 255.255.0.0 { pool { range 10.1.0.1 10.1.0.2; } } }
group { host a { hardware ethernet 00:11:22:33:44:55; fixed-address 10.0.0.5; } }
subclass "x" y;
classless-static-routes a;
)";

class RandomChoices final : public Choices
{
public:
    int below(int limit) override { return m_random.bounded(limit); }

private:
    QRandomGenerator m_random{20240607};
};

} // namespace

class EditSequencesTest final : public QObject
{
    Q_OBJECT

private slots:
    void keepsTheTreeWhole();
};

void EditSequencesTest::keepsTheTreeWhole()
{
    RandomChoices random;
    std::vector<int> changesOfEdit(static_cast<std::size_t>(EditSequence::kinds()));
    std::vector<int> refusalsOfEdit(changesOfEdit.size());
    for (int sequence{}; sequence < sequences; ++sequence) {
        EditSequence edited{QString::fromUtf8(base)};
        for (int i{}; i < editsOfSequence; ++i) {
            edited.edit(random);
            const auto kind = static_cast<std::size_t>(edited.kind());
            changesOfEdit[kind] += edited.changes();
            refusalsOfEdit[kind] += edited.errors();
            if (QTest::currentTestFailed()) {
                qWarning("sequence %d, edit %d", sequence, i);
                return;
            }
        }
    }
    // An edit that was never made, or never refused, proves nothing. Replacing words and removing are never refused.
    for (std::size_t edit{}; edit < changesOfEdit.size(); ++edit) {
        const bool canRefuse{edit < 15 || edit == 16};
        QVERIFY2(changesOfEdit[edit] > 20 && (refusalsOfEdit[edit] > 100 || !canRefuse),
                 qPrintable(QStringLiteral("edit %1: %2 changes").arg(edit).arg(changesOfEdit[edit])));
    }
}

QTEST_GUILESS_MAIN(EditSequencesTest)
#include "tst_editsequences.moc"

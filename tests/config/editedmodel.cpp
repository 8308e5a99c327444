// SPDX-License-Identifier: GPL-3.0-or-later
#include "tests/config/editedmodel.h"

#include "tests/support/text.h"

#include <QTest>

namespace {

void appendOutline(QString &text, const DhcpdConfigStatement &statement, int depth)
{
    for (int row{}; row < statement.childCount(); ++row) {
        const DhcpdConfigStatement &child{*statement.child(row)};
        if (child.keyword() == QLatin1String{"All network"}) {
            appendOutline(text, child, depth);
            continue;
        }
        QStringList words;
        for (int i{}; i < child.wordCount(); ++i)
            words += child.word(i);
        text += QString{depth, QLatin1Char{' '}} + words.join(QLatin1Char{'|'});
        text += child.isDeclaration() ? QLatin1String{" {\n"} : QLatin1String{"\n"};
        appendOutline(text, child, depth + 1);
    }
}

QModelIndex findUnder(const DhcpdConfigModel &model, const QModelIndex &parent, const QString &text)
{
    for (int row{}; row < model.rowCount(parent); ++row) {
        const QModelIndex index{model.index(row, 0, parent)};
        if (model.statementFor(index)->joinedWords().startsWith(text))
            return index;
        if (const QModelIndex found{findUnder(model, index, text)}; found.isValid())
            return found;
    }
    return {};
}

void verifyLinksUnder(const DhcpdConfigModel &model, const QModelIndex &parent)
{
    const DhcpdConfigStatement &statement{*model.statementFor(parent)};
    QCOMPARE(model.rowCount(parent), statement.childCount());
    bool hasDeclaration{};
    for (int row{}; row < statement.childCount() && !QTest::currentTestFailed(); ++row) {
        const DhcpdConfigStatement &child{*statement.child(row)};
        QCOMPARE(static_cast<const DhcpdConfigStatement *>(child.parent()), &statement);
        QCOMPARE(child.depth(), statement.depth() + 1);
        QCOMPARE(child.row(), row);
        hasDeclaration = hasDeclaration || child.isDeclaration();
        QCOMPARE(child.isDeclaration(), hasDeclaration);
        const QModelIndex index{model.index(row, 0, parent)};
        QCOMPARE(model.parent(index), parent);
        verifyLinksUnder(model, index);
    }
}

} // namespace

EditedModel::EditedModel(const QString &configuration)
    : m_model{{QStringLiteral("Topology"), QStringLiteral("Value")}}
{
    m_model.parse(configuration);
}

QModelIndex EditedModel::find(const QString &text) const
{
    if (text == QLatin1String{"top"})
        return {};
    const QModelIndex allNetwork{m_model.index(0, 0)};
    if (text.isEmpty())
        return allNetwork;
    const QModelIndex found{findUnder(m_model, allNetwork, text)};
    if (!found.isValid())
        QTest::qFail(qPrintable(QStringLiteral("no statement ") + text), __FILE__, __LINE__);
    return found;
}

QString EditedModel::outline() const
{
    QString text;
    appendOutline(text, *m_model.statementFor({}), 0);
    return text;
}

void EditedModel::verifyChange(int resets) const
{
    QCOMPARE(m_errors, QList<QList<QVariant>>{});
    QCOMPARE(m_resetStarts.size(), resets);
    QCOMPARE(m_resets.size(), resets);
    QCOMPARE(m_changes.size(), 1);
    QCOMPARE(m_changes.first().at(0).toModelIndex(), QModelIndex{});
    QCOMPARE(m_changes.first().at(1).toModelIndex(), QModelIndex{});
    QVERIFY(m_changes.first().at(2).value<QVector<int>>().isEmpty());
    QVERIFY(m_model.isModified());
}

void EditedModel::verifyRefusal(const QString &error) const
{
    QCOMPARE(m_errors.size(), 1);
    QCOMPARE(m_errors.first().first().toString(), error);
    QCOMPARE(m_resetStarts.size(), 0);
    QCOMPARE(m_resets.size(), 0);
    QCOMPARE(m_changes.size(), 0);
    QVERIFY(!m_model.isModified());
}

void verifyEdit(const EditCase &edit)
{
    EditedModel edited{edit.before};
    edit.edit(edited.model(), edited.find(edit.target));
    QCOMPARE(edited.outline(), edit.after);
    edited.verifyChange(edit.resets);
    verifyLinks(edited.model());
}

void verifyRefusal(const Refusal &refusal)
{
    EditedModel edited{refusal.before};
    const QString before{edited.outline()};
    refusal.edit(edited.model(), edited.find(refusal.target));
    edited.verifyRefusal(refusal.error);
    QCOMPARE(edited.outline(), before);
}

void verifyLinks(const DhcpdConfigModel &model) { verifyLinksUnder(model, {}); }

EditCase::Edit addSubnet(const char *address, const char *mask)
{
    return
        [=](DhcpdConfigModel &model, const QModelIndex &parent) { model.addSubnet(text(address), text(mask), parent); };
}

EditCase::Edit addRange(const char *start, const char *end)
{
    return [=](DhcpdConfigModel &model, const QModelIndex &parent) { model.addRange(text(start), text(end), parent); };
}

EditCase::Edit addHost(const char *name, const char *mac, const char *address)
{
    return [=](DhcpdConfigModel &model, const QModelIndex &parent) {
        model.addHost(text(name), text(mac), text(address), parent);
    };
}

EditCase::Edit addValue(ValueOperation add, const char *value)
{
    return [=](DhcpdConfigModel &model, const QModelIndex &parent) { (model.*add)(text(value), parent); };
}

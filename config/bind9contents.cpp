// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/bind9contents.h"

#include "config/bind9words.h"
#include "config/values.h"

#include <algorithm>
#include <map>
#include <memory>
#include <optional>

using bind9::Contents;
using bind9::Key;
using bind9::Zone;

namespace {

const QLatin1String zoneKeyword{"zone"};
const QLatin1String keyKeyword{"key"};
const QLatin1String algorithmKeyword{"algorithm"};
const QLatin1String secretKeyword{"secret"};

// More than anybody has: the keys of one zone, and how deep lists name each other. A small file of lists could name any
// number.
constexpr int mostUpdaters{16};
constexpr int deepestList{16};

QString lowerKeyword(const QStringList &words) { return words.value(0).toLower(); }

bool isUpdaterKeyword(const QString &keyword)
{
    return keyword == QLatin1String{"allow-update"} || keyword == QLatin1String{"update-policy"};
}

/// A name in a list of who may update: that of a key, or of another list.
struct Entry
{
    bool isKey;
    QString name;
};
using Entries = std::vector<Entry>;

/// Reads statements one by one and keeps what matters of them.
class ContentsReader final
{
public:
    Contents read(const QString &text);

private:
    enum class Kind
    {
        Outermost,
        Options,
        View,
        Zone,
        Key,
        Updaters,
        Other
    };

    /// An open block, with what its statements belong to.
    struct Block
    {
        Kind kind;
        std::optional<Entries> *updaters{}; // those of the block itself; null where it cannot have any
        Entries *entries{};
    };

    /// A list that has a name, and once they were asked for, the keys in it.
    struct List
    {
        Entries entries;
        std::optional<QStringList> keys;
    };

    /// The updaters that a zone, a view or the options state, and whose hold where it states none.
    struct Scope
    {
        std::optional<Entries> updaters;
        Scope *outer{};
        std::optional<QStringList> keys;
    };

    struct ReadZone
    {
        Zone zone;
        Scope scope;
        bool inherits{};
    };

    Block open(const QStringList &words);
    Block openEntries(std::optional<Entries> &updaters);
    void readStatement(const QStringList &words);
    void readStatementOfZone(const QString &keyword, const QString &value);
    QStringList keysOf(const Entries &entries, int depth = 0);
    QStringList keysOf(ReadZone &read);

    std::vector<Block> m_blocks{{Kind::Outermost}};
    Scope m_options;
    std::vector<std::unique_ptr<Scope>> m_views;
    std::map<QString, List> m_lists;
    std::vector<std::variant<std::unique_ptr<ReadZone>, Key>> m_found;
};

Contents ContentsReader::read(const QString &text)
{
    for (bind9::Words statement{text}; statement.next();) {
        const QChar delimiter{statement.delimiter()};
        if (delimiter == QLatin1Char{';'})
            readStatement(statement.words());
        else if (delimiter == QLatin1Char{'{'})
            m_blocks.push_back(open(statement.words()));
        else if (m_blocks.size() > 1)
            m_blocks.pop_back();
    }
    Contents contents;
    for (auto &found : m_found) {
        if (auto *key = std::get_if<Key>(&found)) {
            contents.emplace_back(std::move(*key));
        } else {
            ReadZone &read{*std::get<std::unique_ptr<ReadZone>>(found)};
            read.zone.updaters = keysOf(read);
            contents.emplace_back(std::move(read.zone));
        }
    }
    return contents;
}

ContentsReader::Block ContentsReader::openEntries(std::optional<Entries> &updaters)
{
    if (!updaters)
        updaters = Entries{};
    return {Kind::Updaters, nullptr, &*updaters};
}

ContentsReader::Block ContentsReader::open(const QStringList &words)
{
    const Block &outer{m_blocks.back()};
    const QString keyword{lowerKeyword(words)};
    if (outer.kind == Kind::Updaters && words.isEmpty())
        return {Kind::Updaters, nullptr, outer.entries};
    if (outer.updaters && isUpdaterKeyword(keyword))
        return openEntries(*outer.updaters);
    if (outer.kind != Kind::Outermost && outer.kind != Kind::View)
        return {Kind::Other};
    if (keyword == zoneKeyword) {
        auto zone = std::make_unique<ReadZone>();
        zone->zone.name = values::unquoted(words.value(1));
        if (zone->zone.name.endsWith(QLatin1Char{'.'}))
            zone->zone.name.chop(1); // statements() appends one
        zone->scope.outer = outer.kind == Kind::View ? m_views.back().get() : &m_options;
        ReadZone &read{*zone};
        m_found.emplace_back(std::move(zone));
        return {Kind::Zone, &read.scope.updaters};
    }
    if (keyword == keyKeyword) {
        m_found.emplace_back(Key{words.value(1), {}});
        return {Kind::Key};
    }
    if (outer.kind == Kind::View)
        return {Kind::Other};
    if (keyword == QLatin1String{"options"})
        return {Kind::Options, &m_options.updaters};
    if (keyword == QLatin1String{"view"}) {
        m_views.push_back(std::make_unique<Scope>(Scope{{}, &m_options, {}}));
        return {Kind::View, &m_views.back()->updaters};
    }
    if (keyword == QLatin1String{"acl"} && words.size() > 1)
        return {Kind::Updaters, nullptr, &m_lists[bind9::unescaped(words.at(1)).toLower()].entries};
    return {Kind::Other};
}

void ContentsReader::readStatement(const QStringList &words)
{
    const Block &block{m_blocks.back()};
    const QString keyword{lowerKeyword(words)};
    const QString value{words.value(1)};
    if (block.kind == Kind::Updaters) {
        if (keyword == keyKeyword || keyword == QLatin1String{"grant"})
            block.entries->push_back({true, value});
        else if (words.size() == 1)
            block.entries->push_back({false, bind9::unescaped(words.first()).toLower()});
    } else if (block.kind == Kind::Key) {
        if (keyword == algorithmKeyword || keyword == secretKeyword)
            std::get<Key>(m_found.back()).statements.append({keyword, value});
    } else if (block.updaters && isUpdaterKeyword(keyword)) {
        openEntries(*block.updaters); // a policy without a block, which names no key
    } else if (block.kind == Kind::Zone) {
        readStatementOfZone(keyword, value);
    }
}

void ContentsReader::readStatementOfZone(const QString &keyword, const QString &value)
{
    ReadZone &read{*std::get<std::unique_ptr<ReadZone>>(m_found.back())};
    if (keyword == QLatin1String{"type"}) {
        const QString type{bind9::unescaped(value).toLower()};
        read.zone.isPrimary = type == QLatin1String{"master"} || type == QLatin1String{"primary"};
        read.inherits = read.zone.isPrimary;
    } else if (keyword == QLatin1String{"in-view"}) {
        read.zone.isPrimary = false;
    }
}

QStringList ContentsReader::keysOf(const Entries &entries, int depth)
{
    QStringList names;
    for (const Entry &entry : entries) {
        if (names.size() >= mostUpdaters)
            break;
        if (entry.isKey) {
            names += entry.name;
            continue;
        }
        const auto list = m_lists.find(entry.name);
        if (list == m_lists.end() || depth == deepestList)
            continue;
        auto &[listEntries, keys] = list->second;
        if (!keys) {
            keys = QStringList{}; // for lists that name each other in a circle
            keys = keysOf(listEntries, depth + 1);
        }
        names += keys->mid(0, mostUpdaters - names.size());
    }
    return names;
}

QStringList ContentsReader::keysOf(ReadZone &read)
{
    Scope *scope{&read.scope};
    while (scope && !scope->updaters)
        scope = read.inherits ? scope->outer : nullptr;
    if (!scope)
        return {};
    if (!scope->keys)
        scope->keys = keysOf(*scope->updaters);
    return *scope->keys;
}

bool isBlank(QChar c) { return c == QLatin1Char{' '} || c == QLatin1Char{'\t'} || c == QLatin1Char{'\n'}; }

// Whether statements() would misread a value that stands without quotes, because some words mean the same to it
// wherever they stand and a slash starts a comment.
bool needsQuotes(const QString &value)
{
    static const QStringList keywords{QStringLiteral("type"), QStringLiteral("file"), QStringLiteral("allow-update"),
                                      zoneKeyword};
    return keywords.contains(value) || (value.contains(QLatin1Char{'/'}) && !value.contains(bind9::quote));
}

// Whether statements() keeps `value` together.
bool isWhole(const QString &value)
{
    const bool hasUsualQuotes{!value.contains(bind9::quote) ||
                              (value.size() > 2 && value.startsWith(bind9::quote) && value.endsWith(bind9::quote) &&
                               value.count(bind9::quote) == 2)};
    return !value.isEmpty() && hasUsualQuotes &&
           std::none_of(value.cbegin(), value.cend(), [](QChar c) { return isBlank(c) || bind9::isDelimiter(c); });
}

void appendStatement(QString &text, const QString &keyword, QString value, QLatin1Char delimiter)
{
    if (needsQuotes(value))
        value = values::quoted(value);
    text += keyword + QLatin1Char{' '} + value + delimiter + QLatin1Char{'\n'};
}

void appendBlock(QString &text, const QString &keyword, const QString &name,
                 const QVector<QPair<QString, QString>> &statements)
{
    if (!isWhole(name))
        return;
    appendStatement(text, keyword, name, QLatin1Char{'{'});
    for (const auto &[statement, value] : statements) {
        if (isWhole(value))
            appendStatement(text, statement, value, QLatin1Char{';'});
    }
    text += QLatin1String{"};\n"};
}

} // namespace

namespace bind9 {

Contents readContents(const QString &text) { return ContentsReader{}.read(text); }

QString textOf(const Contents &contents)
{
    QString text;
    for (const auto &entry : contents) {
        if (const auto *key = std::get_if<Key>(&entry)) {
            appendBlock(text, keyKeyword, key->name, key->statements);
            continue;
        }
        const Zone &zone{std::get<Zone>(entry)};
        QVector<QPair<QString, QString>> updaters;
        for (const QString &name : zone.updaters)
            updaters.append({keyKeyword, name});
        appendBlock(text, zoneKeyword, zone.name, updaters);
    }
    return text;
}

} // namespace bind9

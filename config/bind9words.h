// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QString>
#include <QStringList>

/// The words of bind9 configurations.
namespace bind9 {

constexpr QLatin1Char quote{'"'};
constexpr QLatin1Char escape{'\\'}; // of the character behind it, between quotes

inline bool isDelimiter(QChar c) { return c == QLatin1Char{';'} || c == QLatin1Char{'{'} || c == QLatin1Char{'}'}; }

/// `text` without its comments (//, #, and /* */, for which a space stays).
QString withoutComments(const QString &text);

/// Goes through a text without comments statement by statement. Blanks, delimiters and escaped quotes between quotes
/// are part of a word. The text has to outlive it.
class Words final
{
public:
    explicit Words(const QString &text)
        : m_text{text}
    {
    }

    /// Reads the words up to the next delimiter; false when there is none.
    bool next();
    const QStringList &words() const { return m_words; }
    QChar delimiter() const { return m_text.at(m_position - 1); }
    /// Where the first word begins, and where the text behind the delimiter does.
    QString::size_type begin() const { return m_begin; }
    QString::size_type end() const { return m_position; }

private:
    const QString &m_text;
    QString::size_type m_position{};
    QString::size_type m_begin{};
    QStringList m_words;
};

/// The text that a word between quotes stands for; nothing changes in any other word.
QString unescaped(const QString &word);

} // namespace bind9

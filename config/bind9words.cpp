// SPDX-License-Identifier: GPL-3.0-or-later
#include "config/bind9words.h"

#include <utility>

namespace {

// Where the comment that starts at `position` ends; `position` when none does.
QString::size_type endOfComment(const QString &text, QString::size_type position)
{
    const auto rest = QStringView{text}.mid(position);
    if (rest.startsWith(QLatin1String{"//"}) || rest.startsWith(QLatin1Char{'#'})) {
        const QString::size_type end{text.indexOf(QLatin1Char{'\n'}, position)};
        return end < 0 ? text.size() : end;
    }
    if (!rest.startsWith(QLatin1String{"/*"}))
        return position;
    const QString::size_type end{text.indexOf(QLatin1String{"*/"}, position + 2)};
    return end < 0 ? text.size() : end + 2;
}

// Follows a text character by character and knows what stands between quotes.
class QuoteState final
{
public:
    bool isQuoted() const { return m_quoted; }
    void pass(QChar c)
    {
        if (m_escaped)
            m_escaped = false;
        else if (c == bind9::quote)
            m_quoted = !m_quoted;
        else
            m_escaped = m_quoted && c == bind9::escape;
    }

private:
    bool m_quoted{};
    bool m_escaped{};
};

} // namespace

namespace bind9 {

QString withoutComments(const QString &text)
{
    QString result;
    result.reserve(text.size());
    QuoteState state;
    for (QString::size_type i{}; i < text.size();) {
        if (const QString::size_type end{state.isQuoted() ? i : endOfComment(text, i)}; end > i) {
            result += QLatin1Char{' '};
            i = end;
            continue;
        }
        const QChar c{text.at(i++)};
        state.pass(c);
        result += c;
    }
    return result;
}

bool Words::next()
{
    m_words.clear();
    QString word;
    QuoteState state;
    while (m_position < m_text.size()) {
        const QChar c{m_text.at(m_position++)};
        const bool wasQuoted{state.isQuoted()};
        state.pass(c);
        if (wasQuoted || !(c.isSpace() || isDelimiter(c))) {
            if (word.isEmpty() && m_words.isEmpty())
                m_begin = m_position - 1;
            word += c;
            continue;
        }
        if (!word.isEmpty())
            m_words += std::exchange(word, {});
        if (isDelimiter(c))
            return true;
    }
    return false;
}

QString unescaped(const QString &word)
{
    if (word.size() < 2 || !word.startsWith(quote) || !word.endsWith(quote))
        return word;
    QString result;
    for (int i{1}; i < word.size() - 1; ++i) {
        if (word.at(i) == escape && i + 1 < word.size() - 1)
            ++i;
        result += word.at(i);
    }
    return result;
}

} // namespace bind9

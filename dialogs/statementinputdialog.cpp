// SPDX-License-Identifier: GPL-3.0-or-later
#include "dialogs/statementinputdialog.h"

#include "ui_statementinputdialog.h"

#include <QShortcut>
#include <QTextDocument>

namespace {

/// The text of the document as it is; QTextDocument::toPlainText() makes blanks of no-break spaces.
QString textOf(const QTextDocument &document)
{
    QString text{document.toRawText()};
    for (const ushort lineEnd : {ushort{QChar::ParagraphSeparator}, ushort{QChar::LineSeparator}})
        text.replace(QChar{lineEnd}, QLatin1Char{'\n'});
    return text;
}

} // namespace

StatementInputDialog::StatementInputDialog(QWidget *parent)
    : QDialog{parent}
    , m_ui{std::make_unique<Ui::StatementInputDialog>()}
{
    m_ui->setupUi(this);
    m_ui->attributes->setMinimumWidth(fontMetrics().horizontalAdvance(QString{60, QLatin1Char{'x'}}));
    for (const QString &keys : {QStringLiteral("Ctrl+Return"), QStringLiteral("Ctrl+Enter")})
        connect(new QShortcut{keys, this}, &QShortcut::activated, this, &StatementInputDialog::accept);
}

StatementInputDialog::~StatementInputDialog() = default;

void StatementInputDialog::setLabelText(const QString &text) { m_ui->attrsLabel->setText(text); }

void StatementInputDialog::setStatementText(const QString &text) { m_ui->attributes->setPlainText(text); }

QStringList StatementInputDialog::statementWords() const
{
    QStringList words{textOf(*m_ui->attributes->document()).split(QLatin1Char{' '})};
    while (words.size() < 2)
        words.append(QString{});
    return words;
}

void StatementInputDialog::accept()
{
    if (!m_ui->attributes->toPlainText().isEmpty())
        QDialog::accept();
}

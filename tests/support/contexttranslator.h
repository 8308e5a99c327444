// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QTranslator>

/// A translation that shows where a text belongs: while it is installed, tr("text") is "context|text".
class ContextTranslator final : public QTranslator
{
    Q_OBJECT

public:
    bool isEmpty() const override;
    QString translate(const char *context, const char *sourceText, const char *disambiguation, int n) const override;
};

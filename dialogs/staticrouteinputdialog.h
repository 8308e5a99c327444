// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include <QDialog>

#include <memory>

class RouteModel;

namespace Ui {
class StaticRouteInputDialog;
}

/// Asks for the static routes that clients get from the server, edited in place in a table of net mask, network and
/// gateway.
class StaticRouteInputDialog final : public QDialog
{
    Q_OBJECT

public:
    explicit StaticRouteInputDialog(QWidget *parent = nullptr);
    ~StaticRouteInputDialog() override;
    Q_DISABLE_COPY_MOVE(StaticRouteInputDialog)

    /// Adds the routes of an option value to the table: words separated by comma and space, the octets of an address
    /// separated by commas. Ticks the check box for MS systems if `ms`.
    void setRoutes(const QString &text, bool ms);
    /// The words of the option value: prefix length, network and gateway of every route.
    QStringList routes() const;
    bool isMsRoute() const;
    /// Makes the check box for MS systems show the kind of the routes only, without a way to change it.
    void lockMsRoute();

public slots:
    void handleAddStaticRoute();
    /// While a cell is empty, says so and does nothing else.
    void accept() override;

private:
    void handleRemoveStaticRoute();
    QStringList cellTexts() const;

    const std::unique_ptr<Ui::StaticRouteInputDialog> m_ui;
    RouteModel *m_model;
};

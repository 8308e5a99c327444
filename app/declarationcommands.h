// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

#include "config/bind9reader.h"

#include <QCoreApplication>

class StatementCommands;
struct Reservation;

/// The commands that add and edit declarations, each with a dialog of its own: networks, hosts and what belongs to
/// them, static routes, and the zones and keys of a local bind9 server.
class DeclarationCommands final
{
    Q_DECLARE_TR_FUNCTIONS(FMain)

public:
    /// `commands` lives longer than this.
    explicit DeclarationCommands(StatementCommands &commands)
        : m_commands{commands}
    {
    }
    Q_DISABLE_COPY_MOVE(DeclarationCommands)

    // Those that add do so to the current declaration; those that edit do nothing unless the current statement is of
    // their kind.

    void addSharedNetwork();
    void editSharedNetwork();
    void addSubnet();
    void editSubnet();
    void addRange();
    void editRange();
    void addHost();
    void editHost();
    void addFixedAddress();
    void editFixedAddress();
    void addStaticRoute();
    void editStaticRoute();
    void addBind9Settings();
    /// A declaration of any words.
    void addArbitrary();
    void editArbitrary();

    /// Offers to add a host for a lease. Returns whether the user wants to see it.
    bool reserve(const Reservation &lease);

private:
    /// Which zones of bind9 were not added, and why not.
    static QString leftOutText(const QVector<bind9::LeftOutZone> &zones);
    static QString reasonText(const bind9::LeftOutZone &zone);

    StatementCommands &m_commands;
};

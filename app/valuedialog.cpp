// SPDX-License-Identifier: GPL-3.0-or-later
#include "app/valuedialog.h"

#include "dialogs/domaininputdialog.h"
#include "dialogs/macinputdialog.h"
#include "dialogs/multipleipinputdialog.h"
#include "dialogs/timeinputdialog.h"

#include <limits>

namespace {

/// The seconds of a lease time, which may be more than the dialog's numbers hold.
int secondsOf(const QString &time)
{
    using Limits = std::numeric_limits<int>;
    return static_cast<int>(qBound(qint64{Limits::min()}, time.toLongLong(), qint64{Limits::max()}));
}

template<typename Dialog>
ValueDialog wrap(std::unique_ptr<Dialog> owner, void (Dialog::*set)(const QString &value),
                 QString (Dialog::*get)() const)
{
    Dialog *dialog{owner.get()};
    return {std::move(owner), [dialog, set](const QString &value) { (dialog->*set)(value); },
            [dialog, get] { return (dialog->*get)(); }};
}

} // namespace

ValueDialog ValueDialog::make(ValueType type, const QString &label, QWidget *parent)
{
    switch (type) {
    case ValueType::AddressList: {
        auto dialog = std::make_unique<MultipleIpInputDialog>(parent);
        dialog->setLabel(label);
        return wrap(std::move(dialog), &MultipleIpInputDialog::setIps, &MultipleIpInputDialog::ips);
    }
    case ValueType::DomainName: {
        auto dialog = std::make_unique<DomainInputDialog>(parent);
        if (!label.isEmpty())
            dialog->setLabel(label);
        return wrap(std::move(dialog), &DomainInputDialog::setDomain, &DomainInputDialog::domain);
    }
    case ValueType::MacAddress:
        return wrap(std::make_unique<MacInputDialog>(parent), &MacInputDialog::setMac, &MacInputDialog::mac);
    case ValueType::Seconds: {
        auto owner = std::make_unique<TimeInputDialog>(parent);
        TimeInputDialog *dialog{owner.get()};
        return {std::move(owner), [dialog](const QString &text) { dialog->setSeconds(secondsOf(text)); },
                [dialog] { return dialog->seconds(); }};
    }
    case ValueType::Routes:
    case ValueType::Text:
        break;
    }
    Q_UNREACHABLE();
}

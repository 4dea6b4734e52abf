#include "order/KioskOffer.h"

#include "common/FirstFailure.h"
#include "order/OrderJournal.h"
#include "platform/files/Files.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

QString endOf(const QString& telephone) {
    QString digits;
    for (const QChar letter : telephone) {
        if (letter >= u'0' && letter <= u'9')
            digits += letter;
    }
    return digits.size() < telephoneEnd ? QString() : digits.last(telephoneEnd);
}

template <class Step>
Result<void> withEach(const QList<UnfinishedOrder>& orders, const Files& files, const Step& step) {
    FirstFailure steps;
    for (const UnfinishedOrder& order : orders) {
        if (const Result<OrderState> now = ReadOrderState(files, order.folder)) // else the staff decides about it
            steps.note(step(order.folder, *now));
    }
    return steps.outcome();
}

} // namespace

QList<UnfinishedOrder> OfferedOnKiosk(const QList<UnfinishedOrder>& orders, const Files& files) {
    QList<UnfinishedOrder> offered = orders;
    offered.removeIf(
        [&](const UnfinishedOrder& order) { return order.state.lapsed || !ReadOrderState(files, order.folder); });
    return offered;
}

bool IsEndOfTelephone(const OrderState& order, const QString& digits) {
    return std::any_of(order.choices.begin(), order.choices.end(), [&](const ListOutputEntry& choice) {
        return (choice.key == u"Shemot.n2" || choice.key == u"TelZalam") && digits.size() == telephoneEnd &&
               endOf(choice.value) == digits;
    });
}

Result<void> LetLapse(const QList<UnfinishedOrder>& orders, const Files& files) {
    return withEach(orders, files,
                    [&](const OrderFolder& folder, const OrderState&) { return OrderJournal(files, folder).lapsed(); });
}

Result<void> ThrowLapsedAway(const QList<UnfinishedOrder>& orders, const Files& files) {
    return withEach(orders, files, [&](const OrderFolder& folder, const OrderState& now) {
        const bool goes = now.lapsed && now.phase == OrderState::Phase::Preparing;
        return goes ? ThrowAwayOrder(files, folder) : Result<void>();
    });
}

} // namespace lumora

#include "order/OrderSender.h"

#include "order/OrderFolder.h"
#include "order/OrderNames.h"
#include "order/OrderState.h"
#include "platform/files/Files.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

bool hasSheet(const Files& files, const OrderFolder& folder, const QString& pattern) {
    const QStringList names = files.names(folder.path(), pattern);
    return std::any_of(names.begin(), names.end(), IsSheet);
}

} // namespace

std::optional<Sender> SenderMadeFor(const Files& files, const OrderFolder& folder) {
    if (const Result<OrderState> state = ReadOrderState(files, folder)) {
        if (state->way == OrderState::Way::Ftp)
            return Sender::Ftp;
        if (state->way == OrderState::Way::Http)
            return Sender::Http;
    }
    if (hasSheet(files, folder, u"*.jpp"_s))
        return Sender::Ftp;
    if (hasSheet(files, folder, u"*.jpg"_s))
        return Sender::Http;
    return std::nullopt;
}

bool SenderSetUp(const ClientProfile& profile, Sender sender) {
    if (sender == Sender::Http)
        return !profile.HttpHost.isEmpty();
    return !profile.FtpUser.isEmpty() && !profile.FtpServer.isEmpty() && !profile.FtpPassword.isEmpty();
}

Sender SenderForResend(const SessionState& state, const OrderFolder& folder, const Files& files) {
    if (!state.Careful)
        return state.transfer.SugSheliach;
    const Sender made = SenderMadeFor(files, folder).value_or(Sender::Ftp);
    const Sender other = made == Sender::Ftp ? Sender::Http : Sender::Ftp;
    return !SenderSetUp(state.profile, made) && SenderSetUp(state.profile, other) ? other : made;
}

} // namespace lumora

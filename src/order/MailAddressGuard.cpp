#include "order/MailAddressGuard.h"

#include "session/SessionState.h"

namespace lumora {

namespace {

bool isWhole(const QString& name) {
    const qsizetype at = name.indexOf(u'@');
    return at > 0 && at < name.size() - 1;
}

QString nameIn(const TypedAddress& typed) {
    QString name = typed.name.trimmed();
    if (name.endsWith(u'@'))
        name.chop(1);
    return name;
}

QString domainIn(const TypedAddress& typed) {
    if (typed.untouched)
        return {};
    QString domain = typed.domain.trimmed();
    if (domain.startsWith(u'@'))
        domain.remove(0, 1);
    return domain;
}

} // namespace

TypedAddress TypedAddress::of(const QString& address) {
    const qsizetype at = address.lastIndexOf(u'@');
    if (address == mailNotTyped)
        return {{}, {}, true};
    return at < 0 ? TypedAddress{address, {}, true} : TypedAddress{address.left(at), address.mid(at + 1), false};
}

QString MailAddressGuard::address(const TypedAddress& typed) const {
    if (!m_state.Careful)
        return typed.name + u'@' + typed.domain;
    const QString name = nameIn(typed);
    const QString domain = domainIn(typed);
    return name.isEmpty() || isWhole(name) || domain.isEmpty() ? name : name + u'@' + domain;
}

bool MailAddressGuard::isComplete(const TypedAddress& typed) {
    const QString name = nameIn(typed);
    return isWhole(name) || (!name.isEmpty() && !name.contains(u'@') && !domainIn(typed).isEmpty());
}

bool MailAddressGuard::lacksDomain(const TypedAddress& typed) const {
    const QString name = nameIn(typed);
    return m_state.Careful && !name.isEmpty() && !isWhole(name) && domainIn(typed).isEmpty();
}

bool MailAddressGuard::keepsDomain(const TypedAddress& typed) const {
    return m_state.Careful && !domainIn(typed).isEmpty();
}

} // namespace lumora

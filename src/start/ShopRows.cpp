#include "start/ShopRows.h"

#include "session/lab/Deployment.h"

namespace lumora {

using namespace Qt::StringLiterals;

QStringList ShopRows::texts() const {
    if (m_state.english() && !m_state.Careful)
        return {u"* Recieve by Postmail "_s, u"* Get at stor "_s};
    QStringList rows;
    for (const Shop& shop : m_deployment.profile.Shops)
        rows += u"* "_s + shop.name;
    return rows;
}

} // namespace lumora

#include "order/TailTelephone.h"

#include "common/AnsiCodePage.h"
#include "platform/Dialogs.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

QString TailTelephone::of(const QString& typed) const {
    return m_state.Careful ? squeezed(typed) : typed;
}

bool TailTelephone::mayGoOnWith(const QString& typed, Dialogs& dialogs) const {
    const QString number = AnsiCodePage::squeeze(of(typed.trimmed()));
    if (!m_state.Careful || number.size() <= width)
        return true;
    return dialogs.ask(question(number.left(width)));
}

QString TailTelephone::squeezed(const QString& typed) {
    if (typed.size() <= width)
        return typed;
    QString number = typed.trimmed();
    if (number.startsWith(u"+972"_s))
        number.replace(0, 4, u'0');
    return number.removeIf(
        [](QChar letter) { return letter.isSpace() || letter.category() == QChar::Punctuation_Dash; });
}

} // namespace lumora

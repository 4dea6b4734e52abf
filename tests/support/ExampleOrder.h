#pragma once

#include "order/PrintFile.h"
#include "session/SessionState.h"

namespace lumora {

// The session of a finished order, as the examples of the logs, sheets and reports have it.
inline SessionState exampleOrder() {
    using namespace Qt::StringLiterals;
    SessionState state;
    state.MisparHazmana = u"105"_s;
    state.shemot.n1 = u"Dana Levi"_s;
    state.shemot.n2 = u"03-1234567"_s;
    state.shemot.Mail = u"dana@example.com"_s;
    state.shemot.TimeOfJob = u"2026_11_21_KUP_1234^"_s;
    state.shemot.Hearot = u"gift - "_s;
    state.shemot.ppr = u"10/15"_s;
    state.shemot.maat = u"מבריק"_s;
    state.shemot.FillFit = u"FIT"_s;
    state.shemot.Bord = u"NB"_s;
    state.shemot.ser = u"1234"_s;
    state.shemot.Girsa = u"4.00"_s;
    state.shemot.TotalPics = 13;
    state.profile.JppChunks = 56;
    state.profile.JppBase = 30;
    return state;
}

// A print file in the shape that the profile asks for; its picture is no real one.
inline QByteArray examplePrint(const ClientProfile& profile) {
    return *packPrintFile(QByteArray(5000, 'p'), PrintFileShape::of(profile), QByteArray(40, ' '));
}

} // namespace lumora

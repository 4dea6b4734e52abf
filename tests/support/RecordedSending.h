#pragma once

#include "transfer/delivery/SendingEvents.h"

#include <QStringList>

#include <algorithm>
#include <vector>

namespace lumora {

// Keeps what the rules of a sending tell.
class RecordedSending final : public SendingEvents {
public:
    struct Told {
        SendingMoment moment;
        int number;
    };
    struct Trouble {
        LineStep step;
        Failure failure;
        QString subject;
    };

    void reached(SendingMoment moment, int number) override { moments.push_back({moment, number}); }
    void progressed(int, int) override {}
    void sending(int, int, const QString& name) override { names += name; }
    void pieceSent(double, std::optional<int>) override {}
    void movedBytes(qint64, qint64, std::optional<int>) override {}
    void failed(LineStep step, const Failure& failure, const QString& subject) override {
        troubles.push_back({step, failure, subject});
    }
    void notKept(const Failure&) override {}
    void enteredFolder(int level, const QString& asTold, const QString& withoutSlash) override {
        folders += QStringLiteral("%1 %2 %3").arg(level).arg(asTold, withoutSlash);
    }
    void pausing(int) override {}

    int count(SendingMoment moment) const {
        return static_cast<int>(
            std::count_if(moments.begin(), moments.end(), [&](const Told& told) { return told.moment == moment; }));
    }
    // The number that was told last with a moment; -1: it was never reached.
    int number(SendingMoment moment) const {
        const auto last =
            std::find_if(moments.rbegin(), moments.rend(), [&](const Told& told) { return told.moment == moment; });
        return last == moments.rend() ? -1 : last->number;
    }

    std::vector<Told> moments;
    std::vector<Trouble> troubles;
    QStringList names; // of the files that were put on the line
    QStringList folders;
};

} // namespace lumora

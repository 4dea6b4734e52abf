#pragma once

#include "transfer/delivery/SendingEvents.h"

#include <QStringList>

#include <algorithm>
#include <functional>
#include <vector>

namespace lumora {

// Keeps what the rules of a sending tell; a test may let something happen at a moment, as a click that arrives then.
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

    void reached(SendingMoment moment, int number) override {
        moments.push_back({moment, number});
        if (onMoment)
            onMoment(moment, number);
    }
    void progressed(int index, int) override { progress.push_back(index); }
    void sending(int, int, const QString& name) override { names += name; }
    void pieceSent(double share, std::optional<int> minutes) override { pieces.emplace_back(share, minutes); }
    void failed(LineStep step, const Failure& failure, const QString& subject) override {
        troubles.push_back({step, failure, subject});
    }
    void brokenNotKept(const Failure&) override { ++notKept; }
    void enteredFolder(int level, const QString& asTold, const QString& withoutSlash) override {
        folders += QStringLiteral("%1 %2 %3").arg(level).arg(asTold, withoutSlash);
    }
    void pausing(int) override { ++pauses; }

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
    bool failedAt(LineStep step) const {
        return std::any_of(troubles.begin(), troubles.end(),
                           [&](const Trouble& trouble) { return trouble.step == step; });
    }

    std::vector<Told> moments;
    std::vector<Trouble> troubles;
    std::vector<int> progress;
    std::vector<std::pair<double, std::optional<int>>> pieces;
    QStringList names; // of the files that were put on the line
    QStringList folders;
    int notKept = 0;
    int pauses = 0;
    std::function<void(SendingMoment, int)> onMoment;
};

} // namespace lumora

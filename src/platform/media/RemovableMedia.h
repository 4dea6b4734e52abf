#pragma once

#include "platform/files/HostPath.h"

#include <QObject>
#include <QString>

#include <vector>

namespace lumora {

// A memory card or a stick that is mounted.
struct Medium {
    enum class Kind { Other, SdCard, Card, Stick };
    QString id; // no two media that are in at once share it
    Kind kind = Kind::Other;
    QString label; // what its owner or its camera named it; may be empty
    HostPath folder;

    bool operator==(const Medium&) const = default;
};

// Tells which media are in. It may live in a thread of its own, so that a slow medium or service never holds the
// window.
class RemovableMedia : public QObject {
    Q_OBJECT
public:
    // Called once, in the thread in which the object lives.
    virtual void begin() = 0;

Q_SIGNALS:
    // All that are mounted now, in no order; sent at the beginning and whenever they change.
    void found(const std::vector<lumora::Medium>& media);
    // This machine has no such source. Nothing more is found by this one.
    void absent();
};

} // namespace lumora

#pragma once

#include <QString>

#include <array>
#include <optional>

namespace lumora {

struct SessionState;

// The seven messages of the details page, by their numbers.
using DetailsMessages = std::array<QString, 7>;
DetailsMessages detailsMessages(bool english);

// What a check found: what to say, and where the customer sets it right.
struct DetailsProblem {
    enum class Place { Name, Telephone, Address, Size, Kind, Border };
    QString message;
    Place place;
};

// Takes every telephone, since customers add names and extensions; the message for digits only is kept for a lab that
// wants it.
bool IsPhoneOk(const QString& telephone);

// The details as typed, into the record, trimmed.
void takeDetails(SessionState& state, const QString& name, const QString& telephone, const QString& address);

// Before the options: a name, and an address for a home delivery.
std::optional<DetailsProblem> checkTyped(const SessionState& state, const QString& name, const QString& address);

// The record of a normal order, in the order of the page; the first fault found.
std::optional<DetailsProblem> CheckDetails(const SessionState& state);

} // namespace lumora

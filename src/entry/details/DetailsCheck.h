#pragma once

#include <QString>

#include <optional>

namespace lumora {

struct OrderDetails;
struct SessionState;

// The messages of the details page, in the order of their numbers.
enum class DetailsMessage {
    NothingStored,
    NameBeforeOptions,
    AddressBeforeOptions,
    NoName,
    NoAddress,
    DigitsOnly, // for a lab that wants telephones of digits alone; no check asks for it
    NoTelephone,
};
QString detailsMessage(DetailsMessage message, bool english);

// What a check found: what to say, and where the customer sets it right.
struct DetailsProblem {
    enum class Place { Name, Telephone, Address, Size, Kind, Border };
    QString message;
    Place place;
};

// True for every telephone, since customers add names and extensions.
bool IsPhoneOk(const QString& telephone);

// The details as typed, into the record, trimmed.
void takeDetails(OrderDetails& shemot, const QString& name, const QString& telephone, const QString& address);

// Before the options: a name, and an address for a home delivery.
std::optional<DetailsProblem> checkTyped(const SessionState& state, const QString& name, const QString& address);

// The record of a normal order, in the order of the page; the first fault found.
std::optional<DetailsProblem> CheckDetails(const SessionState& state);

} // namespace lumora

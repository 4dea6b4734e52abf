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

// Writes the details as typed, trimmed, into the record.
void takeDetails(OrderDetails& shemot, const QString& name, const QString& telephone, const QString& address);

// The check before the options: a name, and an address for a home delivery.
std::optional<DetailsProblem> checkTyped(const SessionState& state, const QString& name, const QString& address);

// Checks the record of a normal order in the order of the page and gives the first fault.
std::optional<DetailsProblem> CheckDetails(const SessionState& state);

} // namespace lumora

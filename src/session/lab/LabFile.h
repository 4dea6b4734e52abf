#pragma once

#include "platform/files/HostPath.h"
#include "session/lab/Deployment.h"

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

// lab.ini: sections in brackets, a key and a value a line, UTF-8, comments from "#" or ";" at the start of a line.
// packaging/lab.ini.example explains each key.
namespace lumora {

// The deployment as it was read, and the errors and warnings about it. With errors the deployment must not be used: a
// lab would work with values that nobody chose. Each text names file, line and key, and what is allowed; no text holds
// a password.
struct LabFileReading {
    Deployment deployment;
    QStringList errors;
    QStringList warnings;
};

// fileName is for the messages only.
LabFileReading ParseLabFile(const QByteArray& bytes, const QString& fileName);

// A file that can't be read is an error; one that holds a password and that others may read gives a warning.
LabFileReading ReadLabFile(const HostPath& file);

// lab.ini beside the program, in /etc/lumora, in $XDG_CONFIG_HOME/lumora (or ~/.config/lumora): in this order.
std::vector<HostPath> labFilePlaces(const HostPath& programFolder);
// The first of the places that has a file.
std::optional<HostPath> FindLabFile(const std::vector<HostPath>& places);

} // namespace lumora

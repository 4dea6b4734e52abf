#pragma once

#include <QStringList>

namespace lumora {

// The common mail domains that a customer may pick behind the "@", and what stands in the box before.
QStringList mailDomains();
QString mailDomainPrompt(bool english);

} // namespace lumora

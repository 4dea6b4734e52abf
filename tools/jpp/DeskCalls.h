#pragma once

#include "order/PrintFile.h"

#include <QString>

class QCommandLineParser;

namespace lumora {

// The calls by which a lab takes orders in. Each returns the exit status: 0 all is well, 1 a fault, 2 a call that is
// not understood.
class DeskCalls {
public:
    static void addOptions(QCommandLineParser& parser);

    DeskCalls(const QCommandLineParser& parser, PrintFileShape shape)
        : m_parser(parser)
        , m_shape(shape) {}

    int watch(const QString& folder) const;
    int exportOrders(const QStringList& orders) const;
    int report(const QString& folder) const;

private:
    QString bookOf(const QString& folder) const;

    const QCommandLineParser& m_parser;
    PrintFileShape m_shape;
};

} // namespace lumora

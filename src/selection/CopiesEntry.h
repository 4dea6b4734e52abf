#pragma once

#include <QString>

#include <optional>

namespace lumora {

// The copies of a picture as they are typed on digits, 0 to 99. The first digit takes the place of the number that
// stood there.
class CopiesEntry {
public:
    void begin(int copies);
    void type(int digit);
    void takeBack();

    QString text() const { return m_text; }
    // None while nothing stands there.
    std::optional<int> copies() const;
    // The picture goes out of the order.
    bool removes() const { return copies() == 0; }

private:
    QString m_text;
    bool m_begun = false; // a digit was typed or taken back
};

} // namespace lumora

#ifndef QRX_TESTS_DECKS_UNIFIEDDIFF_H
#define QRX_TESTS_DECKS_UNIFIEDDIFF_H

#include <string>
#include <string_view>

/// What differs between two texts, as a unified diff with three lines around each change; empty when they are
/// equal byte for byte. Meant for small texts: time and memory grow with the product of their lines.
std::string UnifiedDiff(std::string_view expected, std::string_view actual, std::string_view expectedName,
                        std::string_view actualName);

#endif

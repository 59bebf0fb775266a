#ifndef QRX_DECK_READER_DRD_EMITTER_H
#define QRX_DECK_READER_DRD_EMITTER_H

#include "deck_reader/drd_Deck.h"
#include "foundation/qio_Device.h"

#include <span>
#include <string>
#include <string_view>
#include <vector>

/// Writes decks out of what was read of others.
class drd_Emitter {
public:
    explicit drd_Emitter(qio_ostream& device) : device_(device) {}
    drd_Emitter(const drd_Emitter&) = delete;
    drd_Emitter& operator=(const drd_Emitter&) = delete;
    ~drd_Emitter() { Flush(); }

    /// A line as it stands; several with "\n" between.
    void Line(std::string_view text);
    /// `*Name, parameter=value`, over several lines where it is long.
    void Keyword(std::string_view name, std::span<const drd_Parameter> parameters);
    /// `label, x, y, z` with the digits that single precision needs.
    void Node(int label, const double (&point)[3]);
    /// `label, node, ...`, sixteen numbers a line.
    void Element(int label, std::span<const int> nodes);
    /// Labels, sixteen a line.
    void Labels(std::span<const int> labels);
    /// The name of a set in a set, on a line of its own.
    void Member(std::string_view name);
    void Flush();

    /// A real as decks have it, with so many digits.
    static std::string Real(double value, int digits);

private:
    void Int(int value);
    void EndLine();

    qio_ostream& device_;
    std::string text_;
};

/// Writes the deck anew in one form: keywords as they are listed, parameters in the order of their names,
/// numbers in their shortest form, sets with their labels listed, without comments. Two decks that mean the
/// same give nearly the same text, so that tools that compare lines have something to compare.
void drd_Reformat(const drd_Deck& deck, qio_ostream& device);

#endif

#ifndef QRX_OIF_DECKLINES_H
#define QRX_OIF_DECKLINES_H

#include "foundation/cow_String.h"

#include <memory>
#include <string>
#include <vector>

class odb_Odb;

/// The lines that one object puts into a deck.
struct oif_ObjectLines {
    /// Empty for the step itself.
    cow_String loadCase;
    std::string text;
};

/// What single objects of a store's model become in a deck, step by step: the very lines that
/// oif_Writer would write, made by the same builders. Banners, which stand ahead of all objects of a kind,
/// are no object's own, nor are sets and coordinate systems that objects use.
class oif_DeckLines {
public:
    /// The store must outlive it. Raises what writing the deck would raise while it is built.
    explicit oif_DeckLines(const odb_Odb& odb);
    oif_DeckLines(const oif_DeckLines&) = delete;
    oif_DeckLines& operator=(const oif_DeckLines&) = delete;
    ~oif_DeckLines();

    /// Whether it knows lines of the objects in a repository, by its name in model files: "steps",
    /// "constraints", "boundaryConditions", "loads", "fields" and "interactions".
    static bool Knows(const std::string& repository);
    /// The object's lines in the step, then in each of its load cases; nothing where a step only carries the
    /// object on. A step's own lines are those of its procedure, and its load cases' beginnings. What stands
    /// ahead of all steps (constraints, what contacts begin with) is the first step's.
    std::vector<oif_ObjectLines> Of(const std::string& repository, const cow_String& name,
                                    const cow_String& step) const;

private:
    class Run;
    std::unique_ptr<const Run> run_;
};

#endif

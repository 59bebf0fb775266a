#ifndef QRX_STORE_FND_NEAREST_H
#define QRX_STORE_FND_NEAREST_H

#include "store_interface/findings/fnd_Finding.h"

/// Looks among known names for the one that a wrong name was meant to be: the nearest by characters put in,
/// left out, changed or swapped with the next, capitals not counted. Where none is near, one that begins as
/// the name does and goes on, or the name after it.
class fnd_Nearest {
public:
    explicit fnd_Nearest(std::string_view name);
    void Try(std::string_view candidate);
    /// "did you mean 'x'?", or nothing when none is near.
    std::string Hint() const;

private:
    static constexpr std::size_t kLongest = 80;
    /// So much says which name is meant.
    static constexpr std::size_t kBeginning = 3;

    /// The distance when it is below `least_`, else `least_`.
    std::size_t DistanceTo(const char* candidate, std::size_t length) const;

    char name_[kLongest];
    std::size_t length_ = 0;
    unsigned long long letters_ = 0;
    std::size_t least_ = 0; ///< only what is nearer counts
    std::string nearest_;
    std::size_t leastRest_ = kLongest;
    std::string sameBeginning_;
};

/// The known name that is nearest to `name`, as "did you mean 'x'?", or nothing when none is near.
std::string fnd_DidYouMean(std::string_view name, const std::vector<std::string>& known);

/// The same for a finding that goes to the sink, among names that are worth listing only if it wants hints:
/// `tryAll` gives them to a fnd_Nearest.
template <class TryAll>
std::string fnd_DidYouMean(fnd_Sink& sink, std::string_view name, const TryAll& tryAll) {
    if (!sink.WantsHint()) return {};
    fnd_Nearest nearest(name);
    tryAll(nearest);
    return nearest.Hint();
}

/// Longer lists are of no help to anybody.
inline constexpr std::size_t fnd_kListed = 10;
/// Which of the words a list shows: all of them up to fnd_kListed, else as many as are most like `name`, in
/// the order of the words, or the first ones where there is no name.
std::vector<std::size_t> fnd_PlacesOfNearest(const std::vector<std::string>& words, std::string_view name);

/// The names that there are, or those most like `name`: "there are 'a', 'b', ...", or "there is none".
std::string fnd_ThereAre(const std::vector<std::string>& known, std::string_view name);

#endif

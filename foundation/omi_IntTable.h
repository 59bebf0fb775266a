#ifndef QRX_FOUNDATION_OMI_INTTABLE_H
#define QRX_FOUNDATION_OMI_INTTABLE_H

#include <vector>

/// A table by integer in two halves, one for keys from 0 on and one for negative keys; an entry stands under
/// the key's magnitude in the half of its sign. Dense in its keys; reading a key that was never entered
/// gives T().
template <class T>
class omi_IntTable {
public:
    void Insert(int key, const T& value) {
        auto& half = Half(key);
        const auto place = Magnitude(key);
        if (place >= half.size()) half.resize(place + 1);
        half[place] = value;
    }
    T ConstGet(int key) const {
        const auto& half = key < 0 ? negative_ : nonNegative_;
        const auto place = Magnitude(key);
        return place < half.size() ? half[place] : T();
    }

private:
    static std::size_t Magnitude(int key) {
        return key < 0 ? static_cast<std::size_t>(-static_cast<long long>(key))
                       : static_cast<std::size_t>(key);
    }
    std::vector<T>& Half(int key) { return key < 0 ? negative_ : nonNegative_; }

    std::vector<T> nonNegative_;
    std::vector<T> negative_;
};

#endif

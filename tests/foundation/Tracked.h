#ifndef QRX_TESTS_FOUNDATION_TRACKED_H
#define QRX_TESTS_FOUNDATION_TRACKED_H

#include <stdexcept>
#include <vector>

/// An item that counts its living objects, logs destructions and can make the n-th copy fail. It has no
/// move, so that every transfer is a copy that may fail.
class Tracked {
public:
    Tracked() : Tracked(0) {}
    explicit Tracked(int value) : value_(value) { ++alive; }
    Tracked(const Tracked& other) : value_(other.value_) {
        BurnFuse();
        ++alive;
    }
    Tracked& operator=(const Tracked& other) {
        BurnFuse();
        value_ = other.value_;
        return *this;
    }
    ~Tracked() {
        --alive;
        destroyed.push_back(value_);
    }
    int Value() const { return value_; }
    friend bool operator==(const Tracked&, const Tracked&) = default;

    static void Reset() {
        alive = 0;
        fuse = -1;
        destroyed.clear();
    }

    static inline int alive = 0;
    /// Copies that still succeed; negative for no limit.
    static inline int fuse = -1;
    static inline std::vector<int> destroyed;

private:
    static void BurnFuse() {
        if (fuse == 0) throw std::runtime_error("copy refused");
        if (fuse > 0) --fuse;
    }

    int value_;
};

#endif

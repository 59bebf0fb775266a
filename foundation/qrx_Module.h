#ifndef QRX_FOUNDATION_QRX_MODULE_H
#define QRX_FOUNDATION_QRX_MODULE_H

/// The users of a module. Initialize() adds 1 to its argument when the first user comes, Finalize() takes 1
/// off when the last one goes; any other call leaves it alone.
class qrx_Module {
public:
    void Initialize(int& count) {
        if (users_++ == 0) ++count;
    }
    void Finalize(int& count) {
        if (users_ > 0 && --users_ == 0) --count;
    }
    /// Whether this call would be the first user's, or the last one's.
    bool IsIdle() const { return users_ == 0; }
    bool HasOneUser() const { return users_ == 1; }

private:
    int users_ = 0;
};

void BaseGeometry_initialize(int& count);
void BaseGeometry_finalize(int& count);
void BaseUtilities_initialize(int& count);
void BaseUtilities_finalize(int& count);
void BaseShared_initialize(int& count);
void BaseShared_finalize(int& count);
void BaseCoreUtilities_initialize(int& count);
void BaseCoreUtilities_finalize(int& count);
void BaseAlloc_initialize(int& count);
void BaseAlloc_finalize(int& count);

#endif

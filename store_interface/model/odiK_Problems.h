#ifndef QRX_STORE_ODIK_PROBLEMS_H
#define QRX_STORE_ODIK_PROBLEMS_H

#include <string>

/// Takes what is wrong with data on their way into the store. `place` is the path of the datum below the
/// object that is being filled, such as "/labels/3".
class odiK_Problems {
public:
    virtual ~odiK_Problems() = default;
    virtual void Error(const std::string& place, const std::string& text) = 0;
    virtual void Warning(const std::string& place, const std::string& text) = 0;
};

/// Raises at the first error and passes warnings over; for programs that fill a store directly.
class odiK_RaiseProblems : public odiK_Problems {
public:
    void Error(const std::string& place, const std::string& text) override;
    void Warning(const std::string& place, const std::string& text) override;
};

#endif

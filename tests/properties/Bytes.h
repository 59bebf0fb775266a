#ifndef QRX_TESTS_PROPERTIES_BYTES_H
#define QRX_TESTS_PROPERTIES_BYTES_H

#include <rapidcheck.h>

#include <string>

/// Short texts over a few bytes, so that equal and nearly equal ones are frequent; zero bytes and bytes above
/// 127 are among them.
inline rc::Gen<std::string> ShortText() {
    static const std::string bytes("abAB01-_. \0\x80\xff", 13);
    return rc::gen::container<std::string>(rc::gen::elementOf(bytes));
}

#endif

#ifndef QRX_TESTS_STORE_STORETESTING_H
#define QRX_TESTS_STORE_STORETESTING_H

#include "foundation/cow_List.h"
#include "foundation/cow_String.h"
#include "foundation/nex_Exception.h"
#include "store_interface/findings/fnd_Finding.h"

#include <string>
#include <vector>

/// The text of the library's exception that `action` raises; "nothing raised" without one.
template <class Action>
std::string Raised(Action action) {
    try {
        action();
    } catch (const QRXBasException& failure) {
        return failure.what();
    }
    return "nothing raised";
}

/// Keeps the problems as "place: text", warnings with "warning " in front.
class CollectedProblems final : public fnd_Sink {
public:
    void Take(fnd_Finding finding) override;

    std::vector<std::string> all;
};

std::vector<std::string> Texts(const cow_List<cow_String>& list);

template <class T>
std::vector<T> Items(const cow_List<T>& list) {
    std::vector<T> items;
    for (int i = 0; i < list.Length(); ++i) items.push_back(list[i]);
    return items;
}

using Strings = std::vector<std::string>;
using Ints = std::vector<int>;

#endif

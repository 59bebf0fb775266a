#include "foundation/cow_List.h"
#include "foundation/cow_String.h"

#include <cstdio>

int main() {
    const cow_String instance("Part-1-1.");
    cow_List<cow_String> names;
    for (int i = 1; i <= 2; ++i) names.Append(instance + cow_String("Set-") + cow_String(i));
    std::printf("%s %s\n", names[0].CStr(), names[1].CStr());
    return names.Length() == 2 ? 0 : 1;
}

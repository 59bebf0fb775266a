#include "foundation/cow_2DArray.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <array>
#include <vector>

namespace {

RC_GTEST_PROP(cow_2DArray, RandomWrites_MatchVectorOfVectors, ()) {
    const int rows = *rc::gen::inRange(0, 6);
    const int columns = *rc::gen::inRange(0, 6);
    std::array<cow_2DArray<int>, 2> arrays;
    std::array<std::vector<std::vector<int>>, 2> models;
    arrays.fill(cow_2DArray<int>(rows, columns));
    models.fill(std::vector<std::vector<int>>(static_cast<std::size_t>(rows),
                                              std::vector<int>(static_cast<std::size_t>(columns))));
    const int steps = rows * columns == 0 ? 0 : *rc::gen::inRange(0, 40);
    for (int step = 1; step <= steps; ++step) {
        const auto which = *rc::gen::inRange<std::size_t>(0, 2);
        if (*rc::gen::inRange(0, 5) == 0) {
            arrays[which] = arrays[1 - which];
            models[which] = models[1 - which];
            continue;
        }
        const int row = *rc::gen::inRange(0, rows);
        const int column = *rc::gen::inRange(0, columns);
        arrays[which].Put(row, column, step);
        models[which][static_cast<std::size_t>(row)][static_cast<std::size_t>(column)] = step;
    }
    for (std::size_t which = 0; which < 2; ++which) {
        for (int row = 0; row < rows; ++row) {
            for (int column = 0; column < columns; ++column) {
                const int expected =
                    models[which][static_cast<std::size_t>(row)][static_cast<std::size_t>(column)];
                RC_ASSERT(arrays[which].ConstGet(row, column) == expected);
                RC_ASSERT(arrays[which].ConstRow(row)[column] == expected);
            }
        }
    }
    RC_ASSERT((arrays[0] == arrays[1]) == (models[0] == models[1]));
}

} // namespace

#include "foundation/cow_2DArray.h"

#include "tests/foundation/RaisedText.h"

#include <gtest/gtest.h>

#include <utility>

namespace {

TEST(cow_2DArray, DefaultConstructed_IsEmpty) {
    const cow_2DArray<int> array;
    EXPECT_EQ(array.NumRows(), 0);
    EXPECT_EQ(array.NumColumns(), 0);
    EXPECT_TRUE(array.IsEmpty());
    EXPECT_TRUE(array == cow_2DArray<int>());
}

TEST(cow_2DArray, MadeWithSizes_HoldsDefaults) {
    const cow_2DArray<double> array(2, 3);
    EXPECT_EQ(array.NumRows(), 2);
    EXPECT_EQ(array.NumColumns(), 3);
    for (int row = 0; row < 2; ++row) {
        for (int column = 0; column < 3; ++column) EXPECT_EQ(array.ConstGet(row, column), 0.0);
    }
}

TEST(cow_2DArray, RowsWithoutColumns_KeepsItsCounts) {
    const cow_2DArray<int> array(3, 0);
    EXPECT_TRUE(array.IsEmpty());
    EXPECT_EQ(array.NumRows(), 3);
    EXPECT_TRUE(array == cow_2DArray<int>(3, 0));
    EXPECT_FALSE(array == cow_2DArray<int>(0, 3));
}

TEST(cow_2DArray, Put_ChangesThatItemOnly) {
    cow_2DArray<int> array(2, 2);
    array.Put(0, 1, 5);
    array.Put(1, 0, 6);
    EXPECT_EQ(array.ConstGet(0, 0), 0);
    EXPECT_EQ(array.ConstGet(0, 1), 5);
    EXPECT_EQ(array.ConstGet(1, 0), 6);
    EXPECT_EQ(array.ConstGet(1, 1), 0);
}

TEST(cow_2DArray, Rows_LieInOnePieceEach) {
    cow_2DArray<int> array(2, 3);
    for (int row = 0; row < 2; ++row) {
        for (int column = 0; column < 3; ++column) array.Put(row, column, 10 * row + column);
    }
    const int* row = array.ConstRow(1);
    EXPECT_EQ(row[0], 10);
    EXPECT_EQ(row[1], 11);
    EXPECT_EQ(row[2], 12);
}

TEST(cow_2DArray, CopyWritten_LeavesOriginal) {
    const cow_2DArray<int> array(2, 2);
    cow_2DArray<int> copy(array);
    EXPECT_EQ(copy.ConstRow(0), array.ConstRow(0));
    EXPECT_TRUE(copy == array);
    copy.Put(0, 0, 1);
    EXPECT_EQ(array.ConstGet(0, 0), 0);
    EXPECT_EQ(copy.ConstGet(0, 0), 1);
    EXPECT_FALSE(copy == array);
}

TEST(cow_2DArray, PlaceOutside_Raises) {
    cow_2DArray<int> array(2, 3);
    EXPECT_EQ(RaisedText([&] { static_cast<void>(array.ConstGet(2, 0)); }),
              "cow_2DArray: row 2 is out of range, expected 0 to 1");
    EXPECT_EQ(RaisedText([&] { static_cast<void>(array.ConstGet(0, 3)); }),
              "cow_2DArray: column 3 is out of range, expected 0 to 2");
    EXPECT_EQ(RaisedText([&] { array.Put(-1, 0, 1); }),
              "cow_2DArray: row -1 is out of range, expected 0 to 1");
    EXPECT_EQ(RaisedText([&] { static_cast<void>(array.ConstRow(2)); }),
              "cow_2DArray: row 2 is out of range, expected 0 to 1");
    EXPECT_EQ(RaisedText([&] { static_cast<void>(cow_2DArray<int>().ConstGet(0, 0)); }),
              "cow_2DArray: row 0 is out of range, there are no items");
}

TEST(cow_2DArray, NegativeSize_Raises) {
    EXPECT_THROW(cow_2DArray<int>(-1, 2), QRXBasException);
    EXPECT_THROW(cow_2DArray<int>(2, -1), QRXBasException);
}

TEST(cow_2DArray, Moved_LeavesArrayThatCanBeRead) {
    cow_2DArray<int> array(2, 2);
    array.Put(1, 1, 4);
    const cow_2DArray<int> taken(std::move(array));
    EXPECT_EQ(taken.ConstGet(1, 1), 4);
    // NOLINTNEXTLINE(bugprone-use-after-move)
    for (int row = 0; row < array.NumRows(); ++row) EXPECT_NE(array.ConstRow(row), nullptr);
}

} // namespace

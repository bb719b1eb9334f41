// SPDX-License-Identifier: MIT
#include "gmkernel/KxArray.h"

#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <vector>

namespace {

struct OpenArray : KxArray<int*, int*> {
    int Capacity() const { return m_nMaxSize; }
};

int g_values[64];

std::vector<int*> Content(OpenArray const& array) {
    std::vector<int*> content;
    for (int i = 0; i < array.GetSize(); ++i)
        content.push_back(array[i]);
    return content;
}

}  // namespace

TEST(KxArray, GrowsByTheStepOrToTheSizeNeeded) {
    struct {
        int size, growBy, newSize, capacity;
    } const rows[] = {{0, 0, 1, 1},    {16, 0, 17, 20},   {40, 0, 41, 45},
                      {40, 0, 45, 45}, {40, 0, 100, 100}, {16000, 0, 16001, 17024},
                      {40, 7, 41, 47}, {40, -5, 41, 41},  {40, 0, 20, 40},
                      {40, 0, 0, 0}};
    for (auto const& row : rows) {
        OpenArray array;
        array.SetSize(row.size, row.growBy);
        array.SetSize(row.newSize);
        EXPECT_EQ(array.GetSize(), row.newSize);
        EXPECT_EQ(array.Capacity(), row.capacity) << row.size << " to " << row.newSize;
    }
}

TEST(KxArray, FollowsAModelThroughRandomEdits) {
    EXPECT_TRUE(rc::check([] {
        OpenArray array;
        std::vector<int*> model;
        const int edits = *rc::gen::inRange(1, 60);
        for (int i = 0; i < edits; ++i) {
            int* const value = &g_values[*rc::gen::inRange(0, 64)];
            const int size = static_cast<int>(model.size());
            const int at = *rc::gen::inRange(0, size + 1);
            const int count = *rc::gen::inRange(-1, 4);
            const bool inside = count > 0 && at + count <= size;
            switch (*rc::gen::inRange(0, 4)) {
                case 0:  // shrinks or appends null entries
                    array.SetSize(at + count);
                    if (at + count >= 0) model.resize(static_cast<size_t>(at + count), nullptr);
                    break;
                case 1:
                    array.RemoveAt(at, count);
                    if (inside) model.erase(model.begin() + at, model.begin() + at + count);
                    break;
                default:
                    array.InsertAt(at, value, count);
                    if (count > 0) model.insert(model.begin() + at, size_t(count), value);
            }
            RC_ASSERT(Content(array) == model);
            RC_ASSERT(array.Capacity() >= array.GetSize());
        }
    }));
}

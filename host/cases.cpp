#include "host/cases.h"

namespace host {

const std::vector<RectSize> &RectSizes() {
    static const std::vector<RectSize> sizes = {
        {1, 1}, {64, 64}, {65, 65}, {1000, 3}, {3, 1000}, {65, 64}, {64, 65}, {7, 33}, {130, 97},
    };
    return sizes;
}

const std::vector<RectSize> &EmptyRectSizes() {
    static const std::vector<RectSize> sizes = {
        {0, 5}, {5, 0}, {0, 0}, {-1, 5}, {5, -3}, {-7, -7}, {0, 100}, {100, -1},
    };
    return sizes;
}

const std::vector<int> &RunLengths() {
    static const std::vector<int> lengths = {-5, 0, 1, 3, 4, 7, 8, 15, 16, 17, 31, 32, 33, 64, 1000, 4097};
    return lengths;
}

std::vector<int> RowBytesVariants(int columns, int elemSize) {
    const int tight = columns * elemSize;
    return {tight, tight + 5, tight + 64, -(tight + 3)};
}

std::string Describe(const RectSize &s, const std::vector<int> &strides) {
    std::string text = std::to_string(s.rows) + "x" + std::to_string(s.columns) + " strides";
    for (int v : strides) text += " " + std::to_string(v);
    return text;
}

}  // namespace host

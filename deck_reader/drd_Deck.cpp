#include "deck_reader/drd_Deck.h"

#include "deck_reader/drd_Text.h"

#include <algorithm>
#include <cmath>
#include <numbers>

const drd_Parameter* drd_Keyword::Find(std::string_view parameter) const {
    for (const drd_Parameter& own : Parameters()) {
        if (own.Key() == parameter) return &own;
    }
    return nullptr;
}

std::string_view drd_Keyword::Value(std::string_view parameter) const {
    const drd_Parameter* found = Find(parameter);
    return found == nullptr ? std::string_view() : std::string_view(found->value);
}

drd_Place drd_PlaceOf(const std::vector<drd_PlaceRun>& runs, std::uint64_t record) {
    auto run = std::upper_bound(runs.begin(), runs.end(), record,
                                [](std::uint64_t index, const drd_PlaceRun& r) { return index < r.first; });
    if (run == runs.begin()) return {};
    --run;
    return {run->file,
            static_cast<long>(run->line + static_cast<std::int64_t>(record - run->first) * run->stride)};
}

bool drd_Placement::IsNone() const {
    return degrees == 0.0 && move[0] == 0.0 && move[1] == 0.0 && move[2] == 0.0;
}

void drd_Placement::Turn(const double (&vector)[3], double (&turned)[3]) const {
    std::copy(std::begin(vector), std::end(vector), std::begin(turned));
    const double axis[3] = {to[0] - from[0], to[1] - from[1], to[2] - from[2]};
    const double length = std::sqrt(axis[0] * axis[0] + axis[1] * axis[1] + axis[2] * axis[2]);
    if (degrees == 0.0 || length == 0.0) return;
    const double u[3] = {axis[0] / length, axis[1] / length, axis[2] / length};
    const double angle = degrees * std::numbers::pi / 180.0;
    const double sine = std::sin(angle);
    const double cosine = std::cos(angle);
    const double along = (u[0] * vector[0] + u[1] * vector[1] + u[2] * vector[2]) * (1.0 - cosine);
    for (int i = 0; i < 3; ++i) {
        const int j = (i + 1) % 3;
        const int k = (i + 2) % 3;
        turned[i] = vector[i] * cosine + (u[j] * vector[k] - u[k] * vector[j]) * sine + u[i] * along;
    }
}

void drd_Placement::Place(const double (&point)[3], double (&placed)[3]) const {
    double arm[3];
    for (int i = 0; i < 3; ++i) arm[i] = degrees == 0.0 ? point[i] + move[i] : point[i] + move[i] - from[i];
    if (degrees == 0.0) {
        std::copy(std::begin(arm), std::end(arm), std::begin(placed));
        return;
    }
    Turn(arm, placed);
    for (int i = 0; i < 3; ++i) placed[i] += from[i];
}

bool drd_PlacementOf(const drd_Deck& deck, const drd_Block& instance, drd_Placement& placement) {
    placement = {};
    const drd_Keyword& keyword = deck.keywords[static_cast<std::size_t>(instance.begin)];
    double values[10] = {};
    std::size_t known = 0;
    for (std::uint64_t line = 0; line < keyword.lines && known < 10; ++line) {
        std::string_view text = deck.DataLine(keyword, line);
        if (drd_Trim(text).empty()) continue;
        for (const std::size_t stop = known == 0 ? 3 : 10; known < stop; ++known) {
            const std::string_view field = drd_Field(text, 0);
            if (!field.empty() && !drd_ReadReal(field, values[known])) return false;
            const std::size_t comma = text.find(',');
            text = comma == std::string_view::npos ? std::string_view() : text.substr(comma + 1);
        }
    }
    std::copy(values, values + 3, placement.move);
    std::copy(values + 3, values + 6, placement.from);
    std::copy(values + 6, values + 9, placement.to);
    placement.degrees = values[9];
    return placement.degrees == 0.0 || !std::equal(values + 3, values + 6, values + 6);
}

#include "view_page/vpg_Profiles.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/sections/kbpC_BeamProfile.h"

#include <cmath>
#include <numbers>

namespace {

using Line = vpg_Outline::value_type;

Line Polygon(double radius, int corners) {
    Line line;
    for (int i = 0; i <= corners; ++i) {
        const double angle = 2.0 * std::numbers::pi * (i % corners) / corners;
        line.push_back({radius * std::cos(angle), radius * std::sin(angle)});
    }
    return line;
}

Line Closed(Line line) {
    line.push_back(line.front());
    return line;
}

Line Rectangle(double left, double right, double bottom, double top) {
    return Closed({{left, bottom}, {right, bottom}, {right, top}, {left, top}});
}

vpg_Outline Circle(const kbpC_CircularProfile& p) {
    return {Polygon(p.r, 32)};
}

vpg_Outline Pipe(const kbpC_PipeProfile& p) {
    return {Polygon(p.r, 32), Polygon(p.r - p.t, 32)};
}

// The radius is that of the corners; the walls have their thickness across the flats.
vpg_Outline Hexagon(const kbpC_HexagonalProfile& p) {
    return {Polygon(p.r, 6), Polygon(p.r - p.t / std::cos(std::numbers::pi / 6.0), 6)};
}

vpg_Outline Box(const kbpC_BoxProfile& p) {
    const double a = p.a / 2.0;
    const double b = p.b / 2.0;
    const bool uniform = p.uniformThickness;
    // Right, top, left, bottom.
    const double t[] = {p.t1, uniform ? p.t1 : p.t2, uniform ? p.t1 : p.t3, uniform ? p.t1 : p.t4};
    return {Rectangle(-a, a, -b, b), Rectangle(-a + t[2], a - t[0], -b + t[3], b - t[1])};
}

vpg_Outline SolidRectangle(const kbpC_RectangularProfile& p) {
    return {Rectangle(-p.a / 2.0, p.a / 2.0, -p.b / 2.0, p.b / 2.0)};
}

/// A web between a bottom flange and a top one, the node at the height `l`.
vpg_Outline WebAndFlanges(double l, double h, const std::array<double, 2>& widths,
                          const std::array<double, 2>& thicknesses, double web) {
    const double bottom = -l;
    const double top = h - l;
    const double w = web / 2.0;
    const double b = std::max(widths[0] / 2.0, w);
    const double t = std::max(widths[1] / 2.0, w);
    return {Closed({{-b, bottom},
                    {b, bottom},
                    {b, bottom + thicknesses[0]},
                    {w, bottom + thicknesses[0]},
                    {w, top - thicknesses[1]},
                    {t, top - thicknesses[1]},
                    {t, top},
                    {-t, top},
                    {-t, top - thicknesses[1]},
                    {-w, top - thicknesses[1]},
                    {-w, bottom + thicknesses[0]},
                    {-b, bottom + thicknesses[0]}})};
}

vpg_Outline Ibeam(const kbpC_IbeamProfile& p) {
    return WebAndFlanges(p.l, p.h, {p.b1, p.b2}, {p.t1, p.t2}, p.t3);
}

vpg_Outline Tbeam(const kbpC_TbeamProfile& p) {
    return WebAndFlanges(p.l, p.h, {0.0, p.b}, {0.0, p.tf}, p.tw);
}

vpg_Outline Lbeam(const kbpC_LbeamProfile& p) {
    const double left = -p.t2 / 2.0;
    const double bottom = -p.t1 / 2.0;
    return {Closed({{left, bottom},
                    {left + p.a, bottom},
                    {left + p.a, bottom + p.t1},
                    {left + p.t2, bottom + p.t1},
                    {left + p.t2, bottom + p.b},
                    {left, bottom + p.b}})};
}

vpg_Outline Trapezoid(const kbpC_TrapezoidalProfile& p) {
    return {Closed({{-p.a / 2.0, -p.d}, {p.a / 2.0, -p.d}, {p.c / 2.0, p.b - p.d}, {-p.c / 2.0, p.b - p.d}})};
}

vpg_Outline Arbitrary(const kbpC_ArbitraryProfile& p) {
    Line line;
    for (int i = 0; i < p.table.NumRows(); ++i)
        line.push_back({p.table.ConstGet(i, 0), p.table.ConstGet(i, 1)});
    return {line};
}

template <class T>
vpg_Outline Of(const kbpC_BeamProfile& profile, vpg_Outline (*outline)(const T&)) {
    const T* typed = nex_canDynamicCastPtr<T>(&profile);
    return typed == nullptr ? vpg_Outline() : outline(*typed);
}

} // namespace

vpg_Outline vpg_OutlineOf(const kbpC_BeamProfile& profile) {
    for (const vpg_Outline& outline :
         {Of(profile, Circle), Of(profile, Pipe), Of(profile, Hexagon), Of(profile, Box),
          Of(profile, SolidRectangle), Of(profile, Ibeam), Of(profile, Tbeam), Of(profile, Lbeam),
          Of(profile, Trapezoid), Of(profile, Arbitrary)}) {
        if (!outline.empty()) return outline;
    }
    return {};
}

vpg_Outline vpg_OutlineOfArea(double area) {
    return area > 0.0 ? vpg_Outline{Polygon(std::sqrt(area / std::numbers::pi), 24)} : vpg_Outline();
}

#ifndef QRX_VPG_PROFILES_H
#define QRX_VPG_PROFILES_H

#include <array>
#include <vector>

class kbpC_BeamProfile;

/// Lines of a cross-section, each through its points in order, in the section's axes 1 and 2 with the beam's
/// node at the origin. A line that closes has its first point again at its end.
using vpg_Outline = std::vector<std::vector<std::array<double, 2>>>;

/// The outline of a profile; empty for one that is known by its properties alone. Of profiles whose
/// description doesn't place the node, it stands at the crossing of the walls' middles.
vpg_Outline vpg_OutlineOf(const kbpC_BeamProfile& profile);
/// A circle of the area, for trusses.
vpg_Outline vpg_OutlineOfArea(double area);

#endif

#pragma once

// Conversions between basal area and mean diameter shared by every window and
// by the estate reader.

namespace arbolex::rotation {

/// π as the diameter conversions have always written it.
inline constexpr double kPi = 3.14159265358979;

/// Mean DBH (cm) of a stand of basal area `basalArea` (m²/ha) and `stocking`
/// (stems/ha): 200 · √(BA / (N · π)). A stocking of 0 or less is first set to 1
/// and a negative basal area to 0; both guards write back into the arguments.
float dbhFromBasalArea(float &basalArea, float &stocking);

/// Basal area (m²/ha) of `stocking` stems/ha of mean DBH `dbh` cm: N · π · D² / 40000.
float basalAreaFromDbh(float stocking, float dbh);

/// A diameter as it is displayed: truncated, not rounded, to one decimal.
float truncateToTenth(float value);

} // namespace arbolex::rotation

#pragma once

namespace arbolex::engine {

/// One state of a stand, per hectare. Every stand quantity is single precision.
struct StandState {
    /// Age, years.
    float age = 0.0f;
    /// Basal area of the main crop, m²/ha.
    float basalArea = 0.0f;
    /// Stocking, stems/ha.
    float stocking = 0.0f;
    /// Top height, m.
    float topHeight = 0.0f;
    /// Standing volume to 7 cm top, m³/ha (from the volume function).
    float volume = 0.0f;
};

} // namespace arbolex::engine

#pragma once

namespace arbolex::thinning {

/// The thinning working state shared by the thinning window, its acceptance
/// and the loop: the stand before and after the previewed thinning.
struct ThinningWork {
    float preBasalArea = 0.0f; ///< m²/ha
    float preStocking = 0.0f;  ///< stems/ha
    float preVolume = 0.0f;    ///< m³/ha
    float topHeight = 0.0f;    ///< m
    float postBasalArea = 0.0f;
    float postStocking = 0.0f;
    float postVolume = 0.0f;
    /// True once a preview has filled the post values.
    bool previewed = false;
};

/// Flags of a working session with thinnings.
struct ThinningFlags {
    /// Set for the whole run of the thinning loop.
    bool loopUnderWay = false;
    /// The window was loaded on a row that already carries a thinning.
    bool editingExisting = false;
};

} // namespace arbolex::thinning

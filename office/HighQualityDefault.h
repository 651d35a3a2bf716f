#pragma once

/// PowerPoint's user default for printing in high quality. There is no automation member for it:
/// PowerPoint reads the user's registry value when it prints.
class HighQualityDefault {
public:
    /// Keeps the user's value and writes the one wanted. Does nothing where PowerPoint 2007 has
    /// never entered its options.
    void Install(bool highQuality);

    /// Writes back what Install found; where it found no value, 0.
    void Restore();

private:
    long m_saved = 0;
};

#pragma once

class Settings;

/// Has settings that name one of PowerPoint's choices in any installed language name it in the one
/// in use, as filters show it. Texts that are no choice stay.
void TranslateChoices(Settings& settings);

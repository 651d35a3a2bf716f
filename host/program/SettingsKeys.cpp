#include "host/program/SettingsKeys.h"

const std::vector<SettingsKey>& KnownSettings() {
    static const std::vector<SettingsKey> s_settings = {
        {"PRINTER", "name", "the printer to print on, as `quillon status` lists it"},
        {"OUTPUTFILETYPEPS", "1 0", "1: PostScript files"},
        {"OUTPUTFILETYPEPDF", "1 0", "1: PDF files are chosen in the settings panel"},
        {"SELECTEDDISTILLERPROFILE", "file name", "the job options for PDF files"},
        {"PRINTOUTPUTTYPE", "text", "Slides, Handouts, Notes Pages or Outline View"},
        {"COLOR", "text", "Color, Grayscale or Pure Black and White"},
        {"SLIDESPERPAGE", "1 2 3 4 6 9", "slides on a page of handouts"},
        {"HANDOUTSHORIZONTAL", "1 0", "1: slides of a handout run across the page"},
        {"HANDOUTSVERTICAL", "1 0", "1: slides of a handout run down the page"},
        {"SCALETOFITPAGE", "1 0", "1: slides are scaled to fit the page"},
        {"FRAMESLIDES", "1 0", "1: slides have a frame"},
        {"PRINTHIDDENSLIDES", "1 0", "1: hidden slides are printed"},
        {"PRINTCOMMENTSANDINKMARKUP", "1 0", "1: comments and ink are printed"},
        {"HIGHQUALITY", "1 0", "1: slides are printed in high quality"},
    };
    return s_settings;
}

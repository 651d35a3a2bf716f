#pragma once

#include "host/program/page/JournalAccess.h"
#include "host/program/report/Texts.h"
#include "host/program/watch/WatchStatus.h"

/// What a page is made of.
struct PageContent {
    const WatchStatus& status;
    const JournalExtract& journal;
    const Texts& texts;
    const TextsOfLanguages& languages;
    bool languageIsChosen = false; ///< by a link on the page, and to be kept
    std::string token;             ///< of its forms
    std::string nonce;             ///< of its style and script
    JournalTime now = std::chrono::system_clock::now();
    std::chrono::steady_clock::time_point steadyNow = std::chrono::steady_clock::now();
};

/// The page for people.
std::string WritePage(const PageContent& content);

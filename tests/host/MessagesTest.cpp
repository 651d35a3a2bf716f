#include "host/program/workers/Messages.h"

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

namespace {

using nlohmann::json;

TEST(MessagesTest, NewsComeAcrossAsTheyWere) {
    News news{L"Printing \u2026", 85, Outcome()};
    news.outcome->End(State::Failed, {"no room", Blame::Outside, -1007, "Make some"}, "PDF");
    news.outcome->fonts = {{"Calibri", "Carlito", true}, {L"\u660e\u671d", "IPAMincho", false}};
    const std::optional<News> read = DecodeNews(Encode(news));
    ASSERT_TRUE(read && read->outcome);
    EXPECT_EQ(read->step, news.step);
    EXPECT_EQ(read->percent, 85);
    EXPECT_EQ(read->outcome->state, State::Failed);
    ASSERT_TRUE(read->outcome->fault);
    EXPECT_EQ(read->outcome->fault->Text(), "no room. Make some");
    EXPECT_EQ(read->outcome->fault->blame, Blame::Outside);
    EXPECT_EQ(read->outcome->fault->code, -1007);
    ASSERT_EQ(read->outcome->fonts.size(), 2U);
    EXPECT_TRUE(read->outcome->fonts[0].hasSameMetrics);
    EXPECT_EQ(read->outcome->fonts[1].asked, L"\u660e\u671d");
}

TEST(MessagesTest, WhatIsNoSuchMessageIsRefused) {
    News news{"Printing", 85, Outcome()};
    news.outcome->End(State::Failed, Fault(), {});
    const json whole = json::parse(Encode(news));
    for (const char* number : {"1.5", "1e99", "true", "\"1\"", "null", "[]", "2147483648",
                               "-2147483649", "18446744073709551615"})
        for (const char* field :
             {"/percent", "/outcome/state", "/outcome/fault/code", "/outcome/fault/blame"}) {
            json wrong = whole;
            wrong[json::json_pointer(field)] = json::parse(number);
            EXPECT_FALSE(DecodeNews(wrong.dump())) << wrong;
        }
    for (const auto& [field, beyond] :
         {std::pair("/outcome/state", 7), {"/outcome/fault/blame", 4}}) {
        json wrong = whole;
        wrong[json::json_pointer(field)] = beyond;
        EXPECT_FALSE(DecodeNews(wrong.dump())) << wrong;
    }
    for (const char* line : {"", "alive", "{", "5", "[]", "{}", "{\"step\": \"Printing\"}"})
        EXPECT_FALSE(DecodeNews(line)) << line;
}

} // namespace

#include "plugin/MSOfficePluginImpl.h"

#include <afxwin.h>

#include <gtest/gtest.h>

#include <stdexcept>

namespace {

void ThrowMfc() {
    AfxThrowMemoryException();
}
void ThrowStandard() {
    throw std::runtime_error("no");
}

/// Fails inside whatever asks it whether it can convert.
class FailingPlugin : public MSOfficePluginImpl {
public:
    explicit FailingPlugin(void (*fail)()) : m_fail(fail) {}
    bool CanConvert() override {
        m_fail();
        return true;
    }

    int Screen(const wxArrayString& files) {
        wxArrayString spare;
        wxArrayString refused;
        JobItemArray items;
        return ScreenFiles(files, spare, refused, items);
    }
    /// A run without files answers the last result.
    int LastResult() { return Screen({}); }

private:
    void (*m_fail)();
};

TEST(Boundary, MakesAnExceptionTheResultOfItsOperation) {
    JobItem item;
    item.fileName = "a.doc";
    item.paths.Add("/in/a.doc");
    for (const auto fail : {ThrowMfc, ThrowStandard}) {
        FailingPlugin plugin(fail);
        wxString outputName;
        EXPECT_EQ(Result::Failure, plugin.Convert(nullptr, item, "/out", outputName, nullptr));
        EXPECT_EQ(Result::Failure, plugin.LastResult());
        EXPECT_EQ(Result::Success, plugin.ApplySettings(nullptr));
        EXPECT_EQ(Result::Success, plugin.LastResult());
        EXPECT_EQ(Result::Failure, plugin.Screen(item.paths));
        EXPECT_EQ(Result::Failure, plugin.LastResult());
    }
}

} // namespace

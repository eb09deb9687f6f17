#include "test_objects.h"

#include <gtest/gtest.h>

namespace platform_test {
namespace {

// Starts every test with an empty slot on this thread, whatever an earlier test left.
class ErrorInfoTest : public ::testing::Test {
  protected:
    void SetUp() override { SetErrorInfo(0, nullptr); }
    void TearDown() override { SetErrorInfo(0, nullptr); }
};

TEST_F(ErrorInfoTest, EmptySlotGivesSFalseAndNull) {
    IErrorInfo* info = nullptr;
    EXPECT_EQ(GetErrorInfo(0, &info), S_FALSE);
    EXPECT_EQ(info, nullptr);
    EXPECT_EQ(GetErrorInfo(0, nullptr), E_POINTER);
}

TEST_F(ErrorInfoTest, GetHandsTheObjectOverAndEmptiesTheSlot) {
    ReportError(IID_ITestWidget, u"Pitch out of range. ", E_INVALIDARG);
    CComPtr<IErrorInfo> info;
    ASSERT_EQ(GetErrorInfo(0, &info), S_OK);
    ASSERT_TRUE(info);
    EXPECT_EQ(RefCountOf(info), 1u); // the slot kept no reference
    CComPtr<IErrorInfo> again;
    EXPECT_EQ(GetErrorInfo(0, &again), S_FALSE);
    EXPECT_FALSE(again);
}

TEST_F(ErrorInfoTest, FieldsReadBackAsWritten) {
    CComPtr<ICreateErrorInfo> create;
    ASSERT_EQ(CreateErrorInfo(&create), S_OK);
    ASSERT_EQ(create->SetGUID(IID_ITestWidget), S_OK);
    ASSERT_EQ(create->SetSource(u"Beamweaver.PatternLine"), S_OK);
    ASSERT_EQ(create->SetDescription(u"DwellTime out of range. "), S_OK);
    ASSERT_EQ(create->SetHelpFile(nullptr), S_OK);
    ASSERT_EQ(create->SetHelpContext(42), S_OK);
    ASSERT_EQ(SetErrorInfo(0, QueryAs<IErrorInfo>(create.Get())), S_OK);

    CComPtr<IErrorInfo> info;
    ASSERT_EQ(GetErrorInfo(0, &info), S_OK);
    GUID guid{};
    ASSERT_EQ(info->GetGUID(&guid), S_OK);
    EXPECT_EQ(guid, IID_ITestWidget);
    CComBSTR source, description, helpFile;
    ASSERT_EQ(info->GetSource(&source), S_OK);
    ASSERT_EQ(info->GetDescription(&description), S_OK);
    ASSERT_EQ(info->GetHelpFile(&helpFile), S_OK);
    EXPECT_EQ(source.View(), u"Beamweaver.PatternLine");
    EXPECT_EQ(description.View(), u"DwellTime out of range. ");
    EXPECT_TRUE(helpFile.View().empty());
    DWORD context = 0;
    ASSERT_EQ(info->GetHelpContext(&context), S_OK);
    EXPECT_EQ(context, 42u);
    EXPECT_EQ(info->GetDescription(nullptr), E_POINTER);
}

TEST_F(ErrorInfoTest, SetReplacesAndNullEmpties) {
    ReportError(IID_ITestWidget, u"first", E_FAIL);
    ReportError(IID_ITestWidget, u"second", E_FAIL);
    CComPtr<IErrorInfo> info;
    ASSERT_EQ(GetErrorInfo(0, &info), S_OK);
    CComBSTR description;
    info->GetDescription(&description);
    EXPECT_EQ(description.View(), u"second");

    ReportError(IID_ITestWidget, u"third", E_FAIL);
    ASSERT_EQ(SetErrorInfo(0, nullptr), S_OK);
    CComPtr<IErrorInfo> none;
    EXPECT_EQ(GetErrorInfo(0, &none), S_FALSE);
}

TEST_F(ErrorInfoTest, ErrorInformationDoesNotHoldTheModule) {
    const LONG start = ModuleLockCount();
    ReportError(IID_ITestWidget, u"kept in the slot", E_FAIL);
    EXPECT_EQ(ModuleLockCount(), start);
}

TEST(SupportErrorInfo, AnswersSOkForListedInterfacesOnly) {
    const auto widget = Norvane::CComObjectEx<CTestWidget>::CreateInstance<ISupportErrorInfo>();
    const struct {
        const char* label;
        IID iid;
        HRESULT expected;
    } cases[] = {
        {"listed", IID_ITestWidget, S_OK},
        {"base of the listed interface", IID_ITestShape, S_FALSE},
        {"answered but not listed", IID_ITestPlain, S_FALSE},
        {"not answered", IID_ITestUnlisted, S_FALSE},
        {"IUnknown", IUnknown::iid, S_FALSE},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.label);
        EXPECT_EQ(widget->InterfaceSupportsErrorInfo(c.iid), c.expected);
    }
}

} // namespace
} // namespace platform_test

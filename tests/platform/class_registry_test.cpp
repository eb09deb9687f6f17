#include "test_objects.h"

#include <gtest/gtest.h>

namespace platform_test {
namespace {

inline constexpr CLSID CLSID_Unregistered = MakeGuid("5A0C1E34-7B2D-4F11-9C3A-1B2C3D4E5F11");
inline constexpr CLSID CLSID_Temporary = MakeGuid("5A0C1E34-7B2D-4F11-9C3A-1B2C3D4E5F12");

class ClassRegistryTest : public ::testing::Test {
  protected:
    void SetUp() override { RegisterClasses({TestWidgetEntry()}); }
};

TEST_F(ClassRegistryTest, CreatesARegisteredClassThroughTheRequestedInterface) {
    const LONG start = ModuleLockCount();
    CComPtr<ITestShape> shape;
    ASSERT_EQ(CoCreateInstance(CLSID_TestWidget, nullptr, CLSCTX_ALL, IID_ITestShape,
                               reinterpret_cast<void**>(&shape)),
              S_OK);
    ASSERT_TRUE(shape);
    EXPECT_EQ(RefCountOf(shape), 1u);
    EXPECT_TRUE(QueryAs<ITestWidget>(shape.Get()));
    EXPECT_EQ(ModuleLockCount(), start + 1);
    shape.Release();
    EXPECT_EQ(ModuleLockCount(), start);
}

TEST_F(ClassRegistryTest, RefusesUnknownClassesUnansweredInterfacesAndNullOut) {
    void* out = &out;
    EXPECT_EQ(CoCreateInstance(CLSID_Unregistered, nullptr, CLSCTX_ALL, IUnknown::iid, &out),
              REGDB_E_CLASSNOTREG);
    EXPECT_EQ(out, nullptr);
    out = &out;
    EXPECT_EQ(CoCreateInstance(CLSID_TestWidget, nullptr, CLSCTX_ALL, IID_ITestUnlisted, &out),
              E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(CoCreateInstance(CLSID_TestWidget, nullptr, CLSCTX_ALL, IUnknown::iid, nullptr), E_POINTER);
}

TEST_F(ClassRegistryTest, AggregatedCreationAsksForIUnknownOnly) {
    const auto outer = Norvane::CComObjectEx<CTestWidget>::CreateInstance<IUnknown>();
    void* out = &out;
    EXPECT_EQ(CoCreateInstance(CLSID_TestWidget, outer, CLSCTX_ALL, IID_ITestWidget, &out),
              CLASS_E_NOAGGREGATION);
    EXPECT_EQ(out, nullptr);
}

TEST_F(ClassRegistryTest, ProgIdResolvesWithAndWithoutVersion) {
    const struct {
        const char16_t* progId;
        HRESULT expected;
    } cases[] = {
        {u"PlatformTest.TestWidget", S_OK},  {u"PlatformTest.TestWidget.1", S_OK},
        {u"platformtest.TESTWIDGET", S_OK},  {u"PlatformTest.TestWidget.2", CO_E_CLASSSTRING},
        {u"PlatformTest", CO_E_CLASSSTRING}, {u"", CO_E_CLASSSTRING},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(testing::PrintToString(std::u16string(c.progId)));
        CLSID clsid = GUID_NULL;
        EXPECT_EQ(CLSIDFromProgID(c.progId, &clsid), c.expected);
        EXPECT_EQ(clsid, c.expected == S_OK ? CLSID_TestWidget : GUID_NULL);
    }
    CLSID clsid{};
    EXPECT_EQ(CLSIDFromProgID(nullptr, &clsid), E_INVALIDARG);
    EXPECT_EQ(CLSIDFromProgID(u"PlatformTest.TestWidget", nullptr), E_INVALIDARG);
}

TEST_F(ClassRegistryTest, LookupGivesTheRegisteredEntry) {
    const ClassEntry* entry = FindClass(CLSID_TestWidget);
    ASSERT_NE(entry, nullptr);
    EXPECT_EQ(entry->name, "TestWidget");
    EXPECT_EQ(entry->progId, "PlatformTest.TestWidget");
    EXPECT_EQ(entry->threading, ThreadingModel::Free);
    EXPECT_EQ(FindClassByName("TestWidget"), entry);
    EXPECT_EQ(FindClass(CLSID_Unregistered), nullptr);
}

TEST_F(ClassRegistryTest, UnregisteredClassIsNoLongerCreatable) {
    ClassEntry temporary = TestWidgetEntry();
    temporary.clsid = CLSID_Temporary;
    temporary.name = "Temporary";
    temporary.progId = "PlatformTest.Temporary";
    RegisterClasses({temporary});
    CComPtr<IUnknown> object;
    ASSERT_EQ(CoCreateInstance(CLSID_Temporary, nullptr, CLSCTX_ALL, IUnknown::iid,
                               reinterpret_cast<void**>(&object)),
              S_OK);

    UnregisterClasses({temporary});
    void* out = &out;
    EXPECT_EQ(CoCreateInstance(CLSID_Temporary, nullptr, CLSCTX_ALL, IUnknown::iid, &out),
              REGDB_E_CLASSNOTREG);
    EXPECT_EQ(out, nullptr);
    CLSID clsid{};
    EXPECT_EQ(CLSIDFromProgID(u"PlatformTest.Temporary", &clsid), CO_E_CLASSSTRING);
    EXPECT_EQ(FindClass(CLSID_Temporary), nullptr);
    // Objects created before unregistration live on.
    EXPECT_EQ(RefCountOf(object), 1u);

    RegisterClasses({temporary});
    EXPECT_NE(FindClass(CLSID_Temporary), nullptr);
    UnregisterClasses({temporary});
}

TEST_F(ClassRegistryTest, FactoryCreatesInstancesAndLockServerHoldsTheModule) {
    const LONG start = ModuleLockCount();
    CComPtr<IClassFactory> factory;
    ASSERT_EQ(
        GetClassFactory(*FindClass(CLSID_TestWidget), IClassFactory::iid, reinterpret_cast<void**>(&factory)),
        S_OK);
    // A factory alone does not keep the module loaded, so a module can keep one per class.
    EXPECT_EQ(ModuleLockCount(), start);

    CComPtr<ITestWidget> widget;
    ASSERT_EQ(factory->CreateInstance(nullptr, IID_ITestWidget, reinterpret_cast<void**>(&widget)), S_OK);
    EXPECT_EQ(ModuleLockCount(), start + 1);
    widget.Release();
    EXPECT_EQ(ModuleLockCount(), start);

    ASSERT_EQ(factory->LockServer(1), S_OK);
    EXPECT_EQ(ModuleLockCount(), start + 1);
    ASSERT_EQ(factory->LockServer(1), S_OK);
    EXPECT_EQ(ModuleLockCount(), start + 2);
    ASSERT_EQ(factory->LockServer(0), S_OK);
    ASSERT_EQ(factory->LockServer(0), S_OK);
    EXPECT_EQ(ModuleLockCount(), start);

    const auto outer = Norvane::CComObjectEx<CTestWidget>::CreateInstance<IUnknown>();
    void* out = &out;
    EXPECT_EQ(factory->CreateInstance(outer, IID_ITestWidget, &out), CLASS_E_NOAGGREGATION);
    EXPECT_EQ(out, nullptr);
}

TEST_F(ClassRegistryTest, FactoryAnswersItsOwnInterfacesOnly) {
    CComPtr<IUnknown> factory;
    ASSERT_EQ(GetClassFactory(TestWidgetEntry(), IUnknown::iid, reinterpret_cast<void**>(&factory)), S_OK);
    EXPECT_TRUE(QueryAs<IClassFactory>(factory.Get()));
    EXPECT_FALSE(QueryAs<ITestWidget>(factory.Get()));
    void* out = &out;
    EXPECT_EQ(GetClassFactory(TestWidgetEntry(), IID_ITestWidget, &out), E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
}

TEST_F(ClassRegistryTest, EntryWithoutCreatorHasNoFactory) {
    ClassEntry disabled = TestWidgetEntry();
    disabled.create = nullptr;
    void* out = &out;
    EXPECT_EQ(GetClassFactory(disabled, IClassFactory::iid, &out), CLASS_E_CLASSNOTAVAILABLE);
    EXPECT_EQ(out, nullptr);
}

TEST_F(ClassRegistryTest, DefaultClassOfAnInterfaceIsFoundByItsIdentifier) {
    RegisterDefaultClass(IID_ITestShape, CLSID_TestWidget);
    const ClassEntry* entry = FindDefaultClass(IID_ITestShape);
    ASSERT_NE(entry, nullptr);
    EXPECT_EQ(entry->clsid, CLSID_TestWidget);
    EXPECT_EQ(FindDefaultClass(IID_ITestUnlisted), nullptr);
}

} // namespace
} // namespace platform_test

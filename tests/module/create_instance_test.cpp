#include "module/create_instance.h"
#include "platform/object.h"

#include <gtest/gtest.h>

namespace Norvane {
namespace {

struct ITestValue : IUnknown {
    using BaseInterface = IUnknown;
    static constexpr IID iid = MakeGuid("5a6e0d3c-1f44-4b7e-9a0e-2c61d8f0b917");
    virtual int Value() = 0;

  protected:
    ~ITestValue() = default;
};

struct IOtherInterface : IUnknown {
    using BaseInterface = IUnknown;
    static constexpr IID iid = MakeGuid("0b1f6a52-7c3d-4e8a-8f21-93d4c5e6a708");

  protected:
    ~IOtherInterface() = default;
};

class CTestValue : public CComObjectRootBase, public ITestValue {
  public:
    using Interfaces = InterfaceMap<ITestValue>;
    int Value() override { return 42; }
};

HRESULT RefuseCreation(IUnknown*, REFIID, void**) {
    return CLASS_E_CLASSNOTAVAILABLE;
}

constexpr CLSID kTestClass = MakeGuid("d62b8ab1-6877-4f6d-b8cd-eecea2e937e1");
constexpr CLSID kRefusingClass = MakeGuid("3c9e5f10-2a7b-4d61-8e45-b0c1d2e3f405");
constexpr CLSID kUnregisteredClass = MakeGuid("a1b2c3d4-e5f6-4a7b-8c9d-0e1f2a3b4c5d");

class CreateInstanceTest : public ::testing::Test {
  protected:
    void SetUp() override { RegisterClasses(entries_); }
    void TearDown() override { UnregisterClasses(entries_); }

    static HResultException FailureOf(void (*create)()) {
        try {
            create();
        } catch (const HResultException& e) {
            return e;
        }
        ADD_FAILURE() << "creation did not throw";
        return HResultException(S_OK);
    }

  private:
    std::vector<ClassEntry> entries_{
        {kTestClass, "TestValue", "Test.TestValue", ThreadingModel::Free,
         &ComCreator<CTestValue>::CreateInstance<>},
        {kRefusingClass, "Refusing", "Test.Refusing", ThreadingModel::Free, &RefuseCreation}};
};

TEST_F(CreateInstanceTest, CreatesTheRegisteredClass) {
    const CComPtr<ITestValue> value = CreateInstance<ITestValue>(kTestClass);
    ASSERT_TRUE(value);
    EXPECT_EQ(value->Value(), 42);
}

TEST_F(CreateInstanceTest, UnregisteredClassNamesTheIdentifierInRegistryForm) {
    const HResultException e = FailureOf([] { CreateInstance<ITestValue>(kUnregisteredClass); });
    EXPECT_EQ(e.Error(), REGDB_E_CLASSNOTREG);
    EXPECT_EQ(e.Description(), u"CoCreateInstance({A1B2C3D4-E5F6-4A7B-8C9D-0E1F2A3B4C5D})");
    EXPECT_EQ(e.Source(), u"CoCreateInstance({A1B2C3D4-E5F6-4A7B-8C9D-0E1F2A3B4C5D})");
}

TEST_F(CreateInstanceTest, FailuresKeepTheCreationsCode) {
    EXPECT_EQ(FailureOf([] { CreateInstance<ITestValue>(kRefusingClass); }).Error(),
              CLASS_E_CLASSNOTAVAILABLE);
    EXPECT_EQ(FailureOf([] { CreateInstance<IOtherInterface>(kTestClass); }).Error(), E_NOINTERFACE);
}

} // namespace
} // namespace Norvane

// Small interfaces and classes that exercise the object machinery: a dual interface on a dual base, a
// plain interface, one interface no class answers, and a list with an enumerator.
#pragma once

#include "platform/class_factory.h"
#include "platform/dispatch_impl.h"
#include "platform/enum_variant.h"
#include "platform/error_info.h"
#include "platform/object.h"

#include <atomic>
#include <string>
#include <utility>
#include <vector>

namespace platform_test {

inline constexpr IID IID_ITestPlain = MakeGuid("5A0C1E34-7B2D-4F11-9C3A-1B2C3D4E5F01");
inline constexpr IID IID_ITestUnlisted = MakeGuid("5A0C1E34-7B2D-4F11-9C3A-1B2C3D4E5F02");
inline constexpr IID IID_ITestShape = MakeGuid("5A0C1E34-7B2D-4F11-9C3A-1B2C3D4E5F03");
inline constexpr IID IID_ITestWidget = MakeGuid("5A0C1E34-7B2D-4F11-9C3A-1B2C3D4E5F04");
inline constexpr IID IID_ITestList = MakeGuid("5A0C1E34-7B2D-4F11-9C3A-1B2C3D4E5F05");
inline constexpr CLSID CLSID_TestWidget = MakeGuid("5A0C1E34-7B2D-4F11-9C3A-1B2C3D4E5F10");

#define ITestPlain_MEMBERS(X) X(METHOD, Ping, (std::int32_t * value))
BW_INTERFACE(ITestPlain, IUnknown, ITestPlain_MEMBERS);

#define ITestUnlisted_MEMBERS(X) X(METHOD, Nothing, ())
BW_INTERFACE(ITestUnlisted, IUnknown, ITestUnlisted_MEMBERS);

#define ITestShape_MEMBERS(X)                                                                                \
    X(PROP, double, Width)                                                                                   \
    X(PROP, BSTR, Name)                                                                                      \
    X(GET, std::int32_t, Id)
BW_INTERFACE(ITestShape, IDispatch, ITestShape_MEMBERS);

#define ITestWidget_MEMBERS(X)                                                                               \
    X(PROP, std::int16_t, Small)                                                                             \
    X(PROP, std::int32_t, Count)                                                                             \
    X(PROP, ITestPlain*, Partner)                                                                            \
    X(METHOD, Scale, (double factor, std::int32_t times, double* result))                                    \
    X(METHOD, Fail, (BSTR description))
BW_INTERFACE(ITestWidget, ITestShape, ITestWidget_MEMBERS);

#define ITestList_MEMBERS(X)                                                                                 \
    X(GET, IUnknown*, _NewEnum)                                                                              \
    X(METHOD, Add, (BSTR text))
BW_INTERFACE(ITestList, IUnknown, ITestList_MEMBERS);

// Current reference count, observed through one AddRef/Release pair.
inline ULONG RefCountOf(IUnknown* object) {
    object->AddRef();
    return object->Release();
}

// Leaves error information on the thread, as a failing method does, and returns hr.
inline HRESULT ReportError(REFIID riid, std::u16string_view description, HRESULT hr) {
    CComPtr<ICreateErrorInfo> create;
    CreateErrorInfo(&create);
    create->SetGUID(riid);
    create->SetSource(u"PlatformTest");
    create->SetDescription(std::u16string(description).c_str());
    SetErrorInfo(0, QueryAs<IErrorInfo>(create.Get()));
    return hr;
}

// Counts the instances of a class alive and destroyed, to see that every object is destroyed once.
template <class Tag> struct InstanceCounter {
    InstanceCounter() { ++alive; }
    InstanceCounter(const InstanceCounter&) : InstanceCounter() {}
    ~InstanceCounter() {
        --alive;
        ++destroyed;
    }
    inline static std::atomic<int> alive{0};
    inline static std::atomic<int> destroyed{0};
};

class CTestWidget : public CComObjectRootBase,
                    public IDispatchImpl<ITestWidget>,
                    public ITestPlain,
                    public ISupportErrorInfoImplEx<ITestWidget>,
                    public InstanceCounter<CTestWidget> {
  public:
    using Interfaces = InterfaceMap<ITestWidget, ITestPlain, ISupportErrorInfo>;

    CTestWidget() = default;
    CTestWidget(std::int32_t id, std::u16string name) : id_(id), name_(std::move(name)) {}

    HRESULT get_Width(double* value) override { return Out(value, width_); }
    HRESULT put_Width(double value) override { return In(width_, value); }
    HRESULT get_Name(BSTR* value) override {
        if (value == nullptr)
            return E_POINTER;
        *value = CComBSTR(std::u16string_view(name_)).Detach();
        return S_OK;
    }
    HRESULT put_Name(BSTR value) override { return In(name_, std::u16string(BstrView(value))); }
    HRESULT get_Id(std::int32_t* value) override { return Out(value, id_); }
    HRESULT get_Small(std::int16_t* value) override { return Out(value, small_); }
    HRESULT put_Small(std::int16_t value) override { return In(small_, value); }
    HRESULT get_Count(std::int32_t* value) override { return Out(value, count_); }
    HRESULT put_Count(std::int32_t value) override { return In(count_, value); }
    HRESULT get_Partner(ITestPlain** value) override { return partner_.CopyTo(value); }
    HRESULT put_Partner(ITestPlain* value) override { return In(partner_, CComPtr<ITestPlain>(value)); }
    HRESULT Scale(double factor, std::int32_t times, double* result) override {
        return Out(result, factor * times);
    }
    HRESULT Fail(BSTR description) override {
        return ReportError(IID_ITestWidget, BstrView(description), E_INVALIDARG);
    }
    HRESULT Ping(std::int32_t* value) override { return Out(value, id_); }

  private:
    template <class T> static HRESULT Out(T* out, const T& value) {
        if (out == nullptr)
            return E_POINTER;
        *out = value;
        return S_OK;
    }
    template <class T> static HRESULT In(T& field, T value) {
        field = std::move(value);
        return S_OK;
    }

    std::int32_t id_ = 0;
    std::u16string name_;
    double width_ = 0.0;
    std::int16_t small_ = 0;
    std::int32_t count_ = 0;
    CComPtr<ITestPlain> partner_;
};

inline HRESULT CreateTestWidget(IUnknown* outer, REFIID riid, void** out) {
    return ComCreator<CTestWidget>::CreateInstance(outer, riid, out);
}

inline ClassEntry TestWidgetEntry() {
    return {CLSID_TestWidget, "TestWidget", "PlatformTest.TestWidget", ThreadingModel::Free,
            &CreateTestWidget};
}

// Each text becomes a new string value; an empty text cannot be handed out (E_INVALIDARG), which
// shows what a failing copy leaves behind.
struct TextToVariant {
    static HRESULT Copy(VARIANT* destination, const std::u16string& text) noexcept {
        if (text.empty())
            return E_INVALIDARG;
        destination->bstrVal = SysAllocStringLen(text.data(), static_cast<UINT>(text.size()));
        if (destination->bstrVal == nullptr)
            return E_OUTOFMEMORY;
        destination->vt = VT_BSTR;
        return S_OK;
    }
};

class CTestList : public CComObjectRootBase, public ITestList, public InstanceCounter<CTestList> {
  public:
    using Interfaces = InterfaceMap<ITestList>;

    explicit CTestList(std::vector<std::u16string> items) : items_(std::move(items)) {}

    HRESULT get__NewEnum(IUnknown** out) override {
        if (out == nullptr)
            return E_POINTER;
        *out = CreateEnumVariant<TextToVariant>(static_cast<ITestList*>(this), items_).Detach();
        return S_OK;
    }
    HRESULT Add(BSTR text) override {
        items_.emplace_back(BstrView(text));
        return S_OK;
    }

  private:
    std::vector<std::u16string> items_;
};

} // namespace platform_test

#include "platform/class_factory.h"

#include "platform/bstr.h"
#include "platform/module_lock.h"
#include "platform/object.h"

#include <algorithm>
#include <cctype>
#include <deque>
#include <mutex>
#include <shared_mutex>
#include <unordered_map>

namespace {

class Registry {
  public:
    static Registry& Instance() {
        static Registry registry;
        return registry;
    }

    void Add(const ClassEntry& entry) {
        std::unique_lock lock(mutex_);
        for (auto& existing : entries_) {
            if (existing.clsid == entry.clsid) {
                existing = entry;
                return;
            }
        }
        entries_.push_back(entry);
    }

    void Remove(REFCLSID clsid) {
        std::unique_lock lock(mutex_);
        // Entries stay in place so pointers handed out earlier remain valid; they are disabled instead.
        for (auto& existing : entries_)
            if (existing.clsid == clsid)
                existing.create = nullptr;
    }

    const ClassEntry* Find(REFCLSID clsid) const {
        std::shared_lock lock(mutex_);
        for (const auto& e : entries_)
            if (e.clsid == clsid && e.create)
                return &e;
        return nullptr;
    }

    const ClassEntry* FindByName(std::string_view name) const {
        std::shared_lock lock(mutex_);
        for (const auto& e : entries_)
            if (e.create && Matches(e, name))
                return &e;
        return nullptr;
    }

    void SetDefault(REFIID riid, REFCLSID clsid) {
        std::unique_lock lock(mutex_);
        defaults_[riid] = clsid;
    }

    const ClassEntry* FindDefault(REFIID riid) const {
        CLSID clsid;
        {
            std::shared_lock lock(mutex_);
            auto it = defaults_.find(riid);
            if (it == defaults_.end())
                return nullptr;
            clsid = it->second;
        }
        return Find(clsid);
    }

  private:
    static bool EqualsIgnoringCase(std::string_view a, std::string_view b) {
        return a.size() == b.size() && std::equal(a.begin(), a.end(), b.begin(), [](char x, char y) {
                   return std::tolower(static_cast<unsigned char>(x)) ==
                          std::tolower(static_cast<unsigned char>(y));
               });
    }
    static bool Matches(const ClassEntry& e, std::string_view name) {
        return EqualsIgnoringCase(e.name, name) || EqualsIgnoringCase(e.progId, name) ||
               EqualsIgnoringCase(e.progId + ".1", name);
    }

    mutable std::shared_mutex mutex_;
    std::deque<ClassEntry> entries_;
    std::unordered_map<IID, CLSID, GuidHash> defaults_;
};

class CClassFactory : public CComObjectRootBase, public IClassFactory {
  public:
    using Interfaces = InterfaceMap<IClassFactory>;

    explicit CClassFactory(CreatorFunction create) : create_(create) {}

    HRESULT CreateInstance(IUnknown* outer, REFIID riid, void** out) override {
        return create_(outer, riid, out);
    }
    HRESULT LockServer(int lock) override {
        if (lock)
            ModuleLockIncrement();
        else
            ModuleLockDecrement();
        return S_OK;
    }

  private:
    CreatorFunction create_;
};

} // namespace

void RegisterClasses(const std::vector<ClassEntry>& entries) {
    for (const auto& e : entries)
        Registry::Instance().Add(e);
}

void UnregisterClasses(const std::vector<ClassEntry>& entries) {
    for (const auto& e : entries)
        Registry::Instance().Remove(e.clsid);
}

const ClassEntry* FindClass(REFCLSID clsid) {
    return Registry::Instance().Find(clsid);
}

const ClassEntry* FindClassByName(std::string_view name) {
    return Registry::Instance().FindByName(name);
}

void RegisterDefaultClass(REFIID riid, REFCLSID clsid) {
    Registry::Instance().SetDefault(riid, clsid);
}

const ClassEntry* FindDefaultClass(REFIID riid) {
    return Registry::Instance().FindDefault(riid);
}

HRESULT CoCreateInstance(REFCLSID clsid, IUnknown* outer, DWORD, REFIID riid, void** out) {
    if (out == nullptr)
        return E_POINTER;
    *out = nullptr;
    const ClassEntry* entry = FindClass(clsid);
    if (entry == nullptr)
        return REGDB_E_CLASSNOTREG;
    return entry->create(outer, riid, out);
}

HRESULT CLSIDFromProgID(LPCOLESTR progId, CLSID* clsid) {
    if (progId == nullptr || clsid == nullptr)
        return E_INVALIDARG;
    const ClassEntry* entry = FindClassByName(Utf16ToUtf8(progId));
    if (entry == nullptr)
        return CO_E_CLASSSTRING;
    *clsid = entry->clsid;
    return S_OK;
}

// A factory does not hold the module: a module keeps one factory per class for its whole life, and
// only LockServer and the objects a factory creates keep the module loaded.
HRESULT GetClassFactory(const ClassEntry& entry, REFIID riid, void** out) {
    if (out == nullptr)
        return E_POINTER;
    *out = nullptr;
    if (entry.create == nullptr)
        return CLASS_E_CLASSNOTAVAILABLE;
    auto* factory = new (std::nothrow) CComObjectNoLock<CClassFactory>(entry.create);
    if (factory == nullptr)
        return E_OUTOFMEMORY;
    factory->AddRef();
    const HRESULT hr = factory->QueryInterface(riid, out);
    factory->Release();
    return hr;
}

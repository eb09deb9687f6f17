// Class factories and the in-process class registry behind CoCreateInstance.
#pragma once

#include "platform/com_ptr.h"

#include <string>
#include <string_view>
#include <vector>

struct IClassFactory : IUnknown {
    using BaseInterface = IUnknown;
    static constexpr IID iid = MakeGuid("00000001-0000-0000-C000-000000000046");

    virtual HRESULT CreateInstance(IUnknown* outer, REFIID riid, void** out) = 0;
    virtual HRESULT LockServer(int lock) = 0;

  protected:
    ~IClassFactory() = default;
};

// Creates one instance, stand-alone or aggregated; the component translates its own failures.
using CreatorFunction = HRESULT (*)(IUnknown* outer, REFIID riid, void** out);

enum class ThreadingModel { Free, Both };

// A creatable class as its component registers it.
struct ClassEntry {
    CLSID clsid;
    std::string name;   // coclass name, "PatternLine"
    std::string progId; // version-independent ProgID, "Beamweaver.PatternLine"
    ThreadingModel threading;
    CreatorFunction create;
};

// Adds or replaces classes in the process's registry (a component's registration).
void RegisterClasses(const std::vector<ClassEntry>& entries);
// Removes them again (unregistration).
void UnregisterClasses(const std::vector<ClassEntry>& entries);

// Looks a class up by identifier, ProgID ("Beamweaver.PatternLine" or "Beamweaver.PatternLine.1") or
// coclass name; null when nothing is registered under it.
const ClassEntry* FindClass(REFCLSID clsid);
const ClassEntry* FindClassByName(std::string_view nameOrProgId);

// The default class of a value interface: what a caller creates to pass a value of that interface
// (a coordinate, a rectangle). Registered by the component that owns the interface.
void RegisterDefaultClass(REFIID riid, REFCLSID clsid);
const ClassEntry* FindDefaultClass(REFIID riid);

HRESULT CoCreateInstance(REFCLSID clsid, IUnknown* outer, DWORD context, REFIID riid, void** out);
HRESULT CLSIDFromProgID(LPCOLESTR progId, CLSID* clsid);

// A class factory object for one registered class.
HRESULT GetClassFactory(const ClassEntry& entry, REFIID riid, void** out);

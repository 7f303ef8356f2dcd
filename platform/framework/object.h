#pragma once

#include "platform/framework/export.h"
#include "platform/framework/module.h"

#include <string_view>

class CObject;

// What is known of a class at run time: its name, its base, the module it belongs to and, where the class
// can be made by name, how. One constant for each class, which enters itself in the framework's register
// for as long as its library stays loaded.
class KOTA_API CRuntimeClass {
public:
    using Factory = CObject* (*)();

    // `create` is null for a class that cannot be made by name. `module` gives the class's module; it is
    // asked at need, so that classes and modules may be initialised in any order.
    CRuntimeClass(const char* name, const CRuntimeClass* base, const kota::Module& (*module)(),
                  Factory create);
    ~CRuntimeClass();
    CRuntimeClass(const CRuntimeClass&) = delete;
    CRuntimeClass& operator=(const CRuntimeClass&) = delete;

    const char* Name() const { return name_; }
    const CRuntimeClass* Base() const { return base_; }
    const kota::Module& Module() const { return module_(); }

    // A new object that the caller owns, or null when the class cannot be made by name.
    CObject* CreateObject() const;
    bool IsDerivedFrom(const CRuntimeClass* base) const;

    // The class of a name, or null. With a `module`, the class of that module alone; without one, the
    // first that was registered.
    static const CRuntimeClass* FromName(std::string_view name, const kota::Module* module = nullptr);
    // A new object of the class of that name, which the caller owns, or null.
    static CObject* CreateObject(std::string_view name, const kota::Module* module = nullptr);

private:
    const char* name_;
    const CRuntimeClass* base_;
    const kota::Module& (*module_)();
    Factory create_;
};

// The root of all that the framework holds by pointer.
class KOTA_API CObject {
public:
    static const CRuntimeClass classCObject;

    CObject() = default;
    virtual ~CObject();
    CObject(const CObject&) = delete;
    CObject& operator=(const CObject&) = delete;

    virtual const CRuntimeClass* GetRuntimeClass() const;
    // Whether the object is of that class or of one derived from it.
    bool IsKindOf(const CRuntimeClass* runtimeClass) const;
};

#define RUNTIME_CLASS(className) (&className::class##className)

// In a class: it has run-time information.
#define DECLARE_DYNAMIC(className)                                                                           \
public:                                                                                                      \
    static const CRuntimeClass class##className;                                                             \
    const CRuntimeClass* GetRuntimeClass() const override;

// In a class: it has run-time information and can be made by name.
#define DECLARE_DYNCREATE(className)                                                                         \
    DECLARE_DYNAMIC(className)                                                                               \
    static CObject* CreateObject();

// In one source file of the class. `module` is the function that gives the class's module.
#define IMPLEMENT_DYNAMIC(className, baseName, module)                                                       \
    const CRuntimeClass className::class##className(#className, RUNTIME_CLASS(baseName), module, nullptr);   \
    const CRuntimeClass* className::GetRuntimeClass() const {                                                \
        return RUNTIME_CLASS(className);                                                                     \
    }

#define IMPLEMENT_DYNCREATE(className, baseName, module)                                                     \
    const CRuntimeClass className::class##className(#className, RUNTIME_CLASS(baseName), module,             \
                                                    &className::CreateObject);                               \
    const CRuntimeClass* className::GetRuntimeClass() const {                                                \
        return RUNTIME_CLASS(className);                                                                     \
    }                                                                                                        \
    CObject* className::CreateObject() {                                                                     \
        return new className;                                                                                \
    }

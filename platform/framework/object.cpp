#include "platform/framework/object.h"

#include <algorithm>
#include <vector>

namespace {

std::vector<const CRuntimeClass*>& registeredClasses() {
    static std::vector<const CRuntimeClass*> classes;
    return classes;
}

} // namespace

CRuntimeClass::CRuntimeClass(const char* name, const CRuntimeClass* base, const kota::Module& (*module)(),
                             Factory create)
    : name_(name), base_(base), module_(module), create_(create) {
    registeredClasses().push_back(this);
}

CRuntimeClass::~CRuntimeClass() {
    std::erase(registeredClasses(), this);
}

CObject* CRuntimeClass::CreateObject() const {
    return create_ ? create_() : nullptr;
}

bool CRuntimeClass::IsDerivedFrom(const CRuntimeClass* base) const {
    const CRuntimeClass* candidate = this;
    while (candidate && candidate != base)
        candidate = candidate->base_;
    return candidate != nullptr;
}

const CRuntimeClass* CRuntimeClass::FromName(std::string_view name, const kota::Module* module) {
    const auto& classes = registeredClasses();
    const auto found = std::ranges::find_if(classes, [&](const CRuntimeClass* candidate) {
        return candidate->name_ == name && (!module || &candidate->Module() == module);
    });
    return found == classes.end() ? nullptr : *found;
}

CObject* CRuntimeClass::CreateObject(std::string_view name, const kota::Module* module) {
    const CRuntimeClass* found = FromName(name, module);
    return found ? found->CreateObject() : nullptr;
}

const CRuntimeClass CObject::classCObject("CObject", nullptr, kota::platformModule, nullptr);

CObject::~CObject() = default;

const CRuntimeClass* CObject::GetRuntimeClass() const {
    return RUNTIME_CLASS(CObject);
}

bool CObject::IsKindOf(const CRuntimeClass* runtimeClass) const {
    return runtimeClass && GetRuntimeClass()->IsDerivedFrom(runtimeClass);
}

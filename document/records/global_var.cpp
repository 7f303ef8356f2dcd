#include "document/records/global_var.h"

#include "platform/kvs/kvs.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <tuple>
#include <type_traits>
#include <utility>

namespace {

using Vars = AD_Global_Var;

enum class Presence { Always, MayBeMissing };

// A keyword of one parameter: its type and member, and the default of a new document.
struct Key {
    enum class Type { Int, Bool, Double } type;
    const char* name;
    int Vars::*intMember = nullptr; // of an int and a bool
    double Vars::*doubleMember = nullptr;
    int intDefault = 0;
    double doubleDefault = 0.0;
    Presence presence = Presence::Always;
};

constexpr Key intKey(const char* name, int Vars::*member, int byDefault) {
    return {.type = Key::Type::Int, .name = name, .intMember = member, .intDefault = byDefault};
}

constexpr Key boolKey(const char* name, int Vars::*member, Presence presence = Presence::Always) {
    return {.type = Key::Type::Bool, .name = name, .intMember = member, .presence = presence};
}

constexpr Key doubleKey(const char* name, double Vars::*member, double byDefault) {
    return {.type = Key::Type::Double, .name = name, .doubleMember = member, .doubleDefault = byDefault};
}

constexpr int withdrawnSelection = 7; // a LastSelected that reads as 0

constexpr const char* globalVariablesSection = "Global_Variables";

// Its keywords, in file order.
constexpr Key keys[] = {
    intKey("LastSelected", &Vars::LastSelected, 0),
    boolKey("G_Coli", &Vars::G_Coli),
    boolKey("G_Phos", &Vars::G_Phos),
    intKey("LastLevel1", &Vars::LastLevel1, 1),
    intKey("WQInter", &Vars::WQInter, 0),
    doubleKey("G_disp_factor", &Vars::G_disp_factor, 0.0),
    doubleKey("G_exponent", &Vars::G_exponent, 0.0),
    doubleKey("G_min_disp_coef", &Vars::G_min_disp_coef, 0.0),
    doubleKey("G_max_disp_coef", &Vars::G_max_disp_coef, 100.0),
    doubleKey("G_fact1", &Vars::G_fact1, 1.0),
    doubleKey("G_fact2", &Vars::G_fact2, 1.0),
    doubleKey("G_beta", &Vars::G_beta, 0.65),
    doubleKey("G_kin_visc", &Vars::G_kin_visc, 1.0),
    doubleKey("G_porosity", &Vars::G_porosity, 0.35),
    doubleKey("G_rel_dens", &Vars::G_rel_dens, 2.65),
    doubleKey("G_thetac", &Vars::G_thetac, 0.056),
    intKey("model_type", &Vars::model_type, 1),
    doubleKey("G_Ice_latitude", &Vars::G_Ice_latitude, 51.0),
    doubleKey("G_Ice_dens_water", &Vars::G_Ice_dens_water, 1000.0),
    doubleKey("G_Ice_spec_heat_water", &Vars::G_Ice_spec_heat_water, 4200.0),
    doubleKey("G_Ice_latent_heat_ice", &Vars::G_Ice_latent_heat_ice, 330000.0),
    doubleKey("G_Ice_heat_flux", &Vars::G_Ice_heat_flux, 12.5),
    doubleKey("G_Ice_dens_ice", &Vars::G_Ice_dens_ice, 917.0),
    intKey("G_Ice_const_cross_A", &Vars::G_Ice_const_cross_A, 0),
    intKey("G_Ice_const_activate", &Vars::G_Ice_const_activate, 0),
    doubleKey("G_Ice_air_temp", &Vars::G_Ice_air_temp, 10.0),
    doubleKey("G_Ice_cloudness", &Vars::G_Ice_cloudness, 0.0),
    intKey("G_Ice_cloud_dens", &Vars::G_Ice_cloud_dens, 0),
    doubleKey("G_Ice_wind_speed", &Vars::G_Ice_wind_speed, 0.0),
    doubleKey("G_Ice_visibility", &Vars::G_Ice_visibility, 25.0),
    doubleKey("G_Ice_precipitation", &Vars::G_Ice_precipitation, 0.0),
    doubleKey("G_Ice_thickness", &Vars::G_Ice_thickness, 0.0),
    doubleKey("G_Ice_width", &Vars::G_Ice_width, 0.0),
    intKey("G_Ice_quality", &Vars::G_Ice_quality, 0),
    boolKey("G_Add_ConvG", &Vars::G_Add_ConvG),
    boolKey("G_Add_ConvGA", &Vars::G_Add_ConvGA),
    boolKey("G_Add_DispersG", &Vars::G_Add_DispersG),
    boolKey("G_Add_DispersGA", &Vars::G_Add_DispersGA),
    boolKey("G_Add_MassBG", &Vars::G_Add_MassBG),
    boolKey("G_Add_MassBGA", &Vars::G_Add_MassBGA),
    boolKey("G_Add_MassBT", &Vars::G_Add_MassBT),
    boolKey("G_Add_MassBTA", &Vars::G_Add_MassBTA),
    boolKey("G_Add_MassG", &Vars::G_Add_MassG),
    boolKey("G_Add_MassGA", &Vars::G_Add_MassGA),
    boolKey("G_Add_MassT", &Vars::G_Add_MassT),
    boolKey("G_Add_MassTA", &Vars::G_Add_MassTA),
    boolKey("G_Add_MBranchT", &Vars::G_Add_MBranchT),
    boolKey("G_Add_MBranchTA", &Vars::G_Add_MBranchTA),
    boolKey("G_Add_OrderG", &Vars::G_Add_OrderG),
    boolKey("G_Add_OrderGA", &Vars::G_Add_OrderGA),
    boolKey("G_Add_OrderT", &Vars::G_Add_OrderT),
    boolKey("G_Add_OrderTA", &Vars::G_Add_OrderTA),
    boolKey("G_Add_TransG", &Vars::G_Add_TransG),
    boolKey("G_Add_TransGA", &Vars::G_Add_TransGA),
    boolKey("G_K32Comp", &Vars::G_K32Comp, Presence::MayBeMissing),
};
static_assert(std::size(keys) == 55);

// A keyword of a fixed number of parameters, one for each element of an array member.
template <class Element, std::size_t Count>
struct ArrayKey {
    const char* name;
    Element (Vars::*member)[Count];
    Element byDefault;
};

template <class Element, std::size_t Count>
constexpr ArrayKey<Element, Count> arrayKey(const char* name, Element (Vars::*member)[Count],
                                            Element byDefault) {
    return {name, member, byDefault};
}

// The keywords of its two subsections, in file order. Files older than the two-layer model lack both.
constexpr const char* additionalSection = "KOTA32_Additional";
constexpr auto additionalKeys = std::tuple(arrayKey("Mass", &Vars::Mass, 0),                         //
                                           arrayKey("Mass_balance", &Vars::Mass_balance, 0),         //
                                           arrayKey("Mass_branch", &Vars::Mass_branch, 0),           //
                                           arrayKey("Decay_branch", &Vars::Decay_branch, 0),         //
                                           arrayKey("Entrain_branch", &Vars::Entrain_branch, 0),     //
                                           arrayKey("Transport_total", &Vars::Transport_total, 0),   //
                                           arrayKey("Dispersive_trans", &Vars::Dispersive_trans, 0), //
                                           arrayKey("Convective_trans", &Vars::Convective_trans, 0));

constexpr const char* dispersionSection = "KOTA32_Dispersion";
constexpr auto dispersionKeys = std::tuple(arrayKey("G_disp_factor", &Vars::K32_disp_factor, 0.0),     //
                                           arrayKey("G_exponent", &Vars::K32_exponent, 0.0),           //
                                           arrayKey("G_min_disp_coef", &Vars::K32_min_disp_coef, 0.0), //
                                           arrayKey("G_max_disp_coef", &Vars::K32_max_disp_coef, 100.0));

// One letter for each element: "iiii" or "dd".
template <class Element, std::size_t Count>
constexpr auto formatOf(const ArrayKey<Element, Count>&) {
    std::array<char, Count + 1> format{};
    std::fill_n(format.begin(), Count, std::is_same_v<Element, int> ? 'i' : 'd');
    return format;
}

template <class Keys>
void setDefaults(Vars& vars, const Keys& arrayKeys) {
    std::apply([&](auto... key) { (std::ranges::fill(vars.*key.member, key.byDefault), ...); }, arrayKeys);
}

template <class Keys>
void saveSection(void* file, const char* section, Vars& vars, const Keys& arrayKeys) {
    const auto save = [&](const auto& key) {
        const auto put = [&](auto... value) {
            kvsPutListParam(file, key.name, formatOf(key).data(), value...);
        };
        std::apply(put, std::to_array(vars.*key.member));
    };
    kvsAddSection(file, section);
    std::apply([&](auto... key) { (save(key), ...); }, arrayKeys);
    kvsEndSection(file);
}

template <class Keys>
void loadSection(void* parent, const char* name, Vars& vars, const Keys& arrayKeys) {
    void* const section = kvsSectionByNameNum(parent, name, 1);
    if (!section)
        return;
    const auto load = [&]<class Element, std::size_t Count>(const ArrayKey<Element, Count>& key) {
        const auto get = [&]<std::size_t... I>(std::index_sequence<I...>) {
            kvsGetListParam(section, key.name, 1, formatOf(key).data(), &(vars.*key.member)[I]...);
        };
        get(std::make_index_sequence<Count>());
    };
    std::apply([&](auto... key) { (load(key), ...); }, arrayKeys);
}

} // namespace

AD_Global_Var::AD_Global_Var() {
    for (const Key& key : keys) {
        if (key.type == Key::Type::Double)
            this->*key.doubleMember = key.doubleDefault;
        else
            this->*key.intMember = key.intDefault;
    }
    setDefaults(*this, additionalKeys);
    setDefaults(*this, dispersionKeys);
}

AD_Global_Var::~AD_Global_Var() = default;

void AD_Global_Var::Save(void* file) {
    kvsAddSection(file, globalVariablesSection);
    for (const Key& key : keys) {
        kvsAddKeyword(file, key.name);
        switch (key.type) {
        case Key::Type::Int:
            kvsAddInt(file, this->*key.intMember);
            break;
        case Key::Type::Bool:
            kvsAddBool(file, this->*key.intMember != 0);
            break;
        case Key::Type::Double:
            kvsAddDouble(file, this->*key.doubleMember);
            break;
        }
    }
    saveSection(file, additionalSection, *this, additionalKeys);
    saveSection(file, dispersionSection, *this, dispersionKeys);
    kvsEndSection(file);
}

void AD_Global_Var::Load(void* target) {
    void* const section = kvsSectionByNameNum(target, globalVariablesSection, 1);
    if (!section)
        return;
    for (const Key& key : keys) {
        void* const keyword = kvsKeywordByNameNum(section, key.name, 1);
        if (!keyword && key.presence == Presence::MayBeMissing)
            continue;
        void* const parameter = kvsParamByNum(keyword, 1);
        switch (key.type) {
        case Key::Type::Int:
            this->*key.intMember = kvsGetInt(parameter);
            break;
        case Key::Type::Bool:
            this->*key.intMember = kvsGetBool(parameter) ? 1 : 0;
            break;
        case Key::Type::Double:
            this->*key.doubleMember = kvsGetDouble(parameter);
            break;
        }
    }
    if (LastSelected == withdrawnSelection)
        LastSelected = 0;
    loadSection(section, additionalSection, *this, additionalKeys);
    loadSection(section, dispersionSection, *this, dispersionKeys);
}

#include "platform/locale/locale_ids.h"

#include <algorithm>
#include <iterator>

namespace datetimelib::platform {
namespace {

struct LanguageRegion {
  std::uint32_t identifier;
  const char* name;  // "ll_RR"
};

// Sorted by identifier, so that lookups can bisect.
constexpr LanguageRegion kLanguageRegions[] = {
    {1025, "ar_SA"}, {1026, "bg_BG"}, {1027, "ca_ES"}, {1028, "zh_TW"},
    {1029, "cs_CZ"}, {1030, "da_DK"}, {1031, "de_DE"}, {1032, "el_GR"},
    {1033, "en_US"}, {1034, "es_ES"},  // 1034: Spanish with the traditional sort
    {1035, "fi_FI"}, {1036, "fr_FR"}, {1037, "he_IL"}, {1038, "hu_HU"},
    {1039, "is_IS"}, {1040, "it_IT"}, {1041, "ja_JP"}, {1042, "ko_KR"},
    {1043, "nl_NL"}, {1044, "nb_NO"}, {1045, "pl_PL"}, {1046, "pt_BR"},
    {1048, "ro_RO"}, {1049, "ru_RU"}, {1050, "hr_HR"}, {1051, "sk_SK"},
    {1053, "sv_SE"}, {1054, "th_TH"}, {1055, "tr_TR"}, {1058, "uk_UA"},
    {1060, "sl_SI"}, {1061, "et_EE"}, {1062, "lv_LV"}, {1063, "lt_LT"},
    {1081, "hi_IN"}, {2052, "zh_CN"}, {2055, "de_CH"}, {2057, "en_GB"},
    {2058, "es_MX"}, {2060, "fr_BE"}, {2064, "it_CH"}, {2067, "nl_BE"},
    {2070, "pt_PT"}, {3076, "zh_HK"}, {3079, "de_AT"}, {3081, "en_AU"},
    {3082, "es_ES"}, {3084, "fr_CA"}, {4105, "en_CA"}, {4108, "fr_CH"},
    {5129, "en_NZ"}, {6153, "en_IE"},
};

constexpr bool IsSortedAndUnique() {
  for (std::size_t i = 1; i < std::size(kLanguageRegions); ++i) {
    if (kLanguageRegions[i - 1].identifier >= kLanguageRegions[i].identifier) {
      return false;
    }
  }
  return true;
}
static_assert(IsSortedAndUnique());

}  // namespace

const char* LanguageRegionName(std::uint32_t identifier) {
  const auto* end = std::end(kLanguageRegions);
  const auto* found = std::lower_bound(std::begin(kLanguageRegions), end, identifier,
                                       [](const LanguageRegion& entry, std::uint32_t id) {
                                         return entry.identifier < id;
                                       });
  return found != end && found->identifier == identifier ? found->name : nullptr;
}

std::vector<std::string> LocaleNameCandidates(std::uint32_t identifier) {
  const char* name = LanguageRegionName(identifier);
  if (name == nullptr) return {};
  // glibc also finds a locale installed as "ll_RR.utf8" under ".UTF-8".
  return {std::string(name) + ".UTF-8", name};
}

}  // namespace datetimelib::platform

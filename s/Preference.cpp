#include "Preference.h"

#include <algorithm>
#include <map>

#include "AcdReader.h"
#include "HkStr.h"
#include "TessalException.h"
#include "s/UnitOrigin.h"

namespace {

constexpr UnitOrigin origin{"../s/Preference", "$Revision: 1.8 $"};

using Table = std::map<TessalPreference::PREFERENCE, TessalPrefOption>;

/// Made at the first use and never destroyed, so that it serves other units before and behind main.
Table& preferences() {
    static Table& table = *new Table;
    return table;
}

TessalPrefOption* find(TessalPreference::PREFERENCE preference) {
    const auto found = preferences().find(preference);
    return found != preferences().end() ? &found->second : nullptr;
}

const char* shown(const char* text) {
    return text != nullptr ? text : "";
}

/// Reads the cells of the key by counting rows and fields up to the first that is not there.
class PreferenceReader {
public:
    const char* cell(short row, short field) {
        return m_reader.getDevkey()->getstringbykey("PREFERENCE", ":", row, ",", field);
    }

    /// The fields behind the name, of which the first is the default. A row of a name alone gives an empty option.
    TessalPrefOption option(short row, const HkString& name) {
        TessalPrefOption result;
        for (short field = 1; const char* const value = cell(row, field); ++field) {
            result.add2AllValue(value);
        }
        if (const char* const value = cell(row, 1)) {
            result.addOption(name);
            result.setValue(value);
        }
        return result;
    }

private:
    AcdReader m_reader;
};

void load() {
    PreferenceReader reader;
    for (short row = 0; const char* const name = reader.cell(row, 0); ++row) {
        preferences()[static_cast<TessalPreference::PREFERENCE>(row)] = reader.option(row, name);
    }
}

}  // namespace

void TessalPrefOption::addOption(const char* name) {
    m_option = name;
}

void TessalPrefOption::add2AllValue(const char* value) {
    m_allValues.emplace_back(value);
}

bool TessalPrefOption::setValue(const char* value) {
    const bool legal = std::any_of(m_allValues.begin(), m_allValues.end(), [value](const HkString& candidate) {
        return HkStr::ICompare(candidate, value) == 0;
    });
    if (!legal) {
        origin.report().issueInfo("%s is not a legal preference value for %s.\n", shown(value), m_option.c_str());
        return false;
    }
    m_value = value;
    return true;
}

TessalPreference* TessalPreference::s_preferenceObject = nullptr;

TessalPreference::TessalPreference() {
    if (preferences().empty()) {
        load();
    }
}

TessalPreference* TessalPreference::getPreferenceObject() {
    if (s_preferenceObject == nullptr) {
        s_preferenceObject = new TessalPreference;
    }
    return s_preferenceObject;
}

void TessalPreference::removePreferenceObject() {
    delete s_preferenceObject;
    s_preferenceObject = nullptr;
}

const char* TessalPreference::getPreference(PREFERENCE preference) {
    const TessalPrefOption* const option = find(preference);
    return option != nullptr ? option->getValue() : "";
}

bool TessalPreference::isPreferenceTrue(PREFERENCE preference) {
    return HkStr::ICompare(getPreference(preference), "TRUE") == 0;
}

int TessalPreference::getPreferenceValue(PREFERENCE preference) {
    return HkStr::AToI(getPreference(preference));
}

bool TessalPreference::setPreference(PREFERENCE preference, const char* value) {
    TessalPrefOption* const option = find(preference);
    if (option == nullptr) {
        HkString row;
        row.Format("%d", static_cast<int>(preference));
        origin.report().issueInfo("Preference %s is not defined. Check data file tessal.acd.\n", row.c_str());
        return false;
    }
    HkString upper(value);
    upper.MakeUpper();
    return option->setValue(upper);
}

bool TessalPreference::setPreference(PREFERENCE preference, bool value) {
    return setPreference(preference, value ? "True" : "False");
}

bool TessalPreference::setPreference(PREFERENCE preference, int value) {
    HkString digits;
    digits.Format("%d", value);
    return setPreference(preference, digits.c_str());
}

const char* TessalPreference::pref2String(PREFERENCE preference) {
    const TessalPrefOption* const option = find(preference);
    if (option == nullptr) {
        origin.raise<DataNotFoundException>();
    }
    return option->getOption();
}

TessalPreference::PREFERENCE TessalPreference::string2Pref(const char* name) {
    for (const auto& [preference, option] : preferences()) {
        if (HkStr::ICompare(name, option.getOption()) == 0) {
            return preference;
        }
    }
    origin.report().issueInfo("%s is not in Preference Table.\n", shown(name));
    origin.raise<DataNotFoundException>();
}

void TessalPreference::dump() {
    origin.report().issueStatus("Preference Table\n");
    origin.report().issueStatus("%-20s %-20s\n", "Name", "Setting");
    for (const auto& [preference, option] : preferences()) {
        origin.report().issueStatus("%-20s %-20s\n", option.getOption(), option.getValue());
    }
}

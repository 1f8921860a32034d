#include "parameters.hpp"

#include "failure.hpp"
#include "text.hpp"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstring>

namespace tool
{

namespace
{

using catalog::Parameter;

std::string namesOf(const catalog::Export& entry)
{
    std::vector<std::string_view> names;
    for (int index = 0; index < entry.parameterCount; ++index) {
        if (!entry.traits.parameters[index].workspace) names.push_back(entry.traits.parameters[index].name);
    }
    return joined(names, ", ");
}

int countOf(const Parameter& parameter) { return std::max(parameter.count, 1); }

std::vector<double> readNumbers(std::string_view text)
{
    std::vector<double> numbers;
    for (const char* at = text.data(); at != nullptr;) {
        const char* const end = text.data() + text.size();
        double number = 0;
        const auto [rest, error] = std::from_chars(at, end, number);
        if (error != std::errc{} || !std::isfinite(number) || (rest != end && *rest != ',')) return {};
        numbers.push_back(number);
        at = rest == end ? nullptr : rest + 1;
    }
    return numbers;
}

template <class T> std::vector<u8> packed(const std::vector<double>& numbers)
{
    const std::vector<T> typed(numbers.begin(), numbers.end());
    std::vector<u8> bytes(typed.size() * sizeof(T));
    std::memcpy(bytes.data(), typed.data(), bytes.size());
    return bytes;
}

} // namespace

Parameters::Parameters(const catalog::Export& entry) : entry_(&entry)
{
    for (int index = 0; index < entry.parameterCount; ++index) {
        const Parameter& parameter = entry.traits.parameters[index];
        const auto first = parameter.standard.begin();
        assign(index, {first, first + countOf(parameter)});
    }
}

void Parameters::set(const std::string& assignment)
{
    const auto equals = assignment.find('=');
    if (equals == std::string::npos) fail("--set takes name=value, not '", assignment, "'");
    const std::string name = assignment.substr(0, equals), value = assignment.substr(equals + 1);
    const auto& all = entry_->traits.parameters;
    const auto end = all.begin() + entry_->parameterCount;
    const auto at = std::ranges::find(all.begin(), end, name, &Parameter::name);
    if (at == end || at->workspace) { // memory to work in is not the user's affair
        if (entry_->parameterCount == 0) fail(entry_->name, " has no parameters to set");
        fail(entry_->name, " has no parameter '", name, "'; it has ", namesOf(*entry_));
    }

    const auto numbers = readNumbers(value);
    if (static_cast<int>(numbers.size()) != countOf(*at)) {
        fail(name, " takes ", at->count == 0 ? "a number" : std::to_string(at->count) + " numbers with commas between",
             ", not '", value, "'");
    }
    const int index = static_cast<int>(at - all.begin());
    const bool whole = !entry_->parameterTypes[index].type.starts_with('f');
    for (double number : numbers) {
        if (number < at->low || number > at->high) fail(name, " takes ", at->low, " to ", at->high, ", not ", number);
        if (whole && number != std::floor(number)) fail(name, " takes whole numbers, not ", number);
    }
    assign(index, numbers);
}

void Parameters::assign(int index, const std::vector<double>& numbers)
{
    numbers_[index] = numbers;
    const catalog::ParameterType& type = entry_->parameterTypes[index];
    if (type.pointer) lists_[index] = type.type == "f64" ? packed<f64>(numbers) : packed<f32>(numbers);
}

catalog::PerParameter<catalog::Invocation::Value> Parameters::arguments() const
{
    catalog::PerParameter<catalog::Invocation::Value> values = {};
    for (int index = 0; index < entry_->parameterCount; ++index) {
        values[index].number = numbers_[index].front();
        if (entry_->parameterTypes[index].pointer) values[index].pointer = lists_[index].data();
    }
    return values;
}

} // namespace tool

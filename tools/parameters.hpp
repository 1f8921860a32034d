// The values of an export's parameters.
#pragma once

#include "catalog.hpp"

#include <string>
#include <vector>

namespace tool
{

class Parameters
{
public:
    /// The standard values of the catalogue.
    explicit Parameters(const catalog::Export& entry);

    /// Takes "name=value", or "name=value,value,..." for a list of numbers.
    void set(const std::string& assignment);

    /// For Invocation::parameters; valid as long as this object lives unchanged.
    std::array<catalog::Invocation::Value, 4> arguments() const;

private:
    void assign(int index, const std::vector<double>& numbers);

    const catalog::Export* entry_;
    std::array<std::vector<double>, 4> numbers_;
    std::array<std::vector<u8>, 4> lists_; // as the pointers' element type has them
};

} // namespace tool

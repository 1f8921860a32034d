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
    catalog::PerParameter<catalog::Invocation::Value> arguments() const;

private:
    void assign(int index, const std::vector<double>& numbers);

    const catalog::Export* entry_;
    catalog::PerParameter<std::vector<double>> numbers_;
    catalog::PerParameter<std::vector<u8>> lists_; // as the pointers' element type has them
};

} // namespace tool

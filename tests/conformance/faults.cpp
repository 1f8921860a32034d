#include "support/faults.hpp"
#include "conformance/suites.hpp"

namespace conformance
{

using namespace support;

namespace
{

Failure checkBoth(const Subject& subject, const Scene& scene, const Fault& first, const Fault& second)
{
    const std::string what = first.text + ", " + second.text + ": ";
    const Fault faults[] = {first, second};
    if (const auto text = checkRefusal(*subject.entry, subject.reference, scene, faults))
        return what + "the reference: " + *text;
    if (const auto text = checkRefusal(*subject.entry, subject.function, scene, faults)) return what + *text;
    return std::nullopt;
}

} // namespace

Failure checkFaults(const Subject& subject)
{
    const catalog::Export& entry = *subject.entry;
    const Scene scene(entry, {.seed = seedOf(entry.name, 0), .roi = legalSize(entry, {21, 4})});
    const std::vector<Fault> faults = faultsOf(entry);
    for (std::size_t i = 0; i < faults.size(); ++i) {
        for (std::size_t k = i; k < faults.size(); ++k) { // a fault with itself is a lone one
            if (auto text = checkBoth(subject, scene, faults[i], faults[k])) return *text + "\n  " + scene.text();
        }
    }
    return std::nullopt;
}

} // namespace conformance

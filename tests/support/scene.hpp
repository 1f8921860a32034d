// A call of an export with all that it needs: images, steps and parameters.
#pragma once

#include "support/image.hpp"
#include "support/samples.hpp"
#include "support/subject.hpp"

#include <cstdint>
#include <optional>
#include <string>

namespace support
{

/// How far the rows of a plane lie apart.
enum class Stride {
    tight,
    padded,
    aligned, ///< a multiple of 32
    odd,     ///< any number of bytes between rows, so that samples lie anywhere
    tightUp, ///< the first row is the highest in memory
    oddUp,
    zero, ///< all rows in one place
};

struct Recipe {
    std::uint64_t seed;
    RoiSize roi;
    Pattern pattern = Pattern::random;
    Placement placement = Placement::margins;
    Stride sourceStride = Stride::tight;
    Stride targetStride = Stride::tight;
    bool aligned = false;            ///< all planes begin at multiples of 64
    std::span<const u8> script = {}; ///< makes the choices, and the samples, as far as it goes
};

/// The strides that an export accepts.
std::vector<Stride> sourceStrides(const catalog::Export& entry);
std::vector<Stride> targetStrides(const catalog::Export& entry);

/// The smallest size that the export accepts, at which it stays within its images, and that is not below `roi`.
RoiSize legalSize(const catalog::Export& entry, RoiSize roi);

class Scene
{
public:
    Scene(const catalog::Export& entry, const Recipe& recipe);

    /// The call that writes to `target`, a copy of target().
    catalog::Invocation invocation(const Image& target) const;

    /// What the target holds before the call: an in-place export's source, or random bytes.
    const Image& target() const { return target_; }

    /// What differs in the source or in the parameters from what they were at first.
    std::optional<std::string> sourceDamage() const;

    /// All that sets this call apart.
    std::string text() const;

private:
    void makeImages(Random& random);
    void makeParameters(Random& random);
    void makeWorkspace(int parameter, Random& random);

    const catalog::Export& entry_;
    Recipe recipe_;
    Image source_, pristineSource_;
    Image target_;
    catalog::PerParameter<double> numbers_ = {};
    catalog::PerParameter<Image> lists_; ///< of parameters that are pointers: one plane, one row
    catalog::PerParameter<Image> pristineLists_;
};

/// Runs both functions of the subject on equal targets. Tells what differs between the statuses, the targets and what
/// the catalogue and the scene promise; nothing if all is well.
std::optional<std::string> firstDifference(const Subject& subject, const Scene& scene);

} // namespace support

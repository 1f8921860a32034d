#include "naming.hpp"

#include <stdexcept>
#include <utility>

namespace catalog::detail
{

namespace
{

/// Removes `prefix` from the front of `text`, if it is there.
bool consume(std::string_view& text, std::string_view prefix)
{
    if (!text.starts_with(prefix)) return false;
    text.remove_prefix(prefix.size());
    return true;
}

/// Splits at the last `separator`: leaves what is in front of it, and returns what is behind.
std::string_view cutLast(std::string_view& text, char separator)
{
    const auto at = text.rfind(separator);
    if (at == std::string_view::npos) throw std::invalid_argument("no '" + std::string(1, separator) + "' in a name");
    const auto behind = text.substr(at + 1);
    text = text.substr(0, at);
    return behind;
}

Element consumeDepth(std::string_view& text)
{
    static constexpr std::pair<std::string_view, Element> depths[] = {
        {"16u", Element::u16}, {"16s", Element::s16}, {"32s", Element::s32}, {"32f", Element::f32},
        {"64f", Element::f64}, {"8u", Element::u8},   {"8s", Element::s8},   {"1u", Element::bit},
    };
    for (const auto& [token, element] : depths) {
        if (consume(text, token)) return element;
    }
    throw std::invalid_argument("no depth in a name");
}

/// Reads one layout token and sets what it tells of `side`.
void consumeLayout(std::string_view& text, Side& side)
{
    struct Token {
        std::string_view text;
        Arrangement arrangement;
        int count;
        bool spareFourth;
    };
    static constexpr Token tokens[] = {
        {"AC4", Arrangement::interleaved, 4, true}, {"AP4", Arrangement::planar, 4, true},
        {"C1", Arrangement::interleaved, 1, false}, {"C2", Arrangement::interleaved, 2, false},
        {"C3", Arrangement::interleaved, 3, false}, {"C4", Arrangement::interleaved, 4, false},
        {"P2", Arrangement::semiPlanar, 2, false},  {"P3", Arrangement::planar, 3, false},
        {"P4", Arrangement::planar, 4, false},
    };
    for (const Token& token : tokens) {
        if (!consume(text, token.text)) continue;
        side.layout = token.text;
        side.arrangement = token.arrangement;
        side.samples = token.arrangement == Arrangement::interleaved ? token.count : 1;
        side.planes = token.arrangement == Arrangement::interleaved ? 1 : token.count;
        side.spareFourth = token.spareFourth;
        return;
    }
    throw std::invalid_argument("no layout in a name");
}

void setSubsampling(Side& side)
{
    const std::string_view model = side.model;
    if (!model.starts_with("Y") && !model.starts_with("CbY")) return;
    if (model.ends_with("1620")) {
        side.chromaX = side.chromaY = 2;
    } else if (model.ends_with("420")) {
        side.chromaX = side.chromaY = 1;
    } else if (model.ends_with("422")) {
        side.chromaX = 1;
    } else if (model.ends_with("411")) {
        side.chromaX = 2;
    }
}

/// A 555, 565 or 444 pixel is one 16-bit sample, whatever its layout token says.
void setPackedPixel(Side& side)
{
    const bool rgb = side.model.starts_with("RGB") || side.model.starts_with("BGR");
    if (!rgb || side.model.size() == 3 || side.element != Element::u16) return;
    side.samples = 1;
    side.stepUnit = 2;
}

/// "YCbCr420" for the target of "YCbCr411To420": a bare subsampling keeps the source's model.
std::string targetModel(std::string_view source, std::string_view target)
{
    const auto firstDigit = source.find_first_of("0123456789");
    const bool bare = target.find_first_not_of("0123456789") == std::string_view::npos;
    return std::string(bare ? source.substr(0, firstDigit) : "") + std::string(target);
}

} // namespace

Naming readName(std::string_view name)
{
    Naming naming;
    std::string_view rest = name;
    if (!consume(rest, "pyxi")) throw std::invalid_argument("a name without its prefix: " + std::string(name));

    std::string_view layouts = cutLast(rest, '_');
    std::string_view depths = cutLast(rest, '_');

    naming.stepless = !layouts.ends_with('R');
    if (!naming.stepless) layouts.remove_suffix(1);
    naming.inPlace = consume(layouts, "I");
    consumeLayout(layouts, naming.source);
    naming.inPlace = consume(layouts, "I") || naming.inPlace;
    naming.target = naming.source;
    if (!layouts.empty()) consumeLayout(layouts, naming.target);

    if (naming.target.layout == "P4") naming.source.spareFourth = false; // it goes to the fourth plane

    naming.source.element = naming.target.element = consumeDepth(depths);
    if (!depths.empty()) naming.target.element = consumeDepth(depths);

    const auto underscore = rest.find('_');
    std::string_view models = rest.substr(0, underscore);
    if (underscore != std::string_view::npos) naming.variant = rest.substr(underscore + 1);

    // An operation that any three channels will do for has no model.
    for (std::string_view operation : {"ColorTwist", "Gamma", "ReduceBits", "ToneMap"}) {
        if (models.starts_with(operation)) {
            naming.variant = models;
            return naming;
        }
    }
    const auto to = models.find("To");
    if (to == std::string_view::npos) {
        naming.source.model = models;
        naming.target.model = consume(models, "Demosaic") ? "RGB" : naming.source.model;
        if (naming.source.model != naming.target.model) naming.source.model = "CFA";
    } else {
        naming.source.model = models.substr(0, to);
        std::string_view target = models.substr(to + 2);
        for (std::string_view glued : {"Dither", "Gamma"}) {
            if (!target.ends_with(glued)) continue;
            target.remove_suffix(glued.size());
            naming.variant = glued;
        }
        naming.target.model = targetModel(naming.source.model, target);
    }
    for (Side* side : {&naming.source, &naming.target}) {
        setSubsampling(*side);
        setPackedPixel(*side);
    }
    // Interleaved bytes are packed at any step.
    if (naming.source.model.size() == 3) naming.target.stepUnit = 1;
    return naming;
}

} // namespace catalog::detail

catalog::Side catalog::sideOf(std::string_view model, std::string_view layout, Element element)
{
    Side side;
    side.model = model;
    side.element = element;
    detail::consumeLayout(layout, side);
    detail::setSubsampling(side);
    detail::setPackedPixel(side);
    return side;
}

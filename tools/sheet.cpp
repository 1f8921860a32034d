#include "sheet.hpp"

#include "describe.hpp"
#include "status.hpp"

#include <cstdio>
#include <sstream>

namespace tool
{

namespace
{

constexpr std::string_view style = R"(
:root {
  color-scheme: light dark;
  --page: #f6f6f4; --card: #ffffff; --well: #e9e9e6; --ink: #1b1c1e; --soft: #5b6067; --line: #dcdcd8; --link: #0b57a4;
  --good: #12693a; --warn: #8a5a00; --bad: #a81e1e;
}
@media (prefers-color-scheme: dark) {
  :root {
    --page: #16181b; --card: #1f2226; --well: #16181b; --ink: #e9eaec; --soft: #a3a9b1; --line: #34383e;
    --link: #8ab8f0; --good: #6fd39a; --warn: #e8b95a; --bad: #f28b82;
  }
}
* { box-sizing: border-box; }
html { scroll-behavior: smooth; -webkit-text-size-adjust: 100%; }
body { margin: 0; background: var(--page); color: var(--ink); font: 16px/1.5 system-ui, sans-serif; }
body > * { max-width: 1600px; margin-inline: auto; padding-inline: clamp(12px, 2.5vw, 32px); }
a { color: var(--link); }
h1 { margin: 0 0 4px; font-size: clamp(1.4rem, 4vw, 2rem); line-height: 1.2; }
h2 { margin: 0; font-size: 1.3rem; line-height: 1.3; }
h2 a { margin-left: 10px; font-size: 0.85rem; font-weight: 400; white-space: nowrap; }
h3 { margin: 0; font: 600 0.86rem/1.35 ui-monospace, monospace; overflow-wrap: anywhere; }
p { margin: 0; }
header { display: flex; flex-wrap: wrap; gap: 16px 28px; align-items: center; padding-block: 24px 16px; }
header img { width: min(100%, 300px); height: auto; border-radius: 8px; }
header p, .about { color: var(--soft); }
nav { padding-block: 8px 16px; border-bottom: 1px solid var(--line); }
nav input {
  width: min(100%, 26rem); margin-bottom: 10px; padding: 8px 10px; font: inherit; color: inherit;
  background: var(--card); border: 1px solid var(--line); border-radius: 8px;
}
[hidden] { display: none; }
nav ul { list-style: none; margin: 0; padding: 0; columns: 270px; column-gap: 28px; }
nav li { display: flex; justify-content: space-between; gap: 10px; padding: 4px 0; break-inside: avoid; }
nav li span { color: var(--soft); font-variant-numeric: tabular-nums; }
section { padding-block: 26px 6px; scroll-margin-top: 8px; }
.about { margin: 2px 0 14px; max-width: 75ch; }
.cards { display: grid; gap: 16px; grid-template-columns: repeat(auto-fill, minmax(min(100%, 290px), 1fr)); }
article {
  display: flex; flex-direction: column; background: var(--card); border: 1px solid var(--line); border-radius: 10px;
  overflow: hidden; content-visibility: auto; contain-intrinsic-size: auto 430px;
}
article img { display: block; width: 100%; height: auto; }
.figures { display: grid; gap: 12px; grid-template-columns: repeat(3, minmax(0, 360px)); margin-bottom: 20px; }
figure { margin: 0; }
figure img { display: block; width: 100%; height: auto; border-radius: 6px; image-rendering: pixelated; }
figcaption { padding-top: 4px; color: var(--soft); font-size: 0.85rem; }
.parts { padding: 10px 12px 4px; background: var(--well); }
.names { display: flex; color: var(--soft); font-size: 0.78rem; }
.names span { flex: 1; text-align: center; }
.text { display: flex; flex-direction: column; gap: 3px; padding: 10px 12px 12px; }
.text p { font-size: 0.88rem; }
.facts { display: flex; flex-wrap: wrap; gap: 0 14px; font-variant-numeric: tabular-nums; }
.way { color: var(--soft); overflow-wrap: anywhere; }
.text .way { font-size: 0.78rem; }
.good { color: var(--good); } .warn { color: var(--warn); } .bad { color: var(--bad); }
.none { display: grid; place-items: center; min-height: 90px; padding: 12px; color: var(--soft); font-size: 0.88rem; }
footer { padding-block: 24px 40px; color: var(--soft); font-size: 0.88rem; }
)";

/// Shows the cards with the text in their names or families, and the families that have any.
constexpr std::string_view script = R"(
const find = document.querySelector("nav input");
find.hidden = false;
find.addEventListener("input", () => {
  const wanted = find.value.trim().toLowerCase();
  for (const section of document.querySelectorAll("section")) {
    const cards = [...section.querySelectorAll("article")];
    for (const card of cards) card.hidden = !`${section.id} ${card.id}`.toLowerCase().includes(wanted);
    section.hidden = cards.every((card) => card.hidden);
  }
});
)";

constexpr std::string_view legend =
    "Each card shows the target brought back to RGB, then its components in gray. Times are the best of several calls; "
    "rates count the bytes read and written.";

std::string escaped(std::string_view text)
{
    std::string result;
    for (const char c : text) {
        switch (c) {
        case '&':
            result += "&amp;";
            break;
        case '<':
            result += "&lt;";
            break;
        case '>':
            result += "&gt;";
            break;
        case '"':
            result += "&quot;";
            break;
        default:
            result += c;
        }
    }
    return result;
}

std::string image(const Shown& shown, const std::string& description)
{
    std::ostringstream text;
    text << "<img src=\"" << escaped(shown.file) << "\" width=\"" << shown.size.width << "\" height=\""
         << shown.size.height << "\" loading=\"lazy\" decoding=\"async\" alt=\"" << escaped(description) << "\">";
    return text.str();
}

std::string arrowed(const std::string& conversion)
{
    const auto arrow = conversion.find("->");
    return arrow == std::string::npos ? conversion : conversion.substr(0, arrow) + "→" + conversion.substr(arrow + 2);
}

/// A name that may break behind its underscores.
std::string breakable(std::string_view name)
{
    std::string result;
    for (const char c : name) {
        result += c;
        if (c == '_') result += "<wbr>";
    }
    return result;
}

std::string_view toneOf(PyxStatus status) { return status < 0 ? "bad" : status > 0 ? "warn" : "good"; }

void writeCard(std::ostream& out, const Card& card)
{
    const std::string name(card.entry->name);
    out << "<article id=\"" << name << "\">\n";
    if (!card.picture.file.empty()) {
        out << image(card.picture, "The picture after " + name) << "\n";
    } else if (card.tiles.file.empty()) {
        out << "<div class=\"none\">" << escaped(card.note) << "</div>\n";
    }
    if (!card.tiles.file.empty()) {
        out << "<div class=\"parts\">" << image(card.tiles, "The components of the target") << "<div class=\"names\">";
        for (std::string_view component : card.components) out << "<span>" << escaped(component) << "</span>";
        out << "</div></div>\n";
    }
    out << "<div class=\"text\">\n<h3>" << breakable(name) << "</h3>\n<p>"
        << escaped(arrowed(conversionOf(*card.entry))) << "</p>\n";
    if (card.called) {
        out << "<p class=\"facts\"><span class=\"" << toneOf(card.status) << "\">" << statusText(card.status)
            << "</span>";
        if (card.status >= 0) {
            out << "<span>" << timeText(card.seconds) << "</span><span>" << rateText(card.bytes, card.seconds)
                << "</span>";
        }
        out << "</p>\n";
    }
    if (!card.madeBy.empty()) out << "<p class=\"way\">Source: " << escaped(card.madeBy) << "</p>\n";
    if (!card.shownBy.empty()) out << "<p class=\"way\">Shown: " << escaped(card.shownBy) << "</p>\n";
    out << "</div>\n</article>\n";
}

void writeHead(std::ostream& out, const Sheet& sheet)
{
    out << "<head>\n<meta charset=\"utf-8\">\n"
        << "<meta name=\"viewport\" content=\"width=device-width, initial-scale=1\">\n"
        << "<title>pyxcc: " << escaped(sheet.title) << "</title>\n<style>" << style << "</style>\n</head>\n";
}

std::string sizeText(RoiSize size) { return std::to_string(size.width) + " × " + std::to_string(size.height); }

void writeTitle(std::ostream& out, const Sheet& sheet)
{
    std::size_t count = 0;
    for (const Section& section : sheet.sections) count += section.cards.size();
    out << "<header>\n"
        << image(sheet.picture, "The source picture") << "\n<div>\n<h1>pyxcc tour</h1>\n<p>" << count
        << (count == 1 ? " conversion of " : " conversions of ") << escaped(sheet.title) << ", "
        << sizeText(sheet.given);
    if (sheet.size.width != sheet.given.width || sheet.size.height != sheet.given.height) {
        out << ", of which " << sizeText(sheet.size) << " in whole blocks";
    }
    out << "</p>\n<p>Library " << escaped(pyxccGetLibVersion()->versionText) << "</p>\n</div>\n</header>\n";
}

void writeIndex(std::ostream& out, const Sheet& sheet)
{
    out << "<nav aria-label=\"Families\" id=\"index\">\n"
        << "<input type=\"search\" placeholder=\"A part of a name, or a family\" aria-label=\"A part of a name, or a "
           "family\" hidden>\n<ul>\n";
    for (const Section& section : sheet.sections) {
        out << "<li><a href=\"#" << section.family->slug << "\">" << escaped(section.family->title) << "</a> <span>"
            << section.cards.size() << "</span></li>\n";
    }
    out << "</ul>\n</nav>\n";
}

void writeFigures(std::ostream& out, const Section& section)
{
    if (section.figures.empty()) return;
    out << "<p class=\"about\">" << escaped(section.aboutFigures) << "</p>\n<div class=\"figures\">\n";
    for (const Figure& figure : section.figures) {
        out << "<figure>" << image(figure.picture, figure.caption) << "<figcaption>" << escaped(figure.caption)
            << "</figcaption></figure>\n";
    }
    out << "</div>\n";
}

void writeSection(std::ostream& out, const Section& section)
{
    out << "<section id=\"" << section.family->slug << "\">\n<h2>" << escaped(section.family->title)
        << " <a href=\"#index\">Index</a></h2>\n<p class=\"about\">" << escaped(section.family->text) << "</p>\n";
    writeFigures(out, section);
    out << "<div class=\"cards\">\n";
    for (const Card& card : section.cards) writeCard(out, card);
    out << "</div>\n</section>\n";
}

std::string formatted(const char* format, double value)
{
    char text[64];
    std::snprintf(text, sizeof text, format, value);
    return text;
}

} // namespace

std::string timeText(double seconds)
{
    if (seconds < 1e-3) return formatted("%.1f µs", seconds * 1e6);
    return seconds < 1 ? formatted("%.2f ms", seconds * 1e3) : formatted("%.2f s", seconds);
}

std::string rateText(double bytes, double seconds)
{
    return formatted("%.2f GB/s", seconds > 0 ? bytes / seconds / 1e9 : 0);
}

std::string html(const Sheet& sheet)
{
    std::ostringstream out;
    out << "<!doctype html>\n<html lang=\"en\">\n";
    writeHead(out, sheet);
    out << "<body>\n";
    writeTitle(out, sheet);
    writeIndex(out, sheet);
    out << "<main>\n";
    for (const Section& section : sheet.sections) writeSection(out, section);
    out << "</main>\n<footer>" << legend << "</footer>\n<script>" << script << "</script>\n</body>\n</html>\n";
    return out.str();
}

} // namespace tool

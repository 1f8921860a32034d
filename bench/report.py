#!/usr/bin/env python3
"""Turns the JSON of pyxcc_bench into a Markdown table and an SVG chart."""

import argparse
import json
import math
import re
import statistics
import sys
from dataclasses import dataclass, field
from html import escape
from pathlib import Path


@dataclass
class Figure:
    """One export at one size: medians, where a run repeats itself."""

    rate: float
    memcpy: float
    share: float


@dataclass
class Report:
    context: dict
    sizes: list[str] = field(default_factory=list)  # smallest image first
    figures: dict[str, dict[str, Figure]] = field(default_factory=dict)  # export, then size
    failures: list[str] = field(default_factory=list)


def area(size: str) -> int:
    width, height = size.split("x")
    return int(width) * int(height)


def read(path: Path) -> Report:
    data = json.loads(path.read_text())
    report = Report(data["context"])
    runs: dict[tuple[str, str], list[dict]] = {}
    for run in data["benchmarks"]:
        if run["run_type"] != "iteration":
            continue
        name, size = re.match(r"(.+)/(\d+x\d+)", run["run_name"]).groups()
        if run.get("error_occurred"):
            report.failures.append(f"{name} at {size}: {run['error_message']}")
        else:
            runs.setdefault((name, size), []).append(run)
    for (name, size), same in runs.items():
        rate, memcpy, share = (statistics.median(run[key] for run in same) for key in ("GBps", "memcpyGBps", "share"))
        report.figures.setdefault(name, {})[size] = Figure(rate, memcpy, share)
    report.sizes = sorted({size for _, size in runs}, key=area)
    return report


def percent(share: float) -> str:
    return f"{100 * share:.0f} %"


def memcpy_rate(report: Report, size: str) -> float:
    return statistics.median(sizes[size].memcpy for sizes in report.figures.values() if size in sizes)


def machine(report: Report) -> str:
    context = report.context
    caches = [
        f"L{cache['level']} {cache['size'] >> 10} KiB" for cache in context["caches"] if cache["type"] != "Instruction"
    ]
    processor = context.get("processor", f"{context['mhz_per_cpu']} MHz")
    return ", ".join([processor, *caches, context["date"][:10]])


def markdown(report: Report) -> str:
    head = ["export"]
    for size in report.sizes:
        head += [f"{size}, GB/s", "share"]
    rows = [head, [":--"] + ["--:"] * (len(head) - 1)]
    for name, figures in report.figures.items():
        row = [f"`{name}`"]
        for size in report.sizes:
            figure = figures.get(size)
            row += [f"{figure.rate:.1f}", percent(figure.share)] if figure else ["", ""]
        rows.append(row)
    copies = ["`memcpy`, median"]
    for size in report.sizes:
        copies += [f"{memcpy_rate(report, size):.1f}", ""]
    rows.append(copies)
    table = "\n".join("| " + " | ".join(row) + " |" for row in rows)
    return f"{table}\n\n{machine(report)}\n"


STYLE = """
    text { font: 12px system-ui, -apple-system, "Segoe UI", "DejaVu Sans", sans-serif; fill: #1f2328; }
    .name { font-family: ui-monospace, Menlo, Consolas, "DejaVu Sans Mono", monospace; font-size: 11.5px; }
    .title { font-size: 16px; font-weight: 600; }
    .note, .axis, .value { fill: #59636e; font-size: 11px; }
    .paper { fill: #ffffff; }
    .grid { stroke: #d1d9e0; }
    .whole { stroke: #59636e; stroke-width: 1.5; }
    .floor { stroke: #c2410c; stroke-width: 2; }
    .size0 { fill: #93c0ea; }
    .size1 { fill: #4389cc; }
    .size2 { fill: #1c5690; }
    @media (prefers-color-scheme: dark) {
      text { fill: #f0f6fc; }
      .note, .axis, .value { fill: #9198a1; }
      .paper { fill: #0d1117; }
      .grid { stroke: #3d444d; }
      .whole { stroke: #9198a1; }
      .floor { stroke: #fb923c; }
      .size0 { fill: #d3e7fb; }
      .size1 { fill: #79b4ec; }
      .size2 { fill: #3a7fc8; }
    }
"""


class Chart:
    """Bars of the share of memcpy, a group for each export, a bar for each size."""

    width, right, top, bottom = 920, 60, 96, 16
    bar, gap, group_gap = 9, 2, 12

    def __init__(self, report: Report, floors: dict[str, float]):
        self.report = report
        self.floors = floors
        self.left = 30 + round(7.1 * max(map(len, report.figures), default=0))
        shares = [figure.share for sizes in report.figures.values() for figure in sizes.values()]
        self.full = max(1, math.ceil(max(shares, default=1) * 4) / 4)
        self.group = len(report.sizes) * (self.bar + self.gap) - self.gap + self.group_gap
        self.floor_y = self.top + len(report.figures) * self.group
        self.parts: list[str] = []

    def x(self, share: float) -> float:
        return round(self.left + (self.width - self.left - self.right) * share / self.full, 1)

    def text(self, kind: str, x: float, y: float, content: str, anchor: str = "start") -> None:
        self.parts.append(f'<text class="{kind}" x="{x}" y="{y}" text-anchor="{anchor}">{escape(content)}</text>')

    def line(self, kind: str, x: float, y1: float, y2: float) -> None:
        self.parts.append(f'<line class="{kind}" x1="{x}" x2="{x}" y1="{y1}" y2="{y2}"/>')

    def rect(self, kind: str, x: float, y: float, width: float, height: float) -> None:
        self.parts.append(f'<rect class="{kind}" x="{x}" y="{y}" width="{round(width, 1)}" height="{height}"/>')

    def legend(self) -> None:
        x = self.left
        for i, size in enumerate(self.report.sizes):
            self.rect(f"size{i}", x, 55, 12, self.bar)
            self.text("note", x + 17, 64, size)
            x += 105
        if self.floors:
            self.line("floor", x + 6, 54, 66)
            self.text("note", x + 17, 64, "floor")

    def axis(self) -> None:
        step = 0.25 if self.full <= 2 else 0.5
        for i in range(int(self.full / step) + 1):
            share = i * step
            self.line("whole" if share == 1 else "grid", self.x(share), self.top - 8, self.floor_y - self.group_gap / 2)
            self.text("axis", self.x(share), self.top - 14, percent(share), "middle")

    def bars(self, y: float, name: str, figures: dict[str, Figure]) -> None:
        middle = y + (self.group - self.group_gap) / 2
        self.text("name", self.left - 10, middle + 4, name, "end")
        for i, size in enumerate(self.report.sizes):
            figure = figures.get(size)
            if not figure:
                continue
            bar_y = y + i * (self.bar + self.gap)
            end = self.x(figure.share)
            self.rect(f"size{i}", self.left, bar_y, end - self.left, self.bar)
            if size in self.floors:
                mark = self.x(self.floors[size])
                self.line("floor", mark, bar_y - 1, bar_y + self.bar + 1)
                end = mark if end < mark < end + 40 else end  # the value stays clear of the mark
            self.text("value", end + 5, bar_y + self.bar - 0.5, percent(figure.share))

    def draw(self) -> str:
        height = self.floor_y + self.bottom
        self.rect("paper", 0, 0, self.width, height)
        self.text("title", 20, 28, "Share of memcpy: bytes read and written a second, one thread")
        self.text("note", 20, 46, machine(self.report))
        self.legend()
        self.axis()
        for i, (name, figures) in enumerate(self.report.figures.items()):
            self.bars(self.top + i * self.group, name, figures)
        body = "\n  ".join(self.parts)
        return (
            f'<svg xmlns="http://www.w3.org/2000/svg" viewBox="0 0 {self.width} {height}" role="img"'
            f' aria-label="Share of memcpy by export and image size">\n'
            f"  <style>{STYLE}  </style>\n  {body}\n</svg>\n"
        )


def floor(text: str) -> tuple[str, float]:
    size, share = text.split("=")
    return size, float(share)


def main() -> int:
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("json", type=Path, help="what pyxcc_bench wrote with --benchmark_out")
    parser.add_argument("--markdown", type=Path, metavar="FILE", help="write the table there instead of printing it")
    parser.add_argument("--svg", type=Path, metavar="FILE", help="write the chart there")
    parser.add_argument(
        "--floor", type=floor, action="append", default=[], metavar="SIZE=SHARE", help="mark it in the chart: 640x64=0.5"
    )
    arguments = parser.parse_args()
    report = read(arguments.json)
    if arguments.markdown:
        arguments.markdown.write_text(markdown(report))
    else:
        print(markdown(report), end="")
    if arguments.svg:
        arguments.svg.write_text(Chart(report, dict(arguments.floor)).draw())
    for failure in report.failures:
        print(f"failed: {failure}", file=sys.stderr)
    return 1 if report.failures or not report.figures else 0


if __name__ == "__main__":
    sys.exit(main())

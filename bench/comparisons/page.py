"""The page that shows the comparisons, docs/performance.md, and its pictures."""
import json
import os
import platform
import subprocess

from units import readable

HERE = os.path.dirname(os.path.abspath(__file__))
DOCS = os.path.join(HERE, "../../docs")


def machine():
    with open("/proc/cpuinfo") as file:
        model = next((line.split(":")[1].strip() for line in file if line.startswith("model name")), platform.machine())
    with open("/proc/meminfo") as file:
        memory = int(file.readline().split()[1]) >> 20
    return f"{os.cpu_count()} cores of {model}, {memory} GiB"


def table(comparison):
    rows = ["| program | median | least | most | peak MB |", "|---|---|---|---|---|"]
    for result in sorted(comparison.results, key=lambda result: result.median or float("inf")):
        name = f"**{result.name}**" if result.ours else f"*{result.name}*" if result.bound else result.name
        if result.median is None:
            rows.append(f"| {name} | {result.note or 'not measured'} | | | |")
            continue
        peak = f"{result.peak_kb / 1024:.0f}" if result.peak_kb else ""
        rows.append(f"| {name} | {readable(result.median)} | {readable(min(result.seconds))} | "
                    f"{readable(max(result.seconds))} | {peak} |")
    return "\n".join(rows)


def parts_table(rows):
    lines = ["| part | median | at most | cost at ten times as many, 1 is the same an item |", "|---|---|---|---|"]
    for row in rows:
        most = readable(row["most"]) if row["most"] else ""
        mark = " **not kept**" if row["most"] and row["seconds"] > row["most"] else ""
        growth = f"{row['growth']:.2f}" if row["growth"] else ""
        lines.append(f"| {row['what']} | {readable(row['seconds'])}{mark} | {most} | {growth} |")
    return "\n".join(lines)


def limits(comparison):
    rows = []
    for limit in comparison.limits:
        figure = "not measured" if limit.figure is None else f"{limit.figure:.2f}"
        rows.append(f"- {limit.what}: **{figure}**, at most {limit.most:g}: "
                    f"{'kept' if limit.kept else 'NOT kept'}")
    return "\n".join(rows + [f"- {line}" for line in comparison.extra])


def section(comparison, picture):
    return (f"### {comparison.title}\n\n{comparison.about}\n\n{table(comparison)}\n\n"
            f"![{comparison.title}]({picture})\n\n{limits(comparison)}\n")


def summary(comparisons):
    rows = ["| work | figure | ours | at most |", "|---|---|---|---|"]
    for comparison in comparisons:
        for limit in comparison.limits:
            figure = "not measured" if limit.figure is None else f"{limit.figure:.2f}"
            mark = "" if limit.kept else " **not kept**"
            rows.append(f"| {comparison.title} | {limit.what} | {figure}{mark} | {limit.most:g} |")
    return "\n".join(rows)


def draw(comparisons):
    """Makes the pictures. @return their names for the page"""
    pictures = []
    for comparison in comparisons:
        bars = sorted(((result.name, result.median, result.ours, result.bound) for result in comparison.results
                       if result.median is not None), key=lambda bar: bar[1])
        pictures.append({"path": os.path.join(DOCS, f"pictures/performance-{comparison.key}.svg"),
                         "title": comparison.title, "bars": bars})
    subprocess.run(["/usr/bin/python3", os.path.join(HERE, "charts.py")], input=json.dumps(pictures).encode(), check=True)
    return [f"pictures/{os.path.basename(picture['path'])}" for picture in pictures]


def write(comparisons, measured):
    """@param measured  the days on which the comparisons were made"""
    parts = "\n".join(parts_table(comparison.parts) for comparison in comparisons if comparison.parts)
    comparisons = [comparison for comparison in comparisons if not comparison.parts]
    pictures = draw(comparisons)
    sections = "\n".join(section(comparison, picture) for comparison, picture in zip(comparisons, pictures))
    with open(os.path.join(HERE, "performance.in.md"), encoding="utf-8") as file:
        text = file.read()
    for mark, content in (("@machine@", machine()), ("@measured@", measured), ("@summary@", summary(comparisons)),
                          ("@comparisons@", sections), ("@parts@", parts)):
        text = text.replace(mark, content)
    with open(os.path.join(DOCS, "performance.md"), "w", encoding="utf-8") as file:
        file.write(text)

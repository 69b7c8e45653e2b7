"""Pictures of comparisons. Run as a process of its own: the library that draws is large."""
import json
import sys

import matplotlib

matplotlib.use("svg")
from matplotlib import pyplot  # noqa: E402

from units import readable  # noqa: E402

OURS = "#1b6e8c"
OTHERS = "#b8bfc6"
BOUND = "#e4e7ea"


def draw(path, title, bars):
    """@param bars  name, seconds, ours, a bound: from the least to the most"""
    matplotlib.rcParams.update({"svg.hashsalt": "kareport", "font.family": "DejaVu Sans", "font.size": 10})
    figure, axes = pyplot.subplots(figsize=(7.2, 0.9 + 0.42 * len(bars)), layout="constrained")
    names = [bar[0] for bar in bars]
    values = [bar[1] for bar in bars]
    drawn = axes.barh(names, values, color=[OURS if bar[2] else BOUND if bar[3] else OTHERS for bar in bars], height=0.62)
    axes.bar_label(drawn, [readable(value) for value in values], padding=4)
    axes.invert_yaxis()
    axes.set_title(title, loc="left", fontsize=11)
    axes.margins(x=0.14)
    axes.xaxis.set_visible(False)
    for side in ("top", "right", "bottom"):
        axes.spines[side].set_visible(False)
    axes.tick_params(axis="y", length=0)
    figure.savefig(path, metadata={"Date": None})
    pyplot.close(figure)


if __name__ == "__main__":
    for picture in json.load(sys.stdin):
        draw(picture["path"], picture["title"], picture["bars"])

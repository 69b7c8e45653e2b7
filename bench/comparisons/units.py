"""Seconds as a person reads them."""
UNITS = [(60, "min", 1 / 60), (1, "s", 1), (0.001, "ms", 1000), (1e-6, "µs", 1e6), (0, "ns", 1e9)]


def readable(seconds):
    _, unit, factor = next(row for row in UNITS if seconds >= row[0])
    value = seconds * factor
    return f"{value:.0f} {unit}" if value >= 100 else f"{value:.3g} {unit}"

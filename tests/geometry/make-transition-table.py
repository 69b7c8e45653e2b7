#!/usr/bin/env python3
"""Writes TransitionTable.h: places on transition curves, integrated with forty digits.

    tests/geometry/make-transition-table.py > tests/geometry/TransitionTable.h     (needs python3-mpmath)

The integrals are of mpmath, and of the formulas as textbooks write them; nothing is shared with what they check.
"""
from mpmath import mp, mpf, cos, sin, pi, atan, sqrt, quad, findroot, ceil, nstr

mp.dps = 40

growth = {
    "Clothoid": lambda t: t,
    "Bloss": lambda t: 3 * t**2 - 2 * t**3,
    "Biquadratic": lambda t: 2 * t**2 if t <= mpf(1) / 2 else 1 - 2 * (1 - t)**2,
    "Cosine": lambda t: (1 - cos(pi * t)) / 2,
    "Sinusoid": lambda t: t - sin(2 * pi * t) / (2 * pi),
}
turn = {  # their integrals from 0
    "Clothoid": lambda t: t**2 / 2,
    "Bloss": lambda t: t**3 - t**4 / 2,
    "Biquadratic": lambda t: 2 * t**3 / 3 if t <= mpf(1) / 2 else mpf(1) / 12 + (t - mpf(1) / 2) - 2 * (mpf(1) / 24 - (1 - t)**3 / 3),
    "Cosine": lambda t: t / 2 - sin(pi * t) / (2 * pi),
    "Sinusoid": lambda t: t**2 / 2 + (cos(2 * pi * t) - 1) / (4 * pi**2),
}
# Of forms over the tangent: the first two derivatives and the ordinate, of abscissa x, end abscissa X and radius R.
over = {
    "CubicParabola": (lambda x, X, R: x**3 / (6 * R * X), lambda x, X, R: x**2 / (2 * R * X), lambda x, X, R: x / (R * X)),
    "SineHalfWave": (lambda x, X, R: X**2 / R * (x**2 / (4 * X**2) - (1 - cos(pi * x / X)) / (2 * pi**2)),
                     lambda x, X, R: x / (2 * R) - X * sin(pi * x / X) / (2 * pi * R),
                     lambda x, X, R: (1 - cos(pi * x / X)) / (2 * R)),
}
parts = [mpf(p) for p in ("0.1", "0.37", "0.5", "0.83", "1")]


def along(form, length, first, last):
    bearing = lambda s: first * s + (last - first) * length * turn[form](s / length)
    x = y = at = mpf(0)
    for part in parts:
        s = part * length
        count = int(ceil((s - at) * max(abs(first), abs(last)))) + 1
        borders = [at + (s - at) * i / count for i in range(count + 1)]
        for a, b in zip(borders, borders[1:]):
            mp.dps = 25
            x += quad(lambda u: cos(bearing(u)), [a, b], method="gauss-legendre")
            y += quad(lambda u: sin(bearing(u)), [a, b], method="gauss-legendre")
            mp.dps = 40
        at = s
        yield s, x, y, bearing(s), first + (last - first) * growth[form](part)


def over_tangent(form, length, radius):
    ordinate, slope, bend = over[form]
    arc = lambda x, X: quad(lambda u: sqrt(1 + slope(u, X, radius)**2), [0, x / 4, x / 2, 3 * x / 4, x])
    mp.dps = 25
    X = findroot(lambda X: arc(X, X) - length, length * mpf("0.99"))
    for part in parts:
        s = part * length
        x = findroot(lambda x: arc(x, X) - s, s)
        dy = slope(x, X, radius)
        yield s, x, ordinate(x, X, radius), atan(dy), bend(x, X, radius) / (1 + dy**2)**mpf("1.5")
    mp.dps = 40


def row(form, length, first, last, values):
    numbers = [length, first, last, *values]
    print(f'    {{TransitionForm::{form}, ' + ", ".join(nstr(n, 20, min_fixed=-4, max_fixed=12) for n in numbers) + "},")


print("#pragma once\n\n#include \"TransitionForm.h\"\n")
print("// Made by make-transition-table.py.\n// clang-format off\n")
print("namespace transitions\n{\n\nusing kareport::TransitionForm;\n")
print("struct TransitionRow\n{\n    TransitionForm form;")
print("    double length, startCurvature, endCurvature; ///< of the curve\n    double along;                                ///< the length of the place from the start")
print("    double northing, easting, turn, curvature;   ///< of the place, from a start at the origin towards north\n};\n")
print("inline constexpr TransitionRow transitionRows[] = {")
curves = [  # length, radius at the start, radius at the end; None is straight, negative to the left
    ("62.5", None, "250"), ("62.5", "-250", None), ("35.7142857142857142857", "-140", "-160"), ("80", "200", "-300"),
    ("400", None, "30"), ("100", "250", "250.001"), ("1e6", None, "1e7"),
]
print("    // ordinary curves, a tight one, one that is nearly an arc, one that is nearly a line")
for form in growth:
    for length, *radii in curves:
        first, last = [1 / mpf(r) if r else mpf(0) for r in radii]
        for values in along(form, mpf(length), first, last):
            row(form, mpf(length), first, last, values)
print("    // 1000 kilometres that wind round a hundred times and more")
for form, length, *radii in [("Clothoid", "1e6", None, "500"), ("Clothoid", "1e6", "-700", "-1500"), ("Clothoid", "1e6", "1000", "1000.01"),
                             ("Bloss", "1e6", None, "1500"), ("Biquadratic", "1e6", None, "-1500"), ("Cosine", "1e6", "1500", "-1500"),
                             ("Sinusoid", "1e6", "1500", None)]:
    first, last = [1 / mpf(r) if r else mpf(0) for r in radii]
    for values in along(form, mpf(length), first, last):
        row(form, mpf(length), first, last, values)
print("    // over the tangent")
for form in over:
    for length, radius in [("62.5", "250"), ("62.5", "-250"), ("120", "200"), ("1e6", "1e6"), ("200000", "3e6")]:
        for values in over_tangent(form, mpf(length), mpf(radius)):
            row(form, mpf(length), mpf(0), 1 / mpf(radius), values)
print("};\n\n} // namespace transitions\n// clang-format on")

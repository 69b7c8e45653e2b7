#!/usr/bin/env python3
"""Computes the survey data that the sample jobs show, and writes it into the folder data beside this file: as CSV, the
control points as a point file and a GeoPackage as well, and one road as LandXML.

Everything is worked out from a few design values, so the figures of a report agree with each other: the legs of the
traverse with its coordinates, the points set out with the alignment, cut and fill with the two elevations. Running it
again writes the same bytes. Only the standard library is needed.

    python3 examples/make-data.py
"""

import contextlib
import csv
import math
import random
import sqlite3
import struct
from pathlib import Path

DATA = Path(__file__).resolve().parent / "data"


def fixed(value, decimals):
    """A number in fixed notation, never with a minus before nothing but zeros."""
    text = f"{value:.{decimals}f}"
    return text[1:] if text.startswith("-") and not text.strip("-0.") else text


def grouped(station):
    """A station with its kilometres set apart: -60 is -0+060.000."""
    kilometres, metres = divmod(round(abs(station) * 1000.0), 1000000)
    return f"{'-' if station < 0 else ''}{kilometres}+{metres / 1000.0:07.3f}"


def write(name, header, rows, delimiter=","):
    with open(DATA / name, "w", encoding="utf-8", newline="") as file:
        writer = csv.writer(file, delimiter=delimiter, lineterminator="\n")
        writer.writerow(header)
        writer.writerows(rows)


def ground(north, east):
    """Elevation of the existing ground: rolling country between about 40 and 85 m."""
    return (62.0 + 9.0 * math.sin(north / 310.0 + 0.4) + 6.5 * math.cos(east / 405.0)
            + 2.2 * math.sin((north + 0.6 * east) / 96.0) + 0.35 * math.sin((north - east) / 17.0))


# ---------------------------------------------------------------------------------------------------- the alignment

class Element:
    """A line, a curve or a clothoid: the curvature runs evenly from k0 to k1 (1/m, positive to the right)."""

    def __init__(self, kind, station, north, east, bearing, length, k0, k1, parameter, first, last, section):
        self.kind, self.station, self.length = kind, station, length
        self.north, self.east, self.bearing = north, east, bearing
        self.k0, self.k1, self.parameter = k0, k1, parameter
        self.first, self.last, self.section = first, last, section

    def bearing_at(self, s):
        return self.bearing + self.k0 * s + (self.k1 - self.k0) * s * s / (2.0 * self.length)

    def at(self, s):
        """Northing, easting and bearing s metres from the start (Simpson's rule, exact to far below 0.1 mm)."""
        steps = 2 * max(16, math.ceil(s / 4.0))
        north = east = 0.0
        for i in range(steps + 1):
            weight = 1 if i in (0, steps) else 4 if i % 2 else 2
            bearing = self.bearing_at(s * i / steps)
            north += weight * math.cos(bearing)
            east += weight * math.sin(bearing)
        third = s / steps / 3.0
        return self.north + north * third, self.east + east * third, self.bearing_at(s)

    @property
    def turn(self):
        k = self.k0 + self.k1
        return "" if k == 0 else "R" if k > 0 else "L"


SECTIONS = ["Kestrel Quay", "Süderfeld", "Rue du Môle", "青葉橋", "Łąkowa", "Överby", "北浜トンネル", "Cañada Baja",
            "Mill Lane", "Großmoor", "白砂坂", "Šumava"]


class Alignment:
    start = -75.0

    def __init__(self):
        self.elements = []
        self.station = self.start
        self.position = (-4120.3186, -18436.9027)
        self.bearing = math.radians(38.2575)
        self.curve = 0

    def add(self, kind, length, k0, k1, last, parameter=None):
        north, east = self.position
        first = self.elements[-1].last if self.elements else "BOA"
        section = SECTIONS[len(self.elements) // 6 % len(SECTIONS)]
        element = Element(kind, self.station, north, east, self.bearing, length, k0, k1, parameter, first, last, section)
        self.elements.append(element)
        north, east, self.bearing = element.at(length)
        self.position = (north, east)
        self.station += length

    def line(self, length, last):
        self.add("Line", length, 0.0, 0.0, last)

    def arc(self, length, k, last):
        self.add("Curve", length, k, k, last)

    def clothoid(self, parameter, k0, k1, last):
        self.add("Clothoid", parameter * parameter * abs(k1 - k0), k0, k1, last, parameter)

    def at(self, station):
        for element in self.elements:
            if station <= element.station + element.length:
                return element.at(station - element.station)
        raise ValueError(station)

    def element_at(self, station):
        return next(e for e in self.elements if station <= e.station + e.length)


def make_alignment():
    """62 bends to the right and the left in turn; every seventh has two radii with a clothoid between them."""
    chance = random.Random(62)
    radii = [150.0, 180.0, 220.0, 250.0, 320.0, 400.0, 600.0]
    road = Alignment()
    for bend in range(1, 63):
        side = 1.0 if bend % 2 else -1.0
        radius = radii[int(chance.random() * len(radii))]
        target = math.radians(52.0 + side * (14.0 + 26.0 * chance.random()))
        deflection = abs(target - road.bearing)
        compound = bend % 7 == 0
        second = radius + 40.0 if compound else radius
        # A clothoid turns by half its length over the radius; both must leave the curve a good share of the bend.
        most = math.sqrt((0.5 if compound else 0.7) * deflection)
        entry = 5.0 * math.floor(radius * min(most, 0.60) / 5.0)
        leave = entry if bend % 5 else 5.0 * math.floor(radius * min(most, 0.55) / 5.0)
        egg = 5.0 * math.floor(radius * 1.3 / 5.0)
        k0, k1 = side / radius, side / second
        # Each bend begins with a line, except where two bends meet with their clothoids.
        if bend % 4:
            road.line(math.floor(40.0e3 + 140.0e3 * chance.random()) / 1000.0, f"TS{bend}")
        else:
            road.elements[-1].last = f"TS{bend}"
        road.clothoid(entry, 0.0, k0, f"SC{bend}")
        turn_left = deflection - entry ** 2 * k0 ** 2 / 2.0 - leave ** 2 * k1 ** 2 / 2.0
        if compound:
            turn_left -= egg ** 2 * abs(k1 - k0) * abs(k0 + k1) / 2.0
            road.arc(round(0.4 * turn_left * radius, 3), k0, f"CS{bend}a")
            road.clothoid(egg, k0, k1, f"SC{bend}a")
            road.arc(round(0.6 * turn_left * second, 3), k1, f"CS{bend}")
        else:
            road.arc(round(turn_left * radius, 3), k0, f"CS{bend}")
        road.clothoid(leave, k1, 0.0, f"ST{bend}")
    road.line(118.25, "EOA")
    return road


def radius_of(k):
    return "INF" if k == 0 else fixed(1.0 / abs(k), 4)


def write_alignment(road):
    rows = []
    for e in road.elements:
        rows.append([e.kind, e.turn, e.first, e.last, fixed(e.station, 4), fixed(e.length, 4), radius_of(e.k0),
                     radius_of(e.k1), "" if e.parameter is None else fixed(e.parameter, 4),
                     fixed(math.degrees(e.bearing) % 360.0, 8), fixed(e.north, 4), fixed(e.east, 4), e.section])
    write("alignment.csv",
          ["Element", "Turn", "From", "To", "Station", "Length", "RadiusStart", "RadiusEnd", "Parameter", "Bearing",
           "Northing", "Easting", "Section"], rows)
    kinds = [e.kind for e in road.elements]
    north, east = road.position
    write("alignment-totals.csv",
          ["Elements", "Lines", "Clothoids", "Curves", "Length", "FirstStation", "LastStation", "EndNorthing", "EndEasting"],
          [[len(kinds), kinds.count("Line"), kinds.count("Clothoid"), kinds.count("Curve"),
            fixed(road.station - road.start, 4), fixed(road.start, 4), fixed(road.station, 4), fixed(north, 4),
            fixed(east, 4)]])


# ------------------------------------------------------------------------------------------------------ the profile

class Profile:
    """Straight grades with a parabola at each inner point of intersection: (station, elevation, length)."""

    def __init__(self, points):
        self.points = points

    def grade(self, i):
        (s0, h0, _), (s1, h1, _) = self.points[i], self.points[i + 1]
        return (h1 - h0) / (s1 - s0)

    def elevation(self, station):
        for i in range(1, len(self.points) - 1):
            at, height, length = self.points[i]
            from_start = station - (at - length / 2.0)
            if 0.0 <= from_start <= length:
                g0, g1 = self.grade(i - 1), self.grade(i)
                return height - g0 * length / 2.0 + g0 * from_start + (g1 - g0) * from_start ** 2 / (2.0 * length)
        i = max(j for j in range(len(self.points) - 1) if j == 0 or self.points[j][0] <= station)
        return self.points[i][1] + self.grade(i) * (station - self.points[i][0])


def make_profile(road):
    points = []
    for station, length in ((-75.0, 0.0), (230.0, 120.0), (510.0, 80.0), (830.0, 140.0), (1160.0, 100.0), (1540.0, 0.0)):
        near = [ground(*road.at(max(station + 20.0 * i, road.start))[:2]) for i in range(-5, 6)]
        points.append((station, round(sum(near) / len(near), 2), length))
    return Profile(points)


# The cross-section falls to both sides of the centre line: 2.5 % on the carriageway, 4 % on the verge beyond it.
CARRIAGEWAY, VERGE = 3.5, 5.5
BAY_FROM, BAY_TO, BAY_WIDTH = 600.0, 680.0, 3.0


def right_edge(station):
    """A bus bay widens the right side, with tapers of 30 m."""
    share = min((station - (BAY_FROM - 30.0)) / 30.0, ((BAY_TO + 30.0) - station) / 30.0, 1.0)
    return VERGE + BAY_WIDTH * max(share, 0.0)


def fall(offset, edge):
    paved = CARRIAGEWAY + (edge - VERGE)
    return 0.025 * min(abs(offset), paved) + 0.04 * max(abs(offset) - paved, 0.0)


def stakeout_stations(road, last):
    """The start, every 20 m on lines and every 10 m in bends, and the main points."""
    stations = {road.start}
    for at in range(math.ceil(road.start / 10.0) * 10, int(last) + 1, 10):
        if at % 20 == 0 or road.element_at(at).kind != "Line":
            stations.add(float(at))
    stations.update(round(e.station, 4) for e in road.elements if road.start < e.station < last)
    return sorted(stations)


def write_stakeout(road, profile):
    stations = stakeout_stations(road, 1500.0)
    rows, cuts, staked = [], [], 0
    # The order of the work: up the left side, along the centre line, down the right side.
    for letter, order in (("L", stations), ("C", stations), ("R", stations[::-1])):
        for i, station in enumerate(order):
            edge = right_edge(station) if letter == "R" else VERGE
            offset = {"L": -VERGE, "C": 0.0, "R": round(edge, 3)}[letter]
            north, east, bearing = road.at(station)
            north += offset * math.cos(bearing + math.pi / 2.0)
            east += offset * math.sin(bearing + math.pi / 2.0)
            surface = round(ground(north, east), 3)
            design = round(profile.elevation(station) - fall(offset, edge), 3)
            done = letter != "R" or i < len(order) // 3
            staked += done
            cuts.append(design - surface)
            rows.append([f"{letter}{stations.index(station) + 1}", fixed(station, 4), fixed(offset, 3), fixed(north, 4),
                         fixed(east, 4), fixed(surface, 3), fixed(design, 3), fixed(design - surface, 3),
                         "yes" if done else "no"])
    write("stakeout.csv",
          ["Point", "Station", "Offset", "Northing", "Easting", "Ground", "Design", "CutFill", "Done"], rows)
    write("stakeout-totals.csv",
          ["Points", "Staked", "FirstStation", "LastStation", "DeepestCut", "HighestFill"],
          [[len(rows), staked, fixed(stations[0], 4), fixed(stations[-1], 4), fixed(-min(cuts), 3), fixed(max(cuts), 3)]])


# ------------------------------------------------------------------------------------------------------- the layers

# Name, code, thickness in hundredths of a metre, whether it is in every row or is that of the layer as a whole.
LAYERS = [("Surface course", "SC", 4, True), ("Binder course", "BC", 8, True), ("Base course", "BAS", 14, True),
          ("Subbase", "SB", 25, False), ("Capping layer", "CL", 30, False)]


def write_layers(road, profile):
    rows = []
    for at in range(-60, 1501, 20):
        top = profile.elevation(at)
        bay = (right_edge(at) - VERGE) / BAY_WIDTH
        for number, (name, code, hundredths, each) in enumerate(LAYERS, 1):
            # Buses stop here: the base grows by 6 cm along the tapers.
            thickness = hundredths + (round(6.0 * bay) if code == "BAS" else 0)
            bottom = top - thickness / 100.0
            note = "Bus bay" if code == "BAS" and bay > 0.0 else ""
            rows.append([grouped(at), number, name, code, thickness if each else -1, fixed(top, 3), fixed(bottom, 3), note])
            top = bottom
    write("layers.csv", ["Station", "Number", "Layer", "Code", "Thickness", "Top", "Bottom", "Note"], rows, ";")


# ----------------------------------------------------------------------------------------------------- the traverse

TENTHS = 36000  # tenths of a second in a degree


def sexagesimal(tenths, width):
    degrees, rest = divmod(tenths, TENTHS)
    minutes, rest = divmod(rest, 600)
    return f"{degrees:0{width}d}", f"{minutes:02d}", f"{rest // 10:02d}.{rest % 10}"


MARKS = ["Iron pipe", "Stone, cut cross", "Bolt in rock", "Grenzstein", "Borne à tête", "境界標", "Råsten", "Dębowy słup"]


def write_traverse():
    """The boundary of an estate, run against the clock, so that the angles turned at its marks are its inner angles."""
    chance = random.Random(240)
    count = 240
    points = []
    for i in range(count):
        around = 2.0 * math.pi * (i + 0.35 * (chance.random() - 0.5)) / count
        reach = 1650.0 + 260.0 * math.cos(2.0 * around + 0.3) + 95.0 * math.sin(5.0 * around) + 18.0 * chance.random()
        points.append((round(-3050.0 + reach * math.cos(-around), 4), round(-16480.0 + reach * math.sin(-around), 4)))
    heights = [ground(*point) for point in points]
    legs = []
    for i, (north, east) in enumerate(points):
        to_north, to_east = points[(i + 1) % count]
        d_north, d_east = to_north - north, to_east - east
        distance = round(math.hypot(d_north, d_east), 3)
        bearing = round(math.degrees(math.atan2(d_east, d_north)) % 360.0 * TENTHS) % (360 * TENTHS)
        slope = round(math.degrees(math.atan2(heights[(i + 1) % count] - heights[i], distance)) * TENTHS)
        legs.append((bearing, distance, slope))
    rows, angle_sum = [], 0
    miss_north = miss_east = perimeter = 0.0
    for i, (bearing, distance, slope) in enumerate(legs):
        angle = (bearing - legs[i - 1][0] - 180 * TENTHS) % (360 * TENTHS)
        angle_sum += angle
        radians = math.radians(bearing / TENTHS)
        miss_north += distance * math.cos(radians)
        miss_east += distance * math.sin(radians)
        perimeter += distance
        north, east = points[(i + 1) % count]
        degrees, minutes, seconds = sexagesimal(angle, 1)
        rows.append([f"B{i + 1}", f"B{(i + 1) % count + 1}", "-".join(sexagesimal(bearing, 3)), fixed(distance, 3),
                     f"{degrees}°{minutes}'{seconds}\"", ("-" if slope < 0 else "") + "-".join(sexagesimal(abs(slope), 1)),
                     fixed(north, 4), fixed(east, 4), MARKS[(i + 1) % count * 5 % len(MARKS)]])
    write("traverse.csv",
          ["From", "To", "Bearing", "Distance", "Angle", "Slope", "Northing", "Easting", "Mark"], rows)
    area = 0.5 * abs(sum(n * points[(i + 1) % count][1] - points[(i + 1) % count][0] * e for i, (n, e) in enumerate(points)))
    miss = math.hypot(miss_north, miss_east)
    write("traverse-closure.csv",
          ["Legs", "Perimeter", "AngleSum", "AngleDue", "MissNorth", "MissEast", "Miss", "Ratio", "Area"],
          [[count, fixed(perimeter, 3), "-".join(sexagesimal(angle_sum, 1)), f"{(count - 2) * 180}-00-00.0",
            fixed(miss_north, 4), fixed(miss_east, 4), fixed(miss, 4), round(perimeter / miss / 1000.0) * 1000,
            fixed(area, 2)]])


# ----------------------------------------------------------------------------------------------- the control points

PLACES = ["Kestrel Quay", "Süderfeld", "Château d'eau", "青葉橋", "Łąkowa", "Överby kyrka", "北浜", "Cañada Baja", "Mill Lane",
          "Großmoor", "白砂坂", "Šumava", "Ærøvej", "𠮷川", "Çamlık", "São Roque"]
KINDS = [("pillar", 1), ("brass bolt", 2), ("水準点", 2), ("nail in kerb", 3), ("tête de puits", 3), ("iron pipe", 4),
         ("Mauerbolzen", 4)]


def write_control(road):
    """Points on both sides of the whole road, in the order in which they were measured."""
    chance = random.Random(320)
    rows, numbers = [], {"GP": 0, "T": 0, "": 100}
    count = 320
    spacing = (road.station - road.start) / count
    for i in range(count):
        station = road.start + spacing * (i + chance.random())
        offset = (1.0 if chance.random() < 0.5 else -1.0) * (14.0 + 70.0 * chance.random())
        north, east, bearing = road.at(station)
        north += offset * math.cos(bearing + math.pi / 2.0)
        east += offset * math.sin(bearing + math.pi / 2.0)
        kind, order = KINDS[int(chance.random() * len(KINDS))]
        prefix = "GP" if order == 1 else "T" if order < 4 else ""
        numbers[prefix] += 1
        held = order == 1 or chance.random() < 0.06
        rows.append([f"{prefix}{numbers[prefix]}", fixed(north, 4), fixed(east, 4), fixed(ground(north, east), 4), order,
                     "yes" if held else "no", f"{PLACES[i * 7 // 3 % len(PLACES)]}, {kind}"])
    # Measured from the far end in three days, the days out of turn.
    third = count // 3
    measured = rows[2 * third:] + rows[:third] + rows[third:2 * third]
    write("control.csv", ["Number", "Northing", "Easting", "Elevation", "Order", "Held", "Description"], measured)
    write_points(measured)
    write_package(measured)


def write_points(rows):
    """The same points as an instrument gives them: number, northing, easting, elevation, description, without a header."""
    with open(DATA / "control.pts", "w", encoding="utf-8", newline="") as file:
        csv.writer(file, lineterminator="\n").writerows([*row[:4], row[6]] for row in rows)


def point_geometry(north, east, height):
    """A point with an elevation as a GeoPackage stores it: a header without an envelope, then well-known binary."""
    return b"GP\0\x01" + struct.pack("<i", -1) + struct.pack("<BIddd", 1, 1001, east, north, height)


def write_package(rows):
    """The same points as a layer of a GeoPackage, their coordinates in its geometries."""
    path = DATA / "control.gpkg"
    path.unlink(missing_ok=True)
    with contextlib.closing(sqlite3.connect(path, isolation_level=None)) as package:
        package.executescript("""
            PRAGMA application_id = 1196444487;
            PRAGMA user_version = 10300;
            BEGIN;
            CREATE TABLE gpkg_spatial_ref_sys (srs_name TEXT NOT NULL, srs_id INTEGER PRIMARY KEY,
                organization TEXT NOT NULL, organization_coordsys_id INTEGER NOT NULL, definition TEXT NOT NULL,
                description TEXT);
            INSERT INTO gpkg_spatial_ref_sys VALUES ('Undefined Cartesian', -1, 'NONE', -1, 'undefined', NULL);
            CREATE TABLE gpkg_contents (table_name TEXT NOT NULL PRIMARY KEY, data_type TEXT NOT NULL, identifier TEXT,
                description TEXT, last_change TEXT NOT NULL, min_x REAL, min_y REAL, max_x REAL, max_y REAL, srs_id INTEGER);
            INSERT INTO gpkg_contents VALUES ('control', 'features', 'control', '', '2024-03-05T14:07:00.000Z', NULL, NULL,
                NULL, NULL, -1);
            CREATE TABLE gpkg_geometry_columns (table_name TEXT NOT NULL PRIMARY KEY, column_name TEXT NOT NULL,
                geometry_type_name TEXT NOT NULL, srs_id INTEGER NOT NULL, z INTEGER NOT NULL, m INTEGER NOT NULL);
            INSERT INTO gpkg_geometry_columns VALUES ('control', 'geom', 'POINT', -1, 1, 0);
            CREATE TABLE control (fid INTEGER PRIMARY KEY AUTOINCREMENT, geom POINT, number TEXT, grade INTEGER,
                held BOOLEAN, description TEXT);
            """)
        package.executemany("INSERT INTO control (geom, number, grade, held, description) VALUES (?, ?, ?, ?, ?)",
                            [(point_geometry(float(north), float(east), float(height)), number, order, held == "yes", text)
                             for number, north, east, height, order, held, text in rows])
        package.execute("COMMIT")


# ------------------------------------------------------------------------------------- the road as a designer's file

def beside(road, station, offset):
    """Northing and easting of a point beside the road, offset to the right."""
    north, east, bearing = road.at(station)
    return north - offset * math.sin(bearing), east + offset * math.cos(bearing)


def pair(north, east):
    return f"{fixed(north, 4)} {fixed(east, 4)}"


def horizontal(elements):
    """The elements as they are stored: points in full digits, lengths and radii as designed."""
    lines = []
    for e in elements:
        end_north, end_east, end_bearing = e.at(e.length)
        start = f'<Start name="{e.first}">{pair(e.north, e.east)}</Start>'
        end = f'<End name="{e.last}">{pair(end_north, end_east)}</End>'
        turn = 'rot="cw"' if e.turn == "R" else 'rot="ccw"'
        measures = f'length="{fixed(e.length, 4)}"'
        if e.kind == "Line":
            lines.append(f'<Line {measures} dir="{fixed(math.degrees(e.bearing) % 360.0, 8)}">{start}{end}</Line>')
        elif e.kind == "Curve":
            north = e.north - math.sin(e.bearing) / e.k0
            east = e.east + math.cos(e.bearing) / e.k0
            lines.append(f'<Curve {turn} crvType="arc" {measures} radius="{radius_of(e.k0)}">{start}'
                         f"<Center>{pair(north, east)}</Center>{end}</Curve>")
        else:
            # The tangents of both ends meet where the way along the first one has the same offset from the second.
            sine = math.sin(end_bearing - e.bearing)
            along = ((end_east - e.east) * -math.cos(end_bearing) + (end_north - e.north) * math.sin(end_bearing)) / sine
            north, east = e.north + along * math.cos(e.bearing), e.east + along * math.sin(e.bearing)
            lines.append(f'<Spiral {turn} spiType="clothoid" {measures} radiusStart="{radius_of(e.k0)}" '
                         f'radiusEnd="{radius_of(e.k1)}">{start}<PI>{pair(north, east)}</PI>{end}</Spiral>')
    return lines


def vertical(road, profile):
    lines = ["<Profile>", '\t<ProfAlign name="design">']
    for station, height, length in profile.points:
        point = f"{fixed(station, 3)} {fixed(height, 3)}"
        lines.append(f'\t\t<ParaCurve length="{fixed(length, 3)}">{point}</ParaCurve>' if length
                     else f"\t\t<PVI>{point}</PVI>")
    heights = [f"{at} {fixed(ground(*road.at(at)[:2]), 3)}" for at in [-75] + list(range(-60, 1541, 20))]
    return lines + ["\t</ProfAlign>", f'\t<ProfSurf name="ground"><PntList2D>{" ".join(heights)}</PntList2D></ProfSurf>',
                    "</Profile>"]


def sections(road, profile):
    lines = ["<CrossSects>"]
    for at in range(0, 201, 50):
        middle, edge = profile.elevation(at), right_edge(at)
        heights = [f"{offset} {fixed(ground(*beside(road, at, offset)), 3)}" for offset in range(-12, 13, 4)]
        lines.append(f'\t<CrossSect sta="{at}" name="{grouped(at)}">')
        lines.append(f'\t\t<CrossSectSurf name="ground"><PntList2D>{" ".join(heights)}</PntList2D></CrossSectSurf>')
        for side, sign, width in (("left", -1.0, VERGE), ("right", 1.0, edge)):
            paved = CARRIAGEWAY + (width - VERGE)
            points = "".join(
                f'<CrossSectPnt code="{code}">{fixed(sign * offset, 3)} {fixed(middle - fall(offset, width), 3)}</CrossSectPnt>'
                for code, offset in (("CL", 0.0), ("EP", paved), ("VERGE", width)))
            lines.append(f'\t\t<DesignCrossSectSurf name="road" side="{side}" material="asphalt" '
                         f'typicalWidth="{fixed(width, 3)}">{points}</DesignCrossSectSurf>')
        lines.append("\t</CrossSect>")
    return lines + ["</CrossSects>"]


def points(road, profile):
    """Points to set out from, and points that were surveyed when the road was made."""
    chance = random.Random(17)
    lines = ['<CgPoints name="control">']
    for number, (station, offset, kind) in enumerate(
            ((-60.0, -18.0, "pillar"), (240.0, 22.5, "brass bolt"), (590.0, -31.0, "nail"), (1010.0, 27.0, "pillar")), 1):
        north, east = beside(road, station, offset)
        lines.append(f'\t<CgPoint name="GP{number}" code="CTRL" desc="{kind}">{pair(north, east)} '
                     f"{fixed(ground(north, east), 4)}</CgPoint>")
    lines += ["</CgPoints>", '<CgPoints name="as-built">']
    for i in range(18):
        code, offset = (("EPL", -CARRIAGEWAY), ("CL", 0.0), ("EPR", CARRIAGEWAY))[i % 3]
        station = 20.0 * (i // 3) + 0.3 * (chance.random() - 0.5)
        offset += 0.02 * (chance.random() - 0.5)
        height = profile.elevation(station) - fall(offset, VERGE) + 0.03 * (chance.random() - 0.5)
        lines.append(f'\t<CgPoint name="{i + 1}" code="{code}">{pair(*beside(road, station, offset))} {fixed(height, 3)}</CgPoint>')
    return lines + ["</CgPoints>"]


def terrain(road):
    lines = ['<Surfaces><Surface name="ground"><Definition surfType="TIN"><Pnts>']
    number = 0
    for station in range(0, 201, 25):
        for offset in (-25.0, 0.0, 25.0):
            north, east = beside(road, station, offset)
            number += 1
            lines.append(f'\t<P id="{number}">{pair(north, east)} {fixed(ground(north, east), 3)}</P>')
    return lines + ["</Pnts></Definition></Surface></Surfaces>"]


def parcels(road):
    """Lots on the left of the road's first curve, whose border follows the road at 12 m."""
    curve = next(e for e in road.elements if e.kind == "Curve")
    centre_north = curve.north - math.sin(curve.bearing) / curve.k0
    centre_east = curve.east + math.cos(curve.bearing) / curve.k0
    lines = ["<Parcels>"]
    for number in (1, 2):
        first, last = curve.station + 30.0 * (number - 1), curve.station + 30.0 * number
        near = [beside(road, station, -12.0) for station in (first, last)]
        far = [beside(road, station, -52.0) for station in (last, first)]
        # The two radii, the arc along the road and the chord at the back.
        radius, turn = 1.0 / curve.k0 + 12.0, 30.0 * curve.k0
        back = radius + 40.0
        area = radius * radius * (turn - math.sin(turn)) / 2.0
        corners = near + far
        area += 0.5 * sum(corners[i][0] * corners[(i + 1) % 4][1] - corners[(i + 1) % 4][0] * corners[i][1] for i in range(4))
        middle = beside(road, (first + last) / 2.0, -32.0)
        sides = [f'<Curve rot="cw" radius="{fixed(radius, 4)}"><Start>{pair(*near[0])}</Start>'
                 f"<Center>{pair(centre_north, centre_east)}</Center><End>{pair(*near[1])}</End></Curve>"]
        for start, end in ((near[1], far[0]), (far[0], far[1]), (far[1], near[0])):
            sides.append(f"<Line><Start>{pair(*start)}</Start><End>{pair(*end)}</End></Line>")
        assert abs(math.dist(*far) - 2.0 * back * math.sin(turn / 2.0)) < 1e-6
        lines.append(f'\t<Parcel name="{number}" desc="Curve lot {number}" area="{fixed(abs(area), 2)}">'
                     f"<Center>{pair(*middle)}</Center><CoordGeom>")
        lines += ["\t\t" + side for side in sides] + ["\t</CoordGeom></Parcel>"]
    return lines + ["</Parcels>"]


def write_road(road, profile):
    """The elements of the road up to its third curve. At station 700 the count breaks off and goes on with 1000."""
    elements = [e for e in road.elements if e.station < 1540.0]
    length = elements[-1].station + elements[-1].length - road.start
    inner = [f'<StaEquation staInternal="700" staBack="700" staAhead="1000"/>', "<CoordGeom>"]
    inner += ["\t" + line for line in horizontal(elements)] + ["</CoordGeom>"]
    inner += vertical(road, profile) + sections(road, profile)
    lines = ['<?xml version="1.0" encoding="UTF-8"?>',
             '<LandXML xmlns="http://www.landxml.org/schema/LandXML-1.2" version="1.2" date="2024-03-05" time="14:07:00">',
             '<Units><Metric linearUnit="meter" areaUnit="squareMeter" volumeUnit="cubicMeter" temperatureUnit="celsius" '
             'pressureUnit="HPA" angularUnit="decimal degrees" directionUnit="decimal degrees"/></Units>',
             '<Project name="Kestrel Bay Relief Road"/>', *points(road, profile), *terrain(road),
             f'<Alignments><Alignment name="RR-1" desc="Kestrel Bay Relief Road" length="{fixed(length, 4)}" '
             f'staStart="{fixed(road.start, 3)}">', *["\t" + line for line in inner], "</Alignment></Alignments>",
             *parcels(road), "</LandXML>"]
    (DATA / "road.xml").write_text("\n".join(lines) + "\n", encoding="utf-8")


# ------------------------------------------------------------------------------------------- sheets with groups and totals

def write_volumes():
    """Earthworks in sections of 20 m, in cubic metres: topsoil is only taken off, the subgrade is cut and filled."""
    numbers = random.Random(1605)
    rows = []
    for layer, most_cut, most_fill in (("Topsoil", 60.0, 0.0), ("Subgrade", 420.0, 380.0), ("Capping", 0.0, 90.0)):
        for station in range(0, 400, 20):
            cut = most_cut * numbers.uniform(0.3, 1.0)
            fill = most_fill * numbers.uniform(0.3, 1.0)
            rows.append([layer, grouped(station), grouped(station + 20), fixed(cut, 3), fixed(fill, 3)])
    write("volumes.csv", ["Layer", "From", "To", "Cut", "Fill"], rows)


def write_estates():
    """Parcels that a road takes land from: their areas and what is taken, in square metres."""
    numbers = random.Random(7)
    rows = []
    for owner, count in (("Harbour Board", 5), ("Kestrel Farm", 3), ("A. Núñez", 2), ("Crown Estate", 4)):
        for _ in range(count):
            area = numbers.uniform(900.0, 48000.0)
            rows.append([owner, str(len(rows) + 101), fixed(area, 2), fixed(area * numbers.uniform(0.02, 0.35), 2)])
    numbers.shuffle(rows)
    write("estates.csv", ["Owner", "Parcel", "Area", "Taken"], rows)


def write_checks():
    """Pegs as designed and as measured again, some of them beyond the tolerance of 20 mm. One was not found."""
    numbers = random.Random(20)
    rows = []
    for number in range(1, 41):
        north, east = 4100.0 + 12.5 * number, 18440.0 + 8.75 * number
        height = ground(north, east)
        off = [numbers.gauss(0.0, 0.009) for _ in range(3)]
        measured = [fixed(value + by, 3) for value, by in zip((north, east, height), off)]
        rows.append([f"P{number}", fixed(north, 3), fixed(east, 3), fixed(height, 3),
                     *(measured if number != 17 else ["", "", ""])])
    write("checks.csv", ["Point", "North", "East", "Height", "MeasuredNorth", "MeasuredEast", "MeasuredHeight"], rows)


def main():
    DATA.mkdir(exist_ok=True)
    write_volumes()
    write_estates()
    write_checks()
    road = make_alignment()
    profile = make_profile(road)
    write_alignment(road)
    write_stakeout(road, profile)
    write_layers(road, profile)
    write_traverse()
    write_control(road)
    write_road(road, profile)


if __name__ == "__main__":
    main()

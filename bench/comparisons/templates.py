"""A file of templates read, beside parsers of XML."""
from measure import Result
from parts import benchmarks, seconds
from work import Comparison, Limit, ratio


def run(surroundings):
    runs = benchmarks(surroundings, "(loadTemplate|parsePugixml|parseLibxml2)/200$", max(surroundings.runs, 3),
                      mixed=False)
    names = {"loadTemplate/200": "kareport", "parsePugixml/200": "pugixml", "parseLibxml2/200": "libxml2"}
    results = [Result(shown, shown == "kareport", seconds=seconds(runs[name])) for name, shown in names.items()]
    return [Comparison(
        "templates", "200 templates in 1 MB read",
        "A file of 200 templates, 1 MB: kareport opens it, looks for the last template and reads its tables, fields and "
        "dictionaries; the others parse the file as XML and keep all of it. Inside one process, each for itself.", results,
        [Limit("time, of pugixml", ratio(results, "kareport", ["pugixml"]), 3.0)])]

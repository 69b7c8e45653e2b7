"""Rich text read."""
from measure import Command, in_turn
from work import Comparison, Limit, make, ratio


def make_files(folder, lines):
    with open(f"{folder}/report.rtf", "w") as file:
        file.write("{\\rtf1\\ansi\\deff0{\\fonttbl{\\f0\\fmodern Courier New;}}\\f0\\fs16 ")
        for i in range(lines):
            file.write(f"{{\\b Point {i}}} north {1000 + i * 0.731:.3f} {{\\ul east}} {2000 + i * 0.377:.3f} "
                       f"elevation {i % 900 / 10:.3f} iron pipe\\par\n")
        file.write("}\n")


def run(surroundings):
    lines = surroundings.size(28_000, 500)
    with surroundings.folder() as folder:
        make(make_files, folder, lines)
        results = in_turn([
            Command("kareport", [surroundings.kareport, "convert", "report.rtf", "kareport.txt"], ours=True),
            Command("pandoc", ["pandoc", "-f", "rtf", "-t", "plain", "report.rtf", "-o", "pandoc.txt"]),
            Command("unrtf", ["unrtf", "--text", "report.rtf"], f"{folder}/unrtf.txt", most_seconds=300),
            Command("LibreOffice", ["soffice", "--headless", f"-env:UserInstallation=file://{folder}/office",
                                    "--convert-to", "txt", "report.rtf"]),
        ], folder, surroundings.runs)
    return [Comparison(
        "rich-text", f"Rich text of {lines:,} lines read",
        f"A rich text of {lines:,} lines with bold and underlined words, from its file to a plain text.", results,
        [Limit("time, of the fastest other", ratio(results, "kareport"), 0.1)])]

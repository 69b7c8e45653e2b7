"""Report text to a report file and back."""
from measure import Command, in_turn
from pages import lines
from work import Comparison, Limit, make, ratio, share


def make_files(folder, megabytes):
    text = "".join(line + "\r\n" for line in lines(megabytes * 1_000_000 // 83))
    with open(f"{folder}/text.utf16", "wb") as file:
        file.write(text.encode("utf-16-le"))
    with open(f"{folder}/text.utf8", "wb") as file:
        file.write(text.encode())


def run(surroundings):
    megabytes = surroundings.size(100, 2)
    work = f"{surroundings.bench}/ka_file_work"
    with surroundings.folder() as folder:
        make(make_files, folder, megabytes)
        results = in_turn([
            Command("kareport, saved", [work, "save", "text.utf16", "saved.rep"], own_clock=True, ours=True),
            Command("iconv to UTF-8", ["iconv", "-f", "UTF-16LE", "-t", "UTF-8", "-o", "to8.txt", "text.utf16"]),
            Command("kareport, loaded", [work, "load", "saved.rep"], own_clock=True, ours=True),
            Command("iconv to UTF-16", ["iconv", "-f", "UTF-8", "-t", "UTF-16LE", "-o", "to16.txt", "text.utf8"]),
            Command("copying the bytes alone", [work, "copy", "text.utf8", "copy.txt"], own_clock=True,
                    bound=True),
        ], folder, surroundings.runs)
    return [Comparison(
        "report-file", f"{megabytes} MB of report text to a report file and back",
        f"Report text of {megabytes} MB, all ASCII as nearly all of a report is. kareport saves and loads inside a process that "
        "holds the report, and changes every line end on the way. iconv, as a whole process, reads and writes files: "
        "its UTF-16 has twice the bytes.", results,
        [Limit("saving, of iconv", ratio(results, "kareport, saved", ["iconv to UTF-8"]), 0.5),
         Limit("loading, of iconv", ratio(results, "kareport, loaded", ["iconv to UTF-16"]), 0.5)],
        extra=[f"Saving: {share(results, 'kareport, saved')}"])]

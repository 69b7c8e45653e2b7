"""Many small jobs."""
import json

from measure import Command, in_turn
from rows import AWK, job, make_csv, make_template
from work import Comparison, Limit, make

ROWS = 50
# One process for each job, as a person would write it.
EACH_MAWK = f"for f in page*.csv; do mawk -F, '{AWK}' $f > ${{f%.csv}}.txt; done"
EACH_KAREPORT = 'for f in page*.json; do "$0" render $f; done'
ONE_MAWK = ("mawk -F, 'FNR==1{close(o);o=FILENAME;sub(/csv$/,\"txt\",o);next}{" +
            AWK[AWK.index("printf"):-1].replace("}", "") + " > o}' page*.csv")
SLICES = '"$0" --will-cite -j2 "$1" render --quiet --jobs jobs.txt --slice {}/8 ::: 1 2 3 4 5 6 7 8'


def make_files(folder, jobs):
    make_template(folder)
    with open(f"{folder}/jobs.txt", "w") as names:
        for i in range(jobs):
            make_csv(f"{folder}/page{i:04}.csv", ROWS, i)
            with open(f"{folder}/page{i:04}.json", "w") as file:
                json.dump(job(f"page{i:04}.csv", f"page{i:04}.rep"), file)
            names.write(f"page{i:04}.json\n")


def run(surroundings):
    jobs = surroundings.size(1000, 50)
    with surroundings.folder() as folder:
        make(make_files, folder, jobs)
        results = in_turn([
            Command("kareport, one process", [surroundings.kareport, "render", "--quiet", "--jobs", "jobs.txt"],
                    ours=True),
            Command("kareport, 8 slices, GNU parallel", ["sh", "-c", SLICES, "parallel", surroundings.kareport],
                    ours=True),
            Command("mawk, one process", ["sh", "-c", ONE_MAWK]),
            Command("mawk, a process each", ["sh", "-c", EACH_MAWK]),
            Command("kareport, a process each", ["sh", "-c", EACH_KAREPORT, surroundings.kareport], ours=True),
        ], folder, surroundings.runs)
    seconds = {result.name: result.median for result in results}
    one = seconds["kareport, one process"]
    return [Comparison(
        "batch", f"{jobs:,} jobs of one page",
        f"{jobs:,} jobs, each with a template and a CSV file of {ROWS} rows, to a report file each. mawk prints the lines "
        "of each file in a process of its own.", results,
        [Limit("seconds a thousand jobs, one process", one / jobs * 1000, 1.0)],
        extra=[f"kareport in one process: {jobs / one:,.0f} jobs a second. A process each: "
               f"{seconds['kareport, a process each'] / seconds['mawk, a process each']:.1f} times mawk's time; "
               f"one process: {one / seconds['mawk, one process']:.2f} times that of one mawk for all files."])]

"""Pages of text to a PDF with an embedded face."""
import json

from measure import Command, in_turn
from work import Comparison, Limit, make, ratio, share

LINES = 72
REPORTLAB = """
import sys
from reportlab.pdfgen import canvas
from reportlab.pdfbase import pdfmetrics
from reportlab.pdfbase.ttfonts import TTFont
pdfmetrics.registerFont(TTFont('Mono', '/usr/share/fonts/truetype/dejavu/DejaVuSansMono.ttf'))
lines = [line.rstrip() for line in open(sys.argv[1], encoding='utf-8')]
pdf = canvas.Canvas(sys.argv[2], pagesize=(595.32, 841.92), pageCompression=1)
for page in range(0, len(lines), 72):
    text = pdf.beginText(28.35, 800)
    text.setFont('Mono', 8, 9.5)
    for line in lines[page:page + 72]:
        text.textLine(line)
    pdf.drawText(text)
    pdf.showPage()
pdf.save()
"""
PART = 10  # pages, each with an entry of the outline
OUTLINE = REPORTLAB.replace("    pdf.showPage()", f"""
    if page % {LINES * PART} == 0:
        pdf.bookmarkPage(str(page))
        pdf.addOutlineEntry(f'Part {{page // {LINES * PART} + 1}}', str(page), 0)
    pdf.showPage()""").replace("pdf.save()", "pdf.setTitle('Pages')\npdf.save()")
# The face is put into the file, as the others do: by itself ps2pdf leaves the standard ones out.
GHOSTSCRIPT = "-dPDFSETTINGS=/prepress -dEmbedAllFonts=true"
ENSCRIPT = (f"enscript -q -B -M A4 -f Courier8 -L {LINES} -p pages.ps pages.txt && "
            f"ps2pdf {GHOSTSCRIPT} pages.ps enscript.pdf")


def lines(count):
    for i in range(count):
        yield (f"P{i:<8}|{i * 0.05:13.3f}|{5000 + i * 7919 % 4000000 / 1000:14.3f}|"
               f"{16000 + i * 104729 % 4000000 / 1000:14.3f}|{i * 31 % 90000 / 1000:10.3f}|iron pipe   |").ljust(80)


def make_files(folder, pages):
    with open(f"{folder}/pages.rep", "wb") as report, open(f"{folder}/pages.txt", "w") as text:
        report.write(b"\xef\xbb\xbf")
        for line in lines(LINES * pages):
            report.write(f"{line}\r\r\n".encode())
            text.write(line + "\n")


def make_outlined(folder, pages):
    steps = []
    with open(f"{folder}/pages.txt", "w") as text:
        for number, line in enumerate(lines(LINES * pages)):
            if number % (LINES * PART) == 0:
                steps.append({"heading": f"Part {number // (LINES * PART) + 1}"})
            steps.append({"line": line})
            text.write(line + "\n")
    with open(f"{folder}/pages.json", "w") as file:
        json.dump({"title": "Pages", "now": "2024-03-05T14:07:00", "header": False, "pdf": {}, "report": steps,
                   "page": {"linesPerPage": LINES, "charsPerRow": 80}, "output": ["kareport.pdf"]}, file)


def with_outline(surroundings):
    pages = surroundings.size(1000, 20)
    with surroundings.folder() as folder:
        make(make_outlined, folder, pages)
        results = in_turn([
            Command("kareport", [surroundings.kareport, "render", "--quiet", "pages.json"], ours=True),
            Command("ReportLab", ["/usr/bin/python3", "-c", OUTLINE, "pages.txt", "reportlab.pdf"]),
        ], folder, surroundings.runs)
    return Comparison(
        f"pdf-outline-{pages}", f"{pages:,} pages to a PDF with an outline",
        f"{pages:,} pages of {LINES} lines of 80 characters to a PDF with a title and an outline that has an entry for every "
        f"{PART} pages. kareport reads a job with a step for each line, ReportLab the lines; only kareport numbers the pages.",
        results, [Limit("time, of the other", ratio(results, "kareport"), 1.0)])


def run(surroundings):
    comparisons = [with_outline(surroundings)]
    for pages, runs in ((surroundings.size(1000, 20), surroundings.runs),
                        (surroundings.size(10_000, 200), min(surroundings.runs, 3))):
        with surroundings.folder() as folder:
            make(make_files, folder, pages)
            results = in_turn([
                Command("kareport", [surroundings.kareport, "convert", "pages.rep", "kareport.pdf", "--set",
                                     f"page.linesPerPage={LINES}"], ours=True),
                # The system's Python is the one that has the package.
                Command("ReportLab", ["/usr/bin/python3", "-c", REPORTLAB, "pages.txt", "reportlab.pdf"]),
                Command("enscript, ps2pdf", ["sh", "-c", ENSCRIPT]),
                Command("LibreOffice", ["soffice", "--headless", f"-env:UserInstallation=file://{folder}/office",
                                        "--convert-to", "pdf", "pages.txt"]),
                Command("compressing the pages alone", [f"{surroundings.bench}/ka_file_work", "deflate", "pages.rep"],
                        own_clock=True, bound=True),
            ], folder, runs)
        ours = next(result for result in results if result.ours)
        comparisons.append(Comparison(
            f"pdf-{pages}", f"{pages:,} pages to a PDF",
            f"{pages:,} pages of {LINES} lines of 80 characters, from a file to a PDF with its face in it, compressed. "
            "LibreOffice has the text only and breaks the pages itself.", results,
            [Limit("time, of the fastest other", ratio(results, "kareport"), 1.0)],
            extra=[f"kareport: {pages / ours.median:,.0f} pages a second. {share(results, 'kareport')}"]))
    return comparisons

#include "HtmlPage.h"

#include <QByteArray>
#include <QCryptographicHash>

#include <string_view>

namespace kareport
{

namespace
{

// Numbers are in a face of one width: what is missing after the decimal sign is filled with blanks.
constexpr std::string_view style = R"(
:root{color-scheme:light dark;--line:#c4c9d0;--band:#f3f5f7;--quiet:#5b6470}
@media (prefers-color-scheme:dark){:root{--line:#454c55;--band:#22272d;--quiet:#9aa4af}}
body{font:15px/1.45 system-ui,"Segoe UI","Liberation Sans",sans-serif;margin:2rem auto;max-width:75rem;padding:0 1rem}
h1{font-size:1.6rem;margin:0 0 .2rem}
h2{font-size:1.2rem;margin:1.6rem 0 .5rem}
p{margin:.4rem 0;white-space:pre-wrap}
.made,nav{color:var(--quiet)}
nav a{margin-right:1rem}
table{border-collapse:collapse;margin:1rem 0}
th,td{border-bottom:1px solid var(--line);padding:.2rem .7rem;text-align:left;vertical-align:top;white-space:pre-wrap}
caption{font-weight:bold;padding:.2rem .7rem;text-align:left}
thead th{background:var(--band);border-bottom:2px solid var(--line);position:sticky;top:0;vertical-align:bottom}
.n,.r{text-align:right}
.c{text-align:center}
td.n{font-family:ui-monospace,"DejaVu Sans Mono","Liberation Mono",Consolas,monospace;font-size:.93em;white-space:pre}
tr.g th{background:var(--band);padding-top:.6rem}
tbody.t td{border-top:1px solid currentColor;font-weight:bold}
thead [role=button]{cursor:pointer}
thead [role=button]:focus-visible{outline:2px solid currentColor;outline-offset:2px}
th[aria-sort=ascending] span::after{content:" \25B2"}
th[aria-sort=descending] span::after{content:" \25BC"}
@media print{
:root{color-scheme:light;--line:#999;--band:#fff;--quiet:#444}
body{font-size:9pt;margin:0;max-width:none;padding:0}
nav{display:none}
thead{display:table-header-group}
thead th{position:static}
tr{break-inside:avoid}
h2,caption,tr.g{break-after:avoid}
tbody.t{break-before:avoid}
th[aria-sort] span::after{content:""}
}
)";

// Rows are sorted in each group by themselves. A number is that of the cell, or of its text. The labels are not
// button elements: Chromium does not repeat a heading that has one on each sheet of paper.
constexpr std::string_view script = R"(
for (const table of document.querySelectorAll('table.data')) {
  const heads = [...table.tHead.rows[0].cells];
  heads.forEach((head, column) => {
    const label = head.firstElementChild;
    label.setAttribute('role', 'button');
    label.tabIndex = 0;
    label.addEventListener('keydown', event => {
      if (event.key !== 'Enter' && event.key !== ' ') return;
      event.preventDefault();
      label.click();
    });
    label.addEventListener('click', () => {
      const falls = head.getAttribute('aria-sort') === 'ascending';
      for (const other of heads) other.removeAttribute('aria-sort');
      head.setAttribute('aria-sort', falls ? 'descending' : 'ascending');
      const isNumber = head.classList.contains('n') || head.dataset.v !== undefined;
      const keyOf = row => {
        const cell = row.cells[column];
        if (!isNumber) return cell.textContent;
        const text = cell.dataset.v ?? cell.textContent.trim();
        if (/^-?inf/i.test(text)) return text[0] === '-' ? -Infinity : Infinity;
        const number = parseFloat(text);
        return isNaN(number) ? -Infinity : number;
      };
      const text = new Intl.Collator(undefined, {numeric: true});
      const compare = isNumber ? (a, b) => a < b ? -1 : a > b ? 1 : 0 : text.compare;
      for (const body of table.querySelectorAll('tbody.d')) {
        const rows = [...body.rows].filter(row => !row.classList.contains('g')).map(row => [keyOf(row), row]);
        rows.sort((a, b) => falls ? compare(b[0], a[0]) : compare(a[0], b[0]));
        body.append(...rows.map(row => row[1]));
      }
    });
  });
}
)";

/// The hash by which a browser knows that a part of the page is its own.
std::string sourceHash(std::string_view content)
{
    const QByteArray bytes(content.data(), static_cast<qsizetype>(content.size()));
    return "'sha256-" + QCryptographicHash::hash(bytes, QCryptographicHash::Sha256).toBase64().toStdString() + '\'';
}

} // namespace

std::string htmlHead(const std::string &language)
{
    std::string head = "<!DOCTYPE html>\n<html";
    head += language.empty() ? "" : " lang=\"" + language + '"';
    head += ">\n<head>\n<meta charset=\"utf-8\">\n"
            "<meta name=\"viewport\" content=\"width=device-width, initial-scale=1\">\n"
            "<meta http-equiv=\"Content-Security-Policy\" content=\"default-src 'none'; style-src ";
    head += sourceHash(style) + "; script-src " + sourceHash(script) + "\">\n<style>";
    head += style;
    head += "</style>\n";
    return head;
}

std::string htmlEnd()
{
    std::string end = "<script>";
    end += script;
    end += "</script>\n</body>\n</html>\n";
    return end;
}

} // namespace kareport

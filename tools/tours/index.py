"""Writes a page that shows the pictures of a tour."""

import html
import urllib.parse

_STYLE = """
:root { color-scheme: light dark; --line: #8884; --soft: #8881; --wrong: #c33 }
body { font: 16px/1.5 system-ui, sans-serif; margin: 0 auto; max-width: 100em; padding: 0 2em 4em }
nav { position: sticky; top: 0; background: Canvas; border-bottom: 1px solid var(--line); z-index: 1;
      padding: .6em 0; display: flex; flex-wrap: wrap; gap: .4em 1.2em }
nav b { margin-right: .5em }
h2 { margin: 2em 0 0; scroll-margin-top: 2em; font-size: 1.7em }
h3 { margin: 1.6em 0 .4em; scroll-margin-top: 3em }
section { border-top: 1px solid var(--line) }
.pictures { display: grid; grid-template-columns: repeat(auto-fill, minmax(20em, 1fr)); gap: 1.2em }
figure { margin: 0; background: var(--soft); border-radius: 8px; padding: .7em }
figure a { display: grid; height: 17em; place-items: center }
img { max-width: 100%; max-height: 17em; object-fit: contain; box-shadow: 0 1px 6px #0005 }
figcaption { margin-top: .6em } small { opacity: .7; overflow-wrap: anywhere }
.wrong { border-left: 4px solid var(--wrong); padding: .2em .8em; margin: .6em 0 }
pre { overflow: auto; background: var(--soft); padding: .7em; border-radius: 8px }
"""


def write(folder, medium, findings, albums):
    """Writes index.html in `folder`: the `findings` of onramp-check, then a part for each language.

    `albums` is a list of dictionaries: the `content` of each Album (see album.py).
    """
    title = _text(f"The wizard of {medium}")
    lines = ['<!DOCTYPE html>', '<html lang="en">', '<meta charset="utf-8">',
             f"<title>{title}</title>", f"<style>{_STYLE}</style>", f"<h1>{title}</h1>"]
    lines += _findings(findings)
    lines.append("<nav><b>Languages</b>")
    lines += [f'<a href="#{_id(album)}">{_text(album["language"])}</a>' for album in albums]
    lines.append("</nav>")
    for album in albums:
        lines += _album(album)
    (folder / "index.html").write_text("\n".join(lines) + "\n", encoding="utf-8")


def _findings(findings):
    if not findings:
        return ["<p>onramp-check finds no mistakes on this medium.</p>"]
    lines = [f"<details open><summary>onramp-check finds {len(findings)} "
             f"mistake{'s'[len(findings) == 1:]} on this medium.</summary>"]
    for finding in findings:
        place = ": ".join([finding["file"], *finding["key"]])
        said = (f"{finding['severity']}: {finding['found']}. Effect: {finding['effect']}. "
                f"Remedy: {finding['remedy']}.")
        lines.append(f'<p class="wrong"><b>{_text(place)}</b><br>{_text(said)}</p>')
    return [*lines, "</details>"]


def _album(album):
    language = album["language"]
    lines = [f'<h2 id="{_id(album)}">{_text(language)}</h2>', "<ul>"]
    for number, section in enumerate(album["sections"]):
        wrong = " ⚠" if section["problems"] else ""
        lines.append(f'<li><a href="#{_id(album, number)}">{_text(section["title"])}</a>{wrong}')
    lines.append("</ul>")
    for number, section in enumerate(album["sections"]):
        lines += [f'<section id="{_id(album, number)}">', f"<h3>{_text(section['title'])}</h3>"]
        lines += [f'<p class="wrong">{_text(_sentence(text))}</p>' for text in section["problems"]]
        lines += [f"<p>{_text(text)}</p>" for text in section["notes"]]
        lines.append('<div class="pictures">')
        lines += [_figure(picture) for picture in section["pictures"]]
        lines.append("</div>")
        lines += [f"<details><summary>{_text(file['name'])}</summary>"
                  f"<pre>{_text(file['text'])}</pre></details>" for file in section["files"]]
        lines.append("</section>")
    return lines


def _figure(picture):
    address = urllib.parse.quote(picture["file"])
    caption = _text(picture["caption"])
    return (f'<figure><a href="{address}"><img loading="lazy" alt="{caption}" src="{address}"></a>'
            f"<figcaption>{caption}<br><small>{_text(picture['file'])}</small></figcaption></figure>")


def _id(album, number=None):
    """Returns the anchor of an album, or of one of its sections."""
    name = urllib.parse.quote(album["language"], safe="").replace("%", ".")
    return f"language-{name}" if number is None else f"language-{name}-{number}"


def _sentence(text):
    return text[:1].upper() + text[1:]


def _text(text):
    return html.escape(text)

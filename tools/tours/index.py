"""Writes a page that shows the pictures of a tour."""

import html
import urllib.parse

_HEAD = """<!DOCTYPE html>
<meta charset="utf-8">
<title>{title}</title>
<style>
body {{ font-family: sans-serif }}
figure {{ display: inline-block; margin: 1em; vertical-align: top }}
img {{ max-width: 30em; border: 1px solid gray }}
</style>
<h1>{title}</h1>
"""


def write(pictures, medium):
    """Writes index.html beside the pictures, with a section for each language.

    Writes nothing when there are no pictures.
    """
    sections = {}
    for picture in sorted(pictures.glob("*.png")):
        sections.setdefault(picture.stem.partition("-")[0], []).append(picture)
    if not sections:
        return
    lines = [_HEAD.format(title=html.escape(f"The wizard of {medium}"))]
    for language, shown in sections.items():
        lines.append(f"<h2>{html.escape(language)}</h2>")
        for picture in shown:
            name = html.escape(picture.stem.partition("-")[2])
            lines.append(f'<figure><a href="{urllib.parse.quote(picture.name)}"><img alt="{name}" '
                         f'src="{urllib.parse.quote(picture.name)}"></a>'
                         f"<figcaption>{name}</figcaption></figure>")
    (pictures / "index.html").write_text("\n".join(lines) + "\n", encoding="utf-8")

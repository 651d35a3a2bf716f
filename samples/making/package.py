"""Office Open XML packages: ZIP archives of parts that name their types and refer to each other."""

import pathlib
import zipfile
from xml.sax.saxutils import escape

FOLDER = pathlib.Path(__file__).resolve().parent.parent  # where the samples go
XML = '<?xml version="1.0" encoding="UTF-8" standalone="yes"?>\n'
OFFICE = "http://schemas.openxmlformats.org/officeDocument/2006/relationships"
PACKAGE = "http://schemas.openxmlformats.org/package/2006"
CORE_PROPERTIES = "application/vnd.openxmlformats-package.core-properties+xml"


def relationships(links):
    """The part that holds the relationships (id, last word of the type, target) of another part."""
    return XML + f'<Relationships xmlns="{PACKAGE}/relationships">' + "".join(
        f'<Relationship Id="{link}" Type="{kind if ":" in kind else f"{OFFICE}/{kind}"}" '
        f'Target="{target}"/>' for link, kind, target in links) + "</Relationships>"


def core_properties(title):
    return (CORE_PROPERTIES, XML + f'<cp:coreProperties xmlns:cp="{PACKAGE}/metadata/core-properties" '
            'xmlns:dc="http://purl.org/dc/elements/1.1/">'
            f"<dc:title>{escape(title)}</dc:title></cp:coreProperties>")


def write_package(name, main, parts):
    """Writes a package beside the script.

    parts is {path: (content type, content)}; those without a type have one by their extension.
    """
    overrides = "".join(f'<Override PartName="/{path}" ContentType="{kind}"/>'
                        for path, (kind, _) in parts.items() if kind)
    content_types = (
        XML + f'<Types xmlns="{PACKAGE}/content-types">'
        '<Default Extension="rels" '
        'ContentType="application/vnd.openxmlformats-package.relationships+xml"/>'
        '<Default Extension="xml" ContentType="application/xml"/>'
        f'<Default Extension="png" ContentType="image/png"/>{overrides}</Types>')
    links = relationships([
        ("rId1", "officeDocument", main),
        ("rId2", f"{PACKAGE}/relationships/metadata/core-properties", "docProps/core.xml"),
    ])
    contents = {"[Content_Types].xml": content_types, "_rels/.rels": links}
    contents.update({path: content for path, (_, content) in parts.items()})
    with zipfile.ZipFile(FOLDER / name, "w") as archive:
        for path, content in contents.items():
            entry = zipfile.ZipInfo(path)  # dated 1980: the same bytes each time
            entry.compress_type = zipfile.ZIP_DEFLATED
            archive.writestr(entry, content)

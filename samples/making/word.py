"""WordprocessingML: the parts of a letter or a report."""

from xml.sax.saxutils import escape

from making.package import XML, core_properties, relationships, write_package

EMU_PER_CM = 360000
TWIPS_PER_CM = 567

NAMESPACES = (
    'xmlns:w="http://schemas.openxmlformats.org/wordprocessingml/2006/main" '
    'xmlns:r="http://schemas.openxmlformats.org/officeDocument/2006/relationships" '
    'xmlns:wp="http://schemas.openxmlformats.org/drawingml/2006/wordprocessingDrawing" '
    'xmlns:a="http://schemas.openxmlformats.org/drawingml/2006/main" '
    'xmlns:pic="http://schemas.openxmlformats.org/drawingml/2006/picture"'
)

def run(text, font=None, bold=False, italic=False, size=None, colour=None):
    properties = ""
    if font:
        properties += f'<w:rFonts w:ascii="{font}" w:hAnsi="{font}" w:cs="{font}"/>'
    properties += "<w:b/>" * bold + "<w:i/>" * italic
    if colour:
        properties += f'<w:color w:val="{colour}"/>'
    if size:
        properties += f'<w:sz w:val="{2 * size}"/>'
    return f'<w:r><w:rPr>{properties}</w:rPr><w:t xml:space="preserve">{escape(text)}</w:t></w:r>'


def paragraph(*runs, style=None, align=None, section=""):
    properties = ""
    if style:
        properties += f'<w:pStyle w:val="{style}"/>'
    if align:
        properties += f'<w:jc w:val="{align}"/>'
    content = "".join(item if item.startswith("<") else run(item) for item in runs)
    return f"<w:p><w:pPr>{properties}{section}</w:pPr>{content}</w:p>"


def picture(relation, width_cm, height_cm, name):
    extent = f'cx="{int(width_cm * EMU_PER_CM)}" cy="{int(height_cm * EMU_PER_CM)}"'
    return (
        f'<w:r><w:drawing><wp:inline distT="0" distB="0" distL="0" distR="0">'
        f'<wp:extent {extent}/><wp:docPr id="1" name="{name}"/>'
        '<a:graphic><a:graphicData uri="http://schemas.openxmlformats.org/drawingml/2006/picture">'
        f'<pic:pic><pic:nvPicPr><pic:cNvPr id="1" name="{name}"/><pic:cNvPicPr/></pic:nvPicPr>'
        f'<pic:blipFill><a:blip r:embed="{relation}"/><a:stretch><a:fillRect/></a:stretch>'
        f'</pic:blipFill><pic:spPr><a:xfrm><a:off x="0" y="0"/><a:ext {extent}/></a:xfrm>'
        '<a:prstGeom prst="rect"><a:avLst/></a:prstGeom></pic:spPr></pic:pic>'
        "</a:graphicData></a:graphic></wp:inline></w:drawing></w:r>"
    )


def table(rows, widths_cm, numbers_from=1):
    """The first row is the heading; columns from `numbers_from` on stand at the right."""
    border = "".join(
        f'<w:{side} w:val="single" w:sz="4" w:color="8CA3B5"/>'
        for side in ("top", "left", "bottom", "right", "insideH", "insideV")
    )
    widths = [int(width * TWIPS_PER_CM) for width in widths_cm]
    body = ""
    for number, row in enumerate(rows):
        cells = ""
        for column, text in enumerate(row):
            shade = '<w:shd w:val="clear" w:fill="DCE6EE"/>' if number == 0 else ""
            align = "right" if column >= numbers_from else None
            cells += (f'<w:tc><w:tcPr><w:tcW w:w="{widths[column]}" w:type="dxa"/>{shade}</w:tcPr>'
                      + paragraph(run(text, bold=number == 0), style="Cell", align=align)
                      + "</w:tc>")
        heading = "<w:trPr><w:tblHeader/></w:trPr>" if number == 0 else ""
        body += f"<w:tr>{heading}{cells}</w:tr>"
    grid = "".join(f'<w:gridCol w:w="{width}"/>' for width in widths)
    return (f'<w:tbl><w:tblPr><w:tblW w:w="{sum(widths)}" w:type="dxa"/>'
            f"<w:tblBorders>{border}</w:tblBorders></w:tblPr><w:tblGrid>{grid}</w:tblGrid>{body}"
            "</w:tbl>")


def section(landscape=False):
    """A4, with margins of 2.5 cm."""
    width, height = (16838, 11906) if landscape else (11906, 16838)
    orient = ' w:orient="landscape"' if landscape else ""
    return (f'<w:sectPr><w:pgSz w:w="{width}" w:h="{height}"{orient}/>'
            '<w:pgMar w:top="1417" w:right="1417" w:bottom="1417" w:left="1417" w:header="709" '
            'w:footer="709" w:gutter="0"/></w:sectPr>')


def style(name, title, font, size, extra="", based="Normal"):
    based_on = f'<w:basedOn w:val="{based}"/>' if name != "Normal" else ""
    default = ' w:default="1"' if name == "Normal" else ""
    run_extra = "<w:b/>" if name.startswith("Heading") or name == "Title" else ""
    return (f'<w:style w:type="paragraph"{default} w:styleId="{name}"><w:name w:val="{title}"/>'
            f'{based_on}<w:pPr>{extra}</w:pPr><w:rPr><w:rFonts w:ascii="{font}" w:hAnsi="{font}" '
            f'w:cs="{font}"/>{run_extra}<w:sz w:val="{2 * size}"/></w:rPr></w:style>')


STYLES = (
    XML + f"<w:styles {NAMESPACES}>"
    + style("Normal", "Normal", "Carlito", 11,
            '<w:spacing w:after="140" w:line="276" w:lineRule="auto"/>')
    + style("Title", "Title", "Liberation Sans", 22, '<w:spacing w:after="240"/>')
    + style("Heading1", "heading 1", "Liberation Sans", 15,
            '<w:keepNext/><w:spacing w:before="320" w:after="140"/><w:outlineLvl w:val="0"/>')
    + style("Heading2", "heading 2", "Liberation Sans", 12,
            '<w:keepNext/><w:spacing w:before="200" w:after="100"/><w:outlineLvl w:val="1"/>')
    + style("Cell", "Cell", "Carlito", 10,
            '<w:spacing w:before="40" w:after="40" w:line="240" w:lineRule="auto"/>')
    + "</w:styles>"
)


def write_docx(name, title, body, pictures=None):
    """A package with the given body and {relation: PNG bytes} for its pictures."""
    pictures = pictures or {}
    types = "application/vnd.openxmlformats-officedocument.wordprocessingml"
    links = [("rId1", "styles", "styles.xml")]
    links += [(relation, "image", f"media/{relation}.png") for relation in pictures]
    parts = {
        "word/document.xml": (
            f"{types}.document.main+xml",
            XML + f"<w:document {NAMESPACES}><w:body>{body}</w:body></w:document>"),
        "word/styles.xml": (f"{types}.styles+xml", STYLES),
        "word/_rels/document.xml.rels": (None, relationships(links)),
        "docProps/core.xml": core_properties(title),
    }
    parts.update({f"word/media/{relation}.png": (None, data)
                  for relation, data in pictures.items()})
    write_package(name, "word/document.xml", parts)

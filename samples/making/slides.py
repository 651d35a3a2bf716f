"""PresentationML: slides with a master, notes, comments, tables and pictures."""

from xml.sax.saxutils import escape

from making.package import XML, OFFICE, core_properties, relationships, write_package

A = "http://schemas.openxmlformats.org/drawingml/2006"
NAMESPACES = (f'xmlns:a="{A}/main" xmlns:r="{OFFICE}" '
              'xmlns:p="http://schemas.openxmlformats.org/presentationml/2006/main"')
TYPES = "application/vnd.openxmlformats-officedocument.presentationml"
EMU_PER_CM = 360000
WIDTH, HEIGHT = 33.867, 19.05  # cm; 16 to 9

TITLE = (2.0, 1.2, 29.8, 2.6)
BODY = (2.0, 4.6, 29.8, 12.6)
MASTER_TREE = ('<p:nvGrpSpPr><p:cNvPr id="1" name=""/><p:cNvGrpSpPr/><p:nvPr/></p:nvGrpSpPr>'
               "<p:grpSpPr/>")


# --- shapes: a box is (left, top, width, height) in cm -------------------------------------------

def transform(box, tag="a:xfrm"):
    left, top, width, height = (int(value * EMU_PER_CM) for value in box)
    return f'<{tag}><a:off x="{left}" y="{top}"/><a:ext cx="{width}" cy="{height}"/></{tag}>'


def solid(colour):
    return f'<a:solidFill><a:srgbClr val="{colour}"/></a:solidFill>'


def paragraphs(lines, colour=None, size=None, align=None, marks=True):
    """Each line is a text, or (level, text)."""
    xml = ""
    for line in lines:
        level, words = line if isinstance(line, tuple) else (0, line)
        looks = (f'<a:rPr lang="en-GB"{f" sz={chr(34)}{size * 100}{chr(34)}" if size else ""}>'
                 f'{solid(colour) if colour else ""}</a:rPr>')
        place = (f'<a:pPr lvl="{level}"{f" algn={chr(34)}{align}{chr(34)}" if align else ""}'
                 + ("/>" if marks else ' marL="0" indent="0"><a:buNone/></a:pPr>'))
        xml += f"<a:p>{place}<a:r>{looks}<a:t>{escape(words)}</a:t></a:r></a:p>"
    return xml


def placeholder(kind, lines, box, colour=None, index=0, marks=True):
    at = f' idx="{index}"' if index else ""
    return (f'<p:sp><p:nvSpPr><p:cNvPr id="{index + 2}" name="{kind} {index}"/><p:cNvSpPr/>'
            f'<p:nvPr><p:ph type="{kind}"{at}/></p:nvPr></p:nvSpPr><p:spPr>{transform(box)}</p:spPr>'
            f"<p:txBody><a:bodyPr/>{paragraphs(lines, colour, marks=marks)}</p:txBody></p:sp>")


def title(words, colour=None, box=TITLE, kind="title"):
    return placeholder(kind, [words], box, colour)


def body(lines, colour=None, box=BODY, kind="body", marks=True):
    return placeholder(kind, lines, box, colour, 1, marks)


def shape(form, lines, box, fill, colour="FFFFFF", line=None, size=16):
    """A shape of its own with text in it: form is "rect", "ellipse" and so on."""
    border = f"<a:ln w=\"12700\">{solid(line)}</a:ln>" if line else "<a:ln><a:noFill/></a:ln>"
    return (f'<p:sp><p:nvSpPr><p:cNvPr id="20" name="{form}"/><p:cNvSpPr/><p:nvPr/></p:nvSpPr>'
            f'<p:spPr>{transform(box)}<a:prstGeom prst="{form}"><a:avLst/></a:prstGeom>{solid(fill)}{border}</p:spPr>'
            f'<p:txBody><a:bodyPr anchor="ctr"/>'
            f'{paragraphs(lines, colour, size, "ctr") or "<a:p/>"}</p:txBody></p:sp>')


def picture(relation, box, name):
    return (f'<p:pic><p:nvPicPr><p:cNvPr id="30" name="{name}"/><p:cNvPicPr/><p:nvPr/></p:nvPicPr>'
            f'<p:blipFill><a:blip r:embed="{relation}"/><a:stretch><a:fillRect/></a:stretch>'
            f'</p:blipFill><p:spPr>{transform(box)}<a:prstGeom prst="rect"/></p:spPr></p:pic>')


def table(rows, widths, box):
    """The first row is the heading; all columns but the first stand at the right."""
    grid = "".join(f'<a:gridCol w="{int(width * EMU_PER_CM)}"/>' for width in widths)
    height = int(box[3] * EMU_PER_CM / len(rows))
    xml = ""
    for number, row in enumerate(rows):
        cells = "".join(
            f'<a:tc><a:txBody><a:bodyPr/>{paragraphs([text], "1F2A33", 16, "r" if i else None)}'
            "</a:txBody><a:tcPr>"
            + "".join(f'<a:{side} w="9525">{solid("8CA3B5")}</a:{side}>'
                      for side in ("lnL", "lnR", "lnT", "lnB"))
            + solid("DCE6EE" if number == 0 else "FFFFFF") + "</a:tcPr></a:tc>"
            for i, text in enumerate(row))
        xml += f'<a:tr h="{height}">{cells}</a:tr>'
    return ('<p:graphicFrame><p:nvGraphicFramePr><p:cNvPr id="40" name="Table"/>'
            f"<p:cNvGraphicFramePr/><p:nvPr/></p:nvGraphicFramePr>{transform(box, 'p:xfrm')}"
            f'<a:graphic><a:graphicData uri="{A}/table"><a:tbl><a:tblPr/>'
            f"<a:tblGrid>{grid}</a:tblGrid>{xml}</a:tbl></a:graphicData></a:graphic>"
            "</p:graphicFrame>")


# --- what all slides share -----------------------------------------------------------------------

def theme(name):
    colours = {"dk1": "1F2A33", "lt1": "FFFFFF", "dk2": "18466E", "lt2": "EEF3F7",
               "accent1": "18466E", "accent2": "3B7EA8", "accent3": "C8702A", "accent4": "6B8F3A",
               "accent5": "8CA3B5", "accent6": "A02020", "hlink": "18466E", "folHlink": "5A6B78"}
    scheme = "".join(f'<a:{key}><a:srgbClr val="{value}"/></a:{key}>'
                     for key, value in colours.items())
    font = '<a:latin typeface="{}"/><a:ea typeface=""/><a:cs typeface=""/>'
    fills = 3 * '<a:solidFill><a:schemeClr val="phClr"/></a:solidFill>'
    lines = 3 * ('<a:ln w="9525"><a:solidFill><a:schemeClr val="phClr"/></a:solidFill></a:ln>')
    effects = 3 * "<a:effectStyle><a:effectLst/></a:effectStyle>"
    return (XML + f'<a:theme xmlns:a="{A}/main" name="{name}"><a:themeElements>'
            f'<a:clrScheme name="{name}">{scheme}</a:clrScheme><a:fontScheme name="{name}">'
            f'<a:majorFont>{font.format("Liberation Sans")}</a:majorFont>'
            f'<a:minorFont>{font.format("Carlito")}</a:minorFont></a:fontScheme>'
            f'<a:fmtScheme name="{name}"><a:fillStyleLst>{fills}</a:fillStyleLst>'
            f"<a:lnStyleLst>{lines}</a:lnStyleLst><a:effectStyleLst>{effects}</a:effectStyleLst>"
            f"<a:bgFillStyleLst>{fills}</a:bgFillStyleLst></a:fmtScheme></a:themeElements></a:theme>")


COLOUR_MAP = ('bg1="lt1" tx1="dk1" bg2="lt2" tx2="dk2" accent1="accent1" accent2="accent2" '
              'accent3="accent3" accent4="accent4" accent5="accent5" accent6="accent6" '
              'hlink="hlink" folHlink="folHlink"')


def background(colour):
    return f"<p:bg><p:bgPr>{solid(colour)}<a:effectLst/></p:bgPr></p:bg>"


def text_style(level, size, bullet, colour, font, bold=False):
    indent = int(0.9 * EMU_PER_CM)
    mark = (f'marL="{indent * level}" indent="-{indent}"' if bullet else 'marL="0" indent="0"')
    return (f"<a:lvl{level}pPr {mark}><a:spcBef><a:spcPts val=\"{'600' if bullet else '0'}\"/></a:spcBef>"
            + (f'<a:buFont typeface="Liberation Sans"/><a:buChar char="{bullet}"/>' if bullet
               else "<a:buNone/>")
            + f'<a:defRPr sz="{size * 100}" b="{int(bold)}">{solid(colour)}'
            f'<a:latin typeface="{font}"/></a:defRPr></a:lvl{level}pPr>')


def master():
    band = shape("rect", [], (0, HEIGHT - 0.5, WIDTH, 0.5), "18466E")
    return (
        XML + f"<p:sldMaster {NAMESPACES}><p:cSld>{background('FFFFFF')}<p:spTree>{MASTER_TREE}{band}"
        + title("Title") + body(["Text"])
        + f'</p:spTree></p:cSld><p:clrMap {COLOUR_MAP}/><p:sldLayoutIdLst>'
        '<p:sldLayoutId id="2147483649" r:id="rId1"/><p:sldLayoutId id="2147483650" r:id="rId2"/>'
        "</p:sldLayoutIdLst><p:txStyles><p:titleStyle>"
        + text_style(1, 32, None, "18466E", "Liberation Sans", bold=True)
        + "</p:titleStyle><p:bodyStyle>"
        + text_style(1, 24, "•", "1F2A33", "Carlito") + text_style(2, 20, "–", "3A4954", "Carlito")
        + "</p:bodyStyle><p:otherStyle/></p:txStyles></p:sldMaster>")


def layout(kind, name, shapes):
    return (XML + f'<p:sldLayout {NAMESPACES} type="{kind}"><p:cSld name="{name}">'
            f"<p:spTree>{MASTER_TREE}{shapes}</p:spTree></p:cSld>"
            "<p:clrMapOvr><a:masterClrMapping/></p:clrMapOvr></p:sldLayout>")


def notes_page(tag, words, extra=""):
    """On paper of 19.05 by 27.52 cm: the slide above, the notes below."""
    image = ('<p:sp><p:nvSpPr><p:cNvPr id="2" name="Slide"/><p:cNvSpPr/><p:nvPr>'
             f'<p:ph type="sldImg"/></p:nvPr></p:nvSpPr><p:spPr>{transform((1.9, 2.2, 15.2, 8.55))}'
             "</p:spPr></p:sp>")
    text = placeholder("body", [words], (1.9, 12.0, 15.2, 12.4), index=1, marks=False)
    return (XML + f"<p:{tag} {NAMESPACES}><p:cSld><p:spTree>{MASTER_TREE}{image}{text}</p:spTree>"
            f"</p:cSld>{extra}</p:{tag}>")


# --- a slide and a presentation ------------------------------------------------------------------

class Slide:
    def __init__(self, shapes, notes=None, hidden=False, dark=False, comments=(), first=False,
                 pictures=None):
        """comments are (author number, left and top in cm, text); pictures {relation: PNG}."""
        self.shapes, self.notes, self.hidden, self.dark = shapes, notes, hidden, dark
        self.comments, self.first, self.pictures = comments, first, pictures or {}

    def xml(self):
        return (XML + f"<p:sld {NAMESPACES}{' show=' + chr(34) + '0' + chr(34) if self.hidden else ''}>"
                f"<p:cSld>{background('12202C') if self.dark else ''}"
                f"<p:spTree>{MASTER_TREE}{self.shapes}</p:spTree></p:cSld>"
                "<p:clrMapOvr><a:masterClrMapping/></p:clrMapOvr></p:sld>")

    def comments_xml(self):
        per_cm = 576 / 2.54  # comments are placed in 576ths of an inch
        return XML + f"<p:cmLst {NAMESPACES}>" + "".join(
            f'<p:cm authorId="{author}" dt="2025-02-{10 + number:02}T09:30:00.000" idx="{number}">'
            f'<p:pos x="{int(left * per_cm)}" y="{int(top * per_cm)}"/>'
            f"<p:text>{escape(words)}</p:text></p:cm>"
            for number, (author, left, top, words) in enumerate(self.comments, 1)) + "</p:cmLst>"


def add_slide(parts, number, slide):
    """Adds a slide's parts; the layout is the first for title slides, else the second."""
    links = [("rId1", "slideLayout", f"../slideLayouts/slideLayout{1 if slide.first else 2}.xml")]
    if slide.notes:
        links.append(("rId2", "notesSlide", f"../notesSlides/notesSlide{number}.xml"))
        parts[f"ppt/notesSlides/notesSlide{number}.xml"] = (
            f"{TYPES}.notesSlide+xml", notes_page("notes", slide.notes))
        parts[f"ppt/notesSlides/_rels/notesSlide{number}.xml.rels"] = (None, relationships([
            ("rId1", "notesMaster", "../notesMasters/notesMaster1.xml"),
            ("rId2", "slide", f"../slides/slide{number}.xml")]))
    if slide.comments:
        links.append(("rId3", "comments", f"../comments/comment{number}.xml"))
        parts[f"ppt/comments/comment{number}.xml"] = (f"{TYPES}.comments+xml", slide.comments_xml())
    for relation, data in slide.pictures.items():
        links.append((relation, "image", f"../media/{relation}-{number}.png"))
        parts[f"ppt/media/{relation}-{number}.png"] = (None, data)
    parts[f"ppt/slides/slide{number}.xml"] = (f"{TYPES}.slide+xml", slide.xml())
    parts[f"ppt/slides/_rels/slide{number}.xml.rels"] = (None, relationships(links))


def write_pptx(name, words, slides, authors=(), kind="presentation"):
    """A presentation, or a show that plays at once: kind is then "slideshow"."""
    parts = {
        "docProps/core.xml": core_properties(words),
        "ppt/theme/theme1.xml": ("application/vnd.openxmlformats-officedocument.theme+xml",
                                 theme("Print room")),
        "ppt/theme/theme2.xml": ("application/vnd.openxmlformats-officedocument.theme+xml",
                                 theme("Notes")),
        "ppt/slideMasters/slideMaster1.xml": (f"{TYPES}.slideMaster+xml", master()),
        "ppt/slideMasters/_rels/slideMaster1.xml.rels": (None, relationships([
            ("rId1", "slideLayout", "../slideLayouts/slideLayout1.xml"),
            ("rId2", "slideLayout", "../slideLayouts/slideLayout2.xml"),
            ("rId3", "theme", "../theme/theme1.xml")])),
        "ppt/slideLayouts/slideLayout1.xml": (f"{TYPES}.slideLayout+xml", layout(
            "title", "Title Slide", title("Title", kind="ctrTitle") + body(["Text"], kind="subTitle"))),
        "ppt/slideLayouts/slideLayout2.xml": (f"{TYPES}.slideLayout+xml", layout(
            "obj", "Title and Content", title("Title") + body(["Text"]))),
        "ppt/notesMasters/notesMaster1.xml": (f"{TYPES}.notesMaster+xml", notes_page(
            "notesMaster", "Notes", f"<p:clrMap {COLOUR_MAP}/>")),
        "ppt/notesMasters/_rels/notesMaster1.xml.rels": (None, relationships([
            ("rId1", "theme", "../theme/theme2.xml")])),
    }
    for number in (1, 2):
        parts[f"ppt/slideLayouts/_rels/slideLayout{number}.xml.rels"] = (None, relationships([
            ("rId1", "slideMaster", "../slideMasters/slideMaster1.xml")]))
    links = [("rId1", "slideMaster", "slideMasters/slideMaster1.xml"),
             ("rId2", "notesMaster", "notesMasters/notesMaster1.xml")]
    if authors:
        links.append(("rId3", "commentAuthors", "commentAuthors.xml"))
        parts["ppt/commentAuthors.xml"] = (
            f"{TYPES}.commentAuthors+xml", XML + f"<p:cmAuthorLst {NAMESPACES}>" + "".join(
                f'<p:cmAuthor id="{i}" name="{author}" initials="{initials}" lastIdx="9" clrIdx="{i}"/>'
                for i, (author, initials) in enumerate(authors)) + "</p:cmAuthorLst>")
    ids = ""
    for number, slide in enumerate(slides, 1):
        add_slide(parts, number, slide)
        links.append((f"rId{number + 9}", "slide", f"slides/slide{number}.xml"))
        ids += f'<p:sldId id="{255 + number}" r:id="rId{number + 9}"/>'
    parts["ppt/presentation.xml"] = (
        f"{TYPES}.{kind}.main+xml",
        XML + f'<p:presentation {NAMESPACES}><p:sldMasterIdLst>'
        '<p:sldMasterId id="2147483648" r:id="rId1"/></p:sldMasterIdLst>'
        '<p:notesMasterIdLst><p:notesMasterId r:id="rId2"/></p:notesMasterIdLst>'
        f'<p:sldIdLst>{ids}</p:sldIdLst><p:sldSz cx="12192000" cy="6858000"/>'
        '<p:notesSz cx="6858000" cy="9906000"/></p:presentation>')
    parts["ppt/_rels/presentation.xml.rels"] = (None, relationships(links))
    write_package(name, "ppt/presentation.xml", parts)

"""SpreadsheetML: workbooks with formats, formulas, page set-up and a chart."""

from xml.sax.saxutils import escape

from making.package import XML, OFFICE, core_properties, relationships, write_package

MAIN = ('xmlns="http://schemas.openxmlformats.org/spreadsheetml/2006/main" '
        f'xmlns:r="{OFFICE}"')
DRAWING = "http://schemas.openxmlformats.org/drawingml/2006"
TYPES = "application/vnd.openxmlformats-officedocument.spreadsheetml"

# name: (number format, font, fill, border, alignment)
FORMATS = {
    "text": (0, 0, 0, 0, None),
    "title": (0, 1, 0, 0, None),
    "heading": (0, 2, 2, 1, "center"),
    "number": (3, 0, 0, 0, None),
    "money": (164, 0, 0, 0, None),
    "price": (166, 0, 0, 0, None),
    "share": (10, 0, 0, 0, None),
    "date": (165, 0, 0, 0, "center"),
    "total": (3, 2, 0, 2, None),
    "total money": (164, 2, 0, 2, None),
    "total text": (0, 2, 0, 2, None),
    "warning": (3, 3, 3, 0, None),
}


def styles():
    def font(extra, size=10, colour=None):
        return (f'<font>{extra}<sz val="{size}"/>'
                + (f'<color rgb="FF{colour}"/>' if colour else "")
                + '<name val="Liberation Sans"/></font>')

    def fill(colour):
        return (f'<fill><patternFill patternType="solid"><fgColor rgb="FF{colour}"/></patternFill>'
                "</fill>")

    line = '<{0} style="thin"><color rgb="FF18466E"/></{0}>'
    cells = "".join(
        f'<xf numFmtId="{number}" fontId="{font_}" fillId="{fill_}" borderId="{border}" xfId="0" '
        'applyNumberFormat="1" applyFont="1" applyFill="1" applyBorder="1" applyAlignment="1">'
        + (f'<alignment horizontal="{align}"/>' if align else "") + "</xf>"
        for number, font_, fill_, border, align in FORMATS.values())
    return (
        XML + f"<styleSheet {MAIN}>"
        '<numFmts count="3"><numFmt numFmtId="164" formatCode="#,##0.00\\ &quot;€&quot;"/>'
        '<numFmt numFmtId="165" formatCode="dd/mm/yyyy"/>'
        '<numFmt numFmtId="166" formatCode="0.0000\\ &quot;€&quot;"/></numFmts>'
        '<fonts count="4">' + font("") + font("<b/>", 16, "18466E") + font("<b/>")
        + font("<b/>", colour="A02020") + "</fonts>"
        '<fills count="4"><fill><patternFill patternType="none"/></fill>'
        '<fill><patternFill patternType="gray125"/></fill>' + fill("DCE6EE") + fill("FBE3E0")
        + "</fills>"
        '<borders count="3"><border/>'
        f'<border>{line.format("bottom")}</border><border>{line.format("top")}</border></borders>'
        '<cellStyleXfs count="1"><xf/></cellStyleXfs>'
        f'<cellXfs count="{len(FORMATS)}">{cells}</cellXfs></styleSheet>')


def column_name(column):
    return chr(ord("A") + column)  # there are no more than 26


def cell(row, column, value, style):
    """A text, a number, or a formula with its result: ("SUM(B3:B6)", 42)."""
    start = f'<c r="{column_name(column)}{row}" s="{list(FORMATS).index(style)}"'
    if isinstance(value, tuple):
        return f"{start}><f>{escape(value[0])}</f><v>{value[1]}</v></c>"
    if isinstance(value, str):
        return f'{start} t="inlineStr"><is><t>{escape(value)}</t></is></c>'
    return f"{start}><v>{value}</v></c>"


def worksheet(widths, rows, landscape=False, has_chart=False):
    """rows are lists of (value, style), or None for a cell left empty."""
    columns = "".join(f'<col min="{i + 1}" max="{i + 1}" width="{width}" customWidth="1"/>'
                      for i, width in enumerate(widths))
    data = ""
    for number, row in enumerate(rows, 1):
        cells = "".join(cell(number, column, *content)
                        for column, content in enumerate(row) if content)
        height = 24 if row and row[0] and row[0][1] == "title" else 15
        data += f'<row r="{number}" ht="{height}" customHeight="1">{cells}</row>'
    orientation = "landscape" if landscape else "portrait"
    return (
        XML + f'<worksheet {MAIN}><cols>{columns}</cols><sheetData>{data}</sheetData>'
        '<pageMargins left="0.7" right="0.7" top="0.9" bottom="0.9" header="0.4" footer="0.4"/>'
        f'<pageSetup paperSize="9" orientation="{orientation}"/>'
        "<headerFooter><oddHeader>&amp;L&amp;A&amp;RThe print room</oddHeader>"
        "<oddFooter>&amp;CPage &amp;P of &amp;N</oddFooter></headerFooter>"
        + ('<drawing r:id="rId1"/>' if has_chart else "") + "</worksheet>")


def column_chart(title, sheet, categories, series):
    """A chart of columns.

    categories is (range, texts); series a list of ((cell, name), colour, range, numbers).
    """
    def text(words, size):
        return ("<c:tx><c:rich><a:bodyPr/><a:p><a:pPr><a:defRPr/></a:pPr>"
                f'<a:r><a:rPr lang="en-GB" sz="{size}" b="1"/><a:t>{escape(words)}</a:t></a:r>'
                "</a:p></c:rich></c:tx>")

    def points(values):
        return f'<c:ptCount val="{len(values)}"/>' + "".join(
            f'<c:pt idx="{i}"><c:v>{value}</c:v></c:pt>' for i, value in enumerate(values))

    def one(index, name, colour, area, numbers):
        return (
            f'<c:ser><c:idx val="{index}"/><c:order val="{index}"/>'
            f"<c:tx><c:strRef><c:f>{sheet}!{name[0]}</c:f>"
            f"<c:strCache>{points([name[1]])}</c:strCache></c:strRef></c:tx>"
            f'<c:spPr><a:solidFill><a:srgbClr val="{colour}"/></a:solidFill></c:spPr>'
            f"<c:cat><c:strRef><c:f>{sheet}!{categories[0]}</c:f>"
            f"<c:strCache>{points(categories[1])}</c:strCache></c:strRef></c:cat>"
            f"<c:val><c:numRef><c:f>{sheet}!{area}</c:f><c:numCache>"
            f"<c:formatCode>#,##0</c:formatCode>{points(numbers)}</c:numCache></c:numRef></c:val>"
            "</c:ser>")

    bars = "".join(one(index, *each) for index, each in enumerate(series))
    return (
        XML + f'<c:chartSpace xmlns:c="{DRAWING}/chart" xmlns:a="{DRAWING}/main"><c:chart>'
        f'<c:title>{text(title, 1400)}<c:overlay val="0"/></c:title>'
        '<c:autoTitleDeleted val="0"/><c:plotArea><c:layout/>'
        f'<c:barChart><c:barDir val="col"/><c:grouping val="clustered"/>{bars}'
        '<c:gapWidth val="80"/><c:axId val="1"/><c:axId val="2"/></c:barChart>'
        '<c:catAx><c:axId val="1"/><c:scaling/><c:delete val="0"/><c:axPos val="b"/>'
        '<c:crossAx val="2"/></c:catAx>'
        '<c:valAx><c:axId val="2"/><c:scaling/><c:delete val="0"/><c:axPos val="l"/>'
        '<c:majorGridlines><c:spPr><a:ln><a:solidFill><a:srgbClr val="C8D2DA"/></a:solidFill></a:ln>'
        '</c:spPr></c:majorGridlines><c:numFmt formatCode="#,##0" sourceLinked="0"/>'
        '<c:crossAx val="1"/></c:valAx></c:plotArea>'
        '<c:legend><c:legendPos val="b"/></c:legend></c:chart></c:chartSpace>')


def chart_drawing(first, last):
    """Where the chart stands: from one cell (column, row) to another, counted from 0."""
    def corner(name, place):
        return (f"<xdr:{name}><xdr:col>{place[0]}</xdr:col><xdr:colOff>0</xdr:colOff>"
                f"<xdr:row>{place[1]}</xdr:row><xdr:rowOff>0</xdr:rowOff></xdr:{name}>")

    return (
        XML + f'<xdr:wsDr xmlns:xdr="{DRAWING}/spreadsheetDrawing" xmlns:a="{DRAWING}/main">'
        f'<xdr:twoCellAnchor>{corner("from", first)}{corner("to", last)}'
        '<xdr:graphicFrame macro=""><xdr:nvGraphicFramePr><xdr:cNvPr id="2" name="Chart"/>'
        "<xdr:cNvGraphicFramePr/></xdr:nvGraphicFramePr><xdr:xfrm><a:off x=\"0\" y=\"0\"/>"
        '<a:ext cx="0" cy="0"/></xdr:xfrm><a:graphic>'
        f'<a:graphicData uri="{DRAWING}/chart"><c:chart xmlns:c="{DRAWING}/chart" '
        f'xmlns:r="{OFFICE}" r:id="rId1"/></a:graphicData></a:graphic></xdr:graphicFrame>'
        "<xdr:clientData/></xdr:twoCellAnchor></xdr:wsDr>")


def write_xlsx(name, title, sheets):
    """sheets is a list of (sheet name, worksheet XML, None or (chart XML, drawing XML))."""
    parts = {
        "xl/styles.xml": (f"{TYPES}.styles+xml", styles()),
        "docProps/core.xml": core_properties(title),
    }
    links = [("rId0", "styles", "styles.xml")]
    entries = ""
    for number, (sheet_name, xml, chart) in enumerate(sheets, 1):
        links.append((f"rId{number}", "worksheet", f"worksheets/sheet{number}.xml"))
        entries += f'<sheet name="{escape(sheet_name)}" sheetId="{number}" r:id="rId{number}"/>'
        parts[f"xl/worksheets/sheet{number}.xml"] = (f"{TYPES}.worksheet+xml", xml)
        if chart:
            drawing = "application/vnd.openxmlformats-officedocument.drawing"
            parts[f"xl/worksheets/_rels/sheet{number}.xml.rels"] = (
                None, relationships([("rId1", "drawing", f"../drawings/drawing{number}.xml")]))
            parts[f"xl/drawings/drawing{number}.xml"] = (f"{drawing}+xml", chart[1])
            parts[f"xl/drawings/_rels/drawing{number}.xml.rels"] = (
                None, relationships([("rId1", "chart", f"../charts/chart{number}.xml")]))
            parts[f"xl/charts/chart{number}.xml"] = (f"{drawing}ml.chart+xml", chart[0])
    parts["xl/workbook.xml"] = (f"{TYPES}.sheet.main+xml",
                                XML + f"<workbook {MAIN}><sheets>{entries}</sheets></workbook>")
    parts["xl/_rels/workbook.xml.rels"] = (None, relationships(links))
    write_package(name, "xl/workbook.xml", parts)

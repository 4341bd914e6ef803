#!/usr/bin/python3
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

"""Checks a PDF file object by object: check_pdf.py tagged|archive FILE.

Says what is wrong, one fault a line, and ends with status 1; says nothing of a good file. Checks
no more than is written here: whether a file is PDF/A as a whole, only a validator can tell.
"""

import re
import sys

import pikepdf

# The elements of a table, and what each of them may hold.
CHILDREN = {
    "/Document": {"/Table", "/P"},
    "/Table": {"/THead", "/TBody"},
    "/THead": {"/TR"},
    "/TBody": {"/TR"},
    "/TR": {"/TH", "/TD"},
    "/TH": set(),
    "/TD": set(),
    "/P": set(),
}

faults = []


def require(condition, fault):
    if not condition:
        faults.append(fault)


def listed(value):
    """The children of an element, which may be one or many."""
    if value is None:
        return []
    return list(value) if isinstance(value, pikepdf.Array) else [value]


def marked_contents(page):
    """The tags of a page's marked contents by their numbers, checking that all marks are nested."""
    marks = {}
    stack = []
    in_text = False
    for operands, operator in pikepdf.parse_content_stream(page):
        name = str(operator)
        if name in ("BDC", "BMC"):
            stack.append(in_text)
            properties = operands[1] if len(operands) > 1 else {}
            if "/MCID" in properties:
                number = int(properties["/MCID"])
                require(number not in marks, f"marked content {number} twice on a page")
                marks[number] = str(operands[0])
        elif name == "EMC":
            require(bool(stack), "a mark ends that has not begun")
            if stack:
                require(stack.pop() == in_text, "a mark and a text object cross")
        elif name == "BT":
            require(not in_text, "text objects within each other")
            in_text = True
        elif name == "ET":
            in_text = False
        elif name in ("Tj", "TJ", "S", "f", "f*", "B", "Do"):
            require(bool(stack), f"{name} outside of all marks")
    require(not stack, "a mark does not end")
    return marks


def check_element(element, parent, contents, seen):
    role = str(element.S)
    require(role in CHILDREN, f"the role {role} is none of the standard ones used")
    require(element.P.objgen == parent.objgen, f"{role} {element.objgen} has another parent")
    require(element.objgen not in seen, f"{role} {element.objgen} hangs in two places")
    seen.add(element.objgen)
    if role == "/TH":
        require(str(element.A.Scope) == "/Column", "a title says nothing of its scope")
    for child in listed(element.get("/K")):
        if isinstance(child, int):
            marks, owners = contents[element.Pg.objgen]
            require(marks.get(child) == role, f"marked content {child} is no {role}")
            require(owners[child].objgen == element.objgen, f"{child} leads to another element")
            owners[child] = None
        else:
            require(str(child.S) in CHILDREN.get(role, ()), f"{child.S} within {role}")
            check_element(child, element, contents, seen)


def check_tagged(pdf):
    root = pdf.Root
    require(bool(root.MarkInfo.Marked), "the file is not said to be tagged")
    require("/Lang" in root, "no language")
    require(bool(root.ViewerPreferences.DisplayDocTitle), "the title is not shown")
    tree = root.StructTreeRoot
    require("/RoleMap" in tree, "no role map")
    numbers = list(tree.ParentTree.Nums)
    parents = {int(numbers[i]): numbers[i + 1] for i in range(0, len(numbers), 2)}
    require(int(tree.ParentTreeNextKey) == len(pdf.pages), "the next key is another")
    contents = {}
    for page in pdf.pages:
        require(str(page.Tabs) == "/S", "tab order is not the structure's")
        owners = list(parents[int(page.StructParents)])
        marks = marked_contents(page)
        require(sorted(marks) == list(range(len(owners))), "marks and owners are not the same")
        contents[page.objgen] = (marks, owners)
    check_element(tree.K, tree, contents, set())
    for _, owners in contents.values():
        require(not any(owners), "marked contents that the tree does not reach")
    check_outline(pdf)


def check_outline(pdf):
    with pdf.open_outline() as outline:
        leaves = [leaf for group in outline.root for leaf in group.children]
        require(len(leaves) == len(pdf.pages), "the outline does not lead to every page")
        for leaf, page in zip(leaves, pdf.pages):
            require(leaf.destination[0].objgen == page.objgen, "the outline leads elsewhere")


def check_fonts(pdf):
    for page in pdf.pages:
        for name, font in page.Resources.get("/Font", {}).items():
            descendant = font.DescendantFonts[0]
            descriptor = descendant.FontDescriptor
            require(re.match(r"/[A-Z]{6}\+", str(font.BaseFont)), f"{name} is no subset")
            require("/FontFile2" in descriptor or "/FontFile3" in descriptor, f"{name} is not embedded")
            require("/ToUnicode" in font, f"{name} does not say its characters")
            if str(descendant.Subtype) == "/CIDFontType2":
                require("/CIDToGIDMap" in descendant, f"{name} has no map to glyphs")
            require(isinstance(font.Encoding, pikepdf.Stream), f"{name} embeds no character map")
            same = font.Encoding.CIDSystemInfo == descendant.CIDSystemInfo
            require(same, f"{name} and its codes name other collections")


def check_archive(pdf):
    root = pdf.Root
    require(not pdf.is_encrypted, "the file is encrypted")
    require("/ID" in pdf.trailer, "no identifier")
    intent = root.OutputIntents[0]
    require(str(intent.S) == "/GTS_PDFA1", "the output intent is none of PDF/A")
    profile = intent.DestOutputProfile
    require(int(profile.N) == 3, "the profile has not three colours")
    require(profile.read_bytes()[36:40] == b"acsp", "the profile is no ICC profile")
    require("/Filter" not in root.Metadata, "the metadata is packed")
    with pdf.open_metadata() as metadata:
        require(metadata.get("pdfaid:part") == "2", "the metadata names another part")
        require(metadata.get("pdfaid:conformance") == "B", "the metadata names another level")
        require(metadata.get("dc:title") == str(pdf.docinfo.get("/Title", "")) or
                "/Title" not in pdf.docinfo, "the titles differ")
        require(metadata.get("pdf:Producer") == str(pdf.docinfo.Producer), "the producers differ")
        require(metadata.get("xmp:CreatorTool") == str(pdf.docinfo.Creator), "the creators differ")
        date = re.sub(r"\D", "", str(pdf.docinfo.CreationDate))
        require(re.sub(r"\D", "", metadata.get("xmp:CreateDate")) == date, "the dates differ")
    for forbidden in ("/AA", "/OpenAction", "/AcroForm", "/Names", "/OCProperties"):
        require(forbidden not in root, f"{forbidden} in an archive's file")
    for page in pdf.pages:
        for picture in page.Resources.get("/XObject", {}).values():
            require(not picture.get("/Interpolate", False), "a picture is interpolated")
            require("/Alternates" not in picture, "a picture has alternates")
        require("/ExtGState" not in page.Resources, "a graphics state may make things transparent")


def main():
    kind, name = sys.argv[1:]
    with pikepdf.open(name) as pdf:
        check_fonts(pdf)
        {"tagged": check_tagged, "archive": check_archive}[kind](pdf)
    print("\n".join(faults), end="")
    sys.exit(1 if faults else 0)


main()

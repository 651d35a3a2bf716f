"""What the benchmarks of whole documents share."""

import shutil
import zipfile

# What the drivers wait in any case, in seconds: between two readings of the output's size, and
# after PowerPoint's presentation is closed.
FIXED_WAIT = {"doc": 0.1, "docx": 0.1, "xls": 0.1, "xlsx": 0.1, "pub": 0.1,
              "ppt": 2.3, "pptx": 2.3, "pps": 2.3, "ppsx": 2.3}

PROFILE = """<?xml version="1.0" encoding="UTF-8"?>
<oor:items xmlns:oor="http://openoffice.org/2001/registry">
<item oor:path="/org.openoffice.Setup/Product"><prop oor:name="ooSetupLastVersion" oor:op="fuse"><value>7.4</value></prop></item>
</oor:items>
"""


def make_documents(sources, count, folder):
    """Copies of documents, no two with the same bytes, so that none is known from another."""
    folder.mkdir()
    for number in range(count):
        source = sources[number % len(sources)]
        copy = folder / f"{number:03}-{source.name}"
        shutil.copyfile(source, copy)
        if zipfile.is_zipfile(copy):
            with zipfile.ZipFile(copy, "a") as package:
                package.comment = b"copy %d" % number
        else:  # a sector behind the last one of a compound file
            with open(copy, "ab") as file:
                file.write((b"copy %d" % number).ljust(512, b"\0"))
    return sorted(folder.iterdir())


def seed_profile(folder):
    """A user folder that LibreOffice finds in order."""
    shutil.rmtree(folder, ignore_errors=True)
    (folder / "user").mkdir(parents=True)
    (folder / "user" / "registrymodifications.xcu").write_text(PROFILE)

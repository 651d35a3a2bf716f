"""Compound files with streams in their root storage, as the binary formats have them."""

import struct

SECTOR, MINI_SECTOR, MINI_LIMIT = 512, 64, 4096
FREE, END, FAT = 0xFFFFFFFF, 0xFFFFFFFE, 0xFFFFFFFD
MAGIC = bytes.fromhex("D0CF11E0A1B11AE1")


def read_streams(data):
    """The streams {name: bytes} of a compound file, and its class id."""
    def sector(number):
        return data[SECTOR * (number + 1):SECTOR * (number + 2)]

    def numbers(chunk):
        return list(struct.unpack(f"<{len(chunk) // 4}I", chunk))

    def chain(table, start):
        while start < FREE - 5:
            yield start
            start = table[start]

    fat = [entry for number in numbers(data[76:512]) if number < FREE - 5
           for entry in numbers(sector(number))]
    directory_start, _, _, mini_start = struct.unpack("<4I", data[48:64])
    directory = b"".join(sector(number) for number in chain(fat, directory_start))
    mini_fat = numbers(b"".join(sector(number) for number in chain(fat, mini_start)))
    root_start = struct.unpack("<I", directory[116:120])[0]
    mini = b"".join(sector(number) for number in chain(fat, root_start))
    streams = {}
    for at in range(128, len(directory), 128):
        entry = directory[at:at + 128]
        length, kind = struct.unpack("<HB", entry[64:67])
        start, size = struct.unpack("<II", entry[116:124])
        if kind != 2:
            continue
        if size < MINI_LIMIT:
            content = b"".join(mini[MINI_SECTOR * n:MINI_SECTOR * (n + 1)]
                               for n in chain(mini_fat, start))
        else:
            content = b"".join(sector(number) for number in chain(fat, start))
        streams[entry[:length - 2].decode("utf-16-le")] = content[:size]
    return streams, directory[80:96]


def padded(content, size, filler=b"\0"):
    return content + filler * (-len(content) % size)


def write_streams(streams, class_id):
    """A compound file with the streams {name: bytes}."""
    fat, sectors, mini_fat, mini = [], b"", [], b""

    def store(content):
        """Appends sectors, as one chain; answers the first."""
        nonlocal sectors
        if not content:
            return END
        first = len(fat)
        sectors += padded(content, SECTOR)
        fat.extend(range(first + 1, len(sectors) // SECTOR))
        fat.append(END)
        return first

    def store_mini(content):
        nonlocal mini
        if not content:
            return END
        first = len(mini_fat)
        mini += padded(content, MINI_SECTOR)
        mini_fat.extend(range(first + 1, len(mini) // MINI_SECTOR))
        mini_fat.append(END)
        return first

    def entry(name, kind, right, child, start, size):
        words = (name + "\0").encode("utf-16-le")
        return (padded(words, 64) + struct.pack("<HBB3I", len(words), kind, 1, FREE, right, child)
                + (class_id if kind == 5 else bytes(16)) + bytes(20)
                + struct.pack("<IQ", start, size))

    # Each entry hangs to the right of the one before: they must be in the order of their names.
    names = sorted(streams, key=lambda name: (len(name), name.upper()))
    entries = b""
    for number, name in enumerate(names, 1):
        content = streams[name]
        start = (store_mini if len(content) < MINI_LIMIT else store)(content)
        right = number + 1 if number < len(names) else FREE
        entries += entry(name, 2, right, FREE, start, len(content))
    root = entry("Root Entry", 5, FREE, 1, store(mini), len(mini))
    directory = store(padded(root + entries, SECTOR))
    mini_table = struct.pack(f"<{len(mini_fat)}I", *mini_fat)
    mini_start = store(padded(mini_table, SECTOR, b"\xFF"))
    mini_sectors = -(-len(mini_table) // SECTOR)
    fat_sectors = 1
    while fat_sectors * SECTOR // 4 < len(fat) + fat_sectors:
        fat_sectors += 1
    places = list(range(len(fat), len(fat) + fat_sectors))
    fat += fat_sectors * [FAT]
    header = (MAGIC + bytes(16) + struct.pack("<5H", 0x3E, 3, 0xFFFE, 9, 6) + bytes(6)
              + struct.pack("<9I", 0, fat_sectors, directory, 0, MINI_LIMIT, mini_start,
                            mini_sectors, END, 0)
              + padded(struct.pack(f"<{len(places)}I", *places), 436, b"\xFF"))
    return header + sectors + padded(struct.pack(f"<{len(fat)}I", *fat), SECTOR, b"\xFF")

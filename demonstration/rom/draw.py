#!/usr/bin/env python3
"""draw.py NAME HUE DIRECTORY: what estrelas.s includes, for a game of that name whose sky has that hue (0 to 360).
draw.py --title NAME: the name alone in the same letters, as a PAM picture with alpha on the standard output."""
import colorsys
import math
import os
import random
import struct
import sys
import unicodedata

WIDTH, HEIGHT = 256, 224
OUTLINE, LIGHT, SHADE = 1, 2, 3  # a layer's colours; 0 is what lies behind
ABOVE, LETTER, BELOW = 3, 7, 2  # rows of a glyph: accent, letter, cedilla
TITLE_TOP, TITLE_HEIGHT = 24, 80  # the lines that the program waves

MARKS = {  # rows above or below the letter, five columns
    "\u0300": (".#...", "..#..", "....."),
    "\u0301": ("...#.", "..#..", "....."),
    "\u0302": ("..#..", ".#.#.", "....."),
    "\u0303": (".##.#", "#.##.", "....."),
    "\u0327": ("..#..", ".##.."),
}


def load_font():
    name = os.path.join(os.path.dirname(os.path.abspath(__file__)), "font.txt")
    with open(name, encoding="ascii") as file:
        rows = [line.split() for line in file]
    return {row[0]: row[1:] for row in rows}


FONT = load_font()


def glyphs(text):
    """The glyphs of a text, each a list of rows."""
    made = []
    for char in unicodedata.normalize("NFD", text.upper()):
        if char in MARKS:
            rows, top = MARKS[char], 0 if len(MARKS[char]) == ABOVE else ABOVE + LETTER
            for y, row in enumerate(rows):
                made[-1][top + y] = row[:len(made[-1][ABOVE])]
        else:
            letter = FONT.get(char, ["..."] * LETTER)
            empty = "." * len(letter[0])
            made.append([empty] * ABOVE + list(letter) + [empty] * BELOW)
    return made


def text_points(text, scale):
    """The points of a text from its left top, and its width; letters have SHADE in their lower half."""
    points, x = {}, 0
    for glyph in glyphs(text):
        for y, row in enumerate(glyph):
            for column, dot in enumerate(row):
                for i in range(scale * scale if dot == "#" else 0):
                    colour = LIGHT if y < ABOVE + 4 else SHADE
                    points[(x + column) * scale + i % scale, y * scale + i // scale] = colour
        x += len(glyph[0]) + 1
    return points, (x - 1) * scale


def outlined(points):
    around = {(x + dx, y + dy): OUTLINE for x, y in points for dx in (-1, 0, 1) for dy in (-1, 0, 1)}
    return {**around, **points}


def wrapped(text, scale, width):
    lines = [""]
    for word in text.split():
        longer = (lines[-1] + " " + word).strip()
        if text_points(longer, scale)[1] <= width or not lines[-1]:
            lines[-1] = longer
        else:
            lines.append(word)
            # A short word goes with the next one.
            *before, last = lines[-2].split()
            if before and len(last) <= 2 and text_points(last + " " + word, scale)[1] <= width:
                lines[-2:] = [" ".join(before), last + " " + word]
    return lines


def block(text, width, height):
    """The text as large as one or two lines allow, outlined, in the middle of the given box."""
    for scale in (3, 2, 1):
        lines = wrapped(text, scale, width - 4)
        pitch = (ABOVE + LETTER + BELOW) * scale
        if pitch * len(lines) <= height and all(text_points(line, scale)[1] <= width - 4 for line in lines):
            break
    top = (height - pitch * len(lines)) // 2
    points = {}
    for number, line in enumerate(lines):
        line_points, line_width = text_points(line, scale)
        left = (width - line_width) // 2
        points.update({(left + x, top + number * pitch + y): c for (x, y), c in line_points.items()})
    return outlined(points)


class Screen:
    def __init__(self):
        self.dots = [bytearray(WIDTH) for _ in range(HEIGHT)]

    def put(self, points, left, top):
        for (x, y), colour in points.items():
            if 0 <= x + left < WIDTH and 0 <= y + top < HEIGHT:
                self.dots[y + top][x + left] = colour

    def hills(self, seed):
        shape = random.Random(seed)
        waves = [(shape.uniform(4, 14), shape.randint(1, 4), shape.uniform(0, 6.28)) for _ in range(4)]
        for x in range(WIDTH):
            height = 48 + sum(a * math.sin(n * 2 * math.pi * x / WIDTH + p) for a, n, p in waves)
            for y in range(HEIGHT - max(int(height), 34), HEIGHT):
                self.dots[y][x] = OUTLINE

    def tile(self, column, row):
        return tile_bytes([self.dots[row * 8 + y][column * 8:column * 8 + 8] for y in range(8)])


def tile_bytes(rows):
    """Eight rows of eight colours 0 to 3, as two planes."""
    planes = [(sum((dot & 1) << (7 - x) for x, dot in enumerate(row)),
               sum((dot >> 1) << (7 - x) for x, dot in enumerate(row))) for row in rows]
    return bytes(byte for pair in planes for byte in pair)


def digit_tile(digit):
    rows = [bytearray(8) for _ in range(8)]
    for y, row in enumerate(FONT[str(digit)]):
        for x, dot in enumerate(row):
            rows[y][x + 1] = LIGHT if dot == "#" else OUTLINE
    return tile_bytes([bytes(dot or OUTLINE for dot in row) for row in rows])


def text_layer(name):
    screen = Screen()
    screen.hills(name)
    screen.put(block(name, WIDTH, TITLE_HEIGHT), 0, TITLE_TOP)
    screen.put(text_points("Partida", 1)[0], 92, 197)
    screen.put(text_points("Feito para o Tolvaris", 1)[0], 68, 208)
    tiles = [bytes(16)] + [digit_tile(digit) for digit in range(10)]
    numbers = {tiles[0]: 0}
    words = []
    for row in range(HEIGHT // 8):
        for column in range(WIDTH // 8):
            tile = screen.tile(column, row)
            if tile not in numbers:
                numbers[tile] = len(tiles)
                tiles.append(tile)
            words.append(numbers[tile])
    words += [0] * (1024 - len(words))
    return b"".join(tiles), struct.pack("<1024H", *words)


def star_layer():
    shapes = (("#",), ("#",), (".#.", "###", ".#."))
    tiles = [bytes(16)]
    for shape in shapes:
        rows = [bytearray(8) for _ in range(8)]
        for y, row in enumerate(shape):
            for x, dot in enumerate(row):
                rows[y + 2][x + 2] = len(tiles) if dot == "#" else 0
        tiles.append(tile_bytes(rows))
    sky = random.Random(7)
    words = [sky.choice((1, 1, 2, 2, 3)) if sky.random() < 0.07 else 0 for _ in range(1024)]
    # Turned over, the same star lies elsewhere in its tile.
    words = [word | sky.randrange(4) << 14 if word else 0 for word in words]
    return b"".join(tiles), struct.pack("<1024H", *words)


def colour(hue, saturation, value):
    red, green, blue = (int(part * 31) for part in colorsys.hsv_to_rgb(hue / 360 % 1, saturation, value))
    return red | green << 5 | blue << 10


def sky_colours(hue):
    angles = [2 * math.pi * i / 64 for i in range(64)]
    return [colour(hue + 40 * math.sin(angle), 0.8, 0.5 + 0.22 * math.cos(angle)) for angle in angles]


def layer_colours(hue):
    text = (0, colour(hue, 0.7, 0.13), colour(50, 0.15, 1), colour(42, 0.75, 1))
    near = (0, colour(0, 0, 0.75), colour(50, 0.4, 1), colour(0, 0, 1))
    far = (0, colour(hue, 0.3, 0.6), colour(hue, 0.3, 0.7), colour(hue, 0.25, 0.8))
    return b"".join(struct.pack("<B4H", first, *colours) for first, colours in ((0, text), (32, near), (64, far)))


def ascii_name(name):
    plain = unicodedata.normalize("NFD", name.upper()).encode("ascii", "ignore")
    return plain[:21].ljust(21)


def write_parts(name, hue, directory):
    text_tiles, text_map = text_layer(name)
    star_tiles, star_map = star_layer()
    sine = struct.pack("<64h", *(round(4 * math.sin(2 * math.pi * i / 64)) for i in range(64)))
    parts = {"text.tiles": text_tiles, "text.map": text_map, "stars.tiles": star_tiles, "stars.map": star_map,
             "sky.colours": struct.pack("<64H", *sky_colours(hue)), "layers.colours": layer_colours(hue),
             "sine.words": sine, "name.text": ascii_name(name)}
    for part, content in parts.items():
        with open(os.path.join(directory, part), "wb") as file:
            file.write(content)


def title_picture(name):
    width, height = 200, 60
    points = block(name, width, height)
    shown = {None: bytes(4), OUTLINE: b"\x1b\x22\x3c\xff", LIGHT: b"\xff\xf9\xe4\xff", SHADE: b"\xff\xc8\x3d\xff"}
    pixels = b"".join(shown[points.get((x, y))] for y in range(height) for x in range(width))
    header = f"P7\nWIDTH {width}\nHEIGHT {height}\nDEPTH 4\nMAXVAL 255\nTUPLTYPE RGB_ALPHA\nENDHDR\n"
    return header.encode() + pixels


if sys.argv[1:2] == ["--title"] and len(sys.argv) == 3:
    sys.stdout.buffer.write(title_picture(sys.argv[2]))
elif len(sys.argv) == 4:
    write_parts(sys.argv[1], float(sys.argv[2]), sys.argv[3])
else:
    sys.exit(__doc__)

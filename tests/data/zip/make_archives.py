#!/usr/bin/env python3
"""Lays out the archives of this folder byte by byte, without the engine that the tests compare with them.

Needs the program `openssl` for the AES blocks. Usage: make_archives.py [folder]
"""

import bz2
import hashlib
import hmac
import struct
import subprocess
import sys
import zlib
from pathlib import Path

FOLDER = Path(sys.argv[1] if len(sys.argv) > 1 else Path(__file__).parent)

CLOCK = 1700000000  # 2023-11-14 22:13:20 UTC
DATE = ((2023 - 1980) << 9) | (11 << 5) | 14
TIME = (22 << 11) | (13 << 5) | (20 // 2)
FILE_ATTRIBUTES = ((0x8000 | 0o664) << 16) | 0x20
PASSWORD = b"barn red"

DOCUMENT = b"".join(b"<Color Name=\"Harbor Blue %d\" L=\"%d.5\"/>\r\n" % (i % 7, i) for i in range(60))
SHORT = DOCUMENT[:19]

STORED, DEFLATED, BZIP2, AES = 0, 8, 12, 99


def deflate(data):
    stream = zlib.compressobj(-1, zlib.DEFLATED, -15, 8)
    return stream.compress(data) + stream.flush()


class Entry:
    def __init__(self, name, data, method, packed=None):
        self.name, self.method, self.flags, self.extra = name, method, 0, b""
        self.needed = 46 if method == BZIP2 else 20
        self.crc, self.size = zlib.crc32(data), len(data)
        if packed is None:
            packed = {STORED: lambda: data, DEFLATED: lambda: deflate(data), BZIP2: lambda: bz2.compress(data, 6)}[method]()
        self.packed, self.disk, self.offset = packed, 0, 0

    def local(self):
        crc, packed, size = (0, 0, 0) if self.flags & 8 else (self.crc, len(self.packed), self.size)
        return struct.pack("<4sHHHHHIIIHH", b"PK\3\4", self.needed, self.flags, self.method, TIME, DATE, crc, packed,
                           size, len(self.name), len(self.extra)) + self.name + self.extra

    def descriptor(self):
        if not self.flags & 8:
            return b""
        return struct.pack("<4sIII", b"PK\7\10", self.crc, len(self.packed), self.size)

    def central(self):
        return struct.pack("<4sHHHHHHIIIHHHHHII", b"PK\1\2", 46, self.needed, self.flags, self.method, TIME, DATE,
                           self.crc, len(self.packed), self.size, len(self.name), len(self.extra), 0, self.disk, 0,
                           FILE_ATTRIBUTES, self.offset) + self.name + self.extra


def end_record(count, size, offset, comment=b"", disk=0, directory_disk=0, here=None):
    return struct.pack("<4sHHHHIIH", b"PK\5\6", disk, directory_disk, count if here is None else here, count, size,
                       offset, len(comment)) + comment


def archive(entries, comment=b""):
    body = b""
    for entry in entries:
        entry.offset = len(body)
        body += entry.local() + entry.packed + entry.descriptor()
    directory = b"".join(entry.central() for entry in entries)
    return body + directory + end_record(len(entries), len(directory), len(body), comment)


class CRandom:
    """The `rand` of the Windows C runtime."""

    def __init__(self, seed):
        self.state = seed & 0xFFFFFFFF

    def next(self):
        self.state = (self.state * 214013 + 2531011) & 0xFFFFFFFF
        return (self.state >> 16) & 0x7FFF


def traditional(name, data, password):
    """APPNOTE 6.1."""
    table = [0] * 256
    for i in range(256):
        c = i
        for _ in range(8):
            c = (c >> 1) ^ (0xEDB88320 if c & 1 else 0)
        table[i] = c
    keys = [0x12345678, 0x23456789, 0x34567890]

    def update(byte):
        keys[0] = table[(keys[0] ^ byte) & 0xFF] ^ (keys[0] >> 8)
        keys[1] = ((keys[1] + (keys[0] & 0xFF)) * 134775813 + 1) & 0xFFFFFFFF
        keys[2] = table[(keys[2] ^ (keys[1] >> 24)) & 0xFF] ^ (keys[2] >> 8)

    for byte in password:
        update(byte)
    random = CRandom(CLOCK)
    header = bytearray()
    for _ in range(10):
        drawn = random.next()
        header.append((drawn >> 6) & 0xFF or drawn & 0xFF)
    header += struct.pack("<H", TIME)
    entry = Entry(name, data, DEFLATED)
    packed = bytearray()
    for byte in bytes(header) + entry.packed:
        low = (keys[2] & 0xFFFF) | 2
        packed.append(byte ^ (((low * (low ^ 1)) >> 8) & 0xFF))
        update(byte)
    entry.packed, entry.flags = bytes(packed), 9
    return entry


def sha1_compress(state, block):
    """FIPS 180-4, 6.1.2."""
    def rotate(x, n):
        return ((x << n) | (x >> (32 - n))) & 0xFFFFFFFF

    w = list(struct.unpack(">16I", block))
    for t in range(16, 80):
        w.append(rotate(w[t - 3] ^ w[t - 8] ^ w[t - 14] ^ w[t - 16], 1))
    a, b, c, d, e = state
    for t in range(80):
        if t < 20:
            f, k = (b & c) | (~b & d), 0x5A827999
        elif t < 40:
            f, k = b ^ c ^ d, 0x6ED9EBA1
        elif t < 60:
            f, k = (b & c) | (b & d) | (c & d), 0x8F1BBCDC
        else:
            f, k = b ^ c ^ d, 0xCA62C1D6
        a, b, c, d, e = (rotate(a, 5) + (f & 0xFFFFFFFF) + e + k + w[t]) & 0xFFFFFFFF, a, rotate(b, 30), c, d
    return [(x + y) & 0xFFFFFFFF for x, y in zip(state, (a, b, c, d, e))]


class RandomPool:
    """The pool on an entropy source that counts 0, 1, 2 ..."""

    HALF = 260

    def __init__(self):
        self.counter, self.position = 0, 0
        self.first, self.second = bytearray(self.HALF), bytearray(self.HALF)
        self.fill()
        for _ in range(20):
            self.mix(self.first)
        self.fill()

    def mix(self, half):
        for step in range(0, self.HALF, 20):
            before = self.HALF - 20 if step == 0 else step - 20
            state = list(struct.unpack(">5I", half[before:before + 20]))
            block = bytes(half[(step + i) % self.HALF] for i in range(64))
            half[step:step + 20] = struct.pack(">5I", *sha1_compress(state, block))

    def fill(self):
        self.second = bytearray(self.first)
        drawn = bytearray()
        while len(drawn) < self.HALF:
            drawn += bytes((self.counter + i) & 0xFF for i in range(8))
            self.counter += 8
        self.first = bytearray((x ^ ~y) & 0xFF for x, y in zip(drawn, self.second))
        self.mix(self.first)
        self.mix(self.second)
        self.position = 0

    def read(self, size):
        out = bytearray()
        while len(out) < size:
            if self.position == self.HALF:
                self.fill()
            taken = self.second[self.position:self.position + size - len(out)]
            out += taken
            self.position += len(taken)
        return bytes(out)


def aes_entry(name, data, password, strength, method):
    """The WinZip AES specification, with the salt from the pool."""
    salt = RandomPool().read(4 + 4 * strength)
    key_size = 8 + 8 * strength
    keys = hashlib.pbkdf2_hmac("sha1", password, salt, 1000, 2 * key_size + 2)
    entry = Entry(name, data, method)
    counters = b"".join(struct.pack("<QQ", i + 1, 0) for i in range((len(entry.packed) + 15) // 16))
    stream = subprocess.run(["openssl", "enc", "-aes-%d-ecb" % (8 * key_size), "-nopad", "-K", keys[:key_size].hex()],
                            input=counters, stdout=subprocess.PIPE, check=True).stdout
    ciphered = bytes(x ^ y for x, y in zip(entry.packed, stream))
    code = hmac.new(keys[key_size:2 * key_size], ciphered, hashlib.sha1).digest()[:10]
    version = 2 if len(data) < 20 else 1
    entry.packed = salt + keys[2 * key_size:] + ciphered + code
    entry.extra = struct.pack("<HHHHBH", 0x9901, 7, version, 0x4541, strength, method)
    entry.method, entry.flags = AES, 1
    if version == 2:
        entry.crc = 0
    return entry


class Volumes:
    """A split archive: blocks are cut at the ends of volumes unless they must not be."""

    def __init__(self, size):
        self.size, self.volumes = size, [b""]
        self.write(b"PK\7\10", True)

    def write(self, data, whole):
        while data:
            room = self.size - len(self.volumes[-1])
            if room < (len(data) if whole else 1):
                self.volumes.append(b"")
                continue
            self.volumes[-1] += data[:room]
            data = data[room:]


def segmented(entries, size):
    out = Volumes(size)
    for entry in entries:
        entry.flags |= 8
        local = entry.local()
        out.write(local, True)
        entry.disk, entry.offset = len(out.volumes) - 1, len(out.volumes[-1]) - len(local)
        out.write(entry.packed, False)
        out.write(entry.descriptor(), True)
    directory = b"".join(entry.central() for entry in entries)
    if size - len(out.volumes[-1]) < len(directory) + 22:
        out.volumes.append(b"")
    disk, offset = len(out.volumes) - 1, len(out.volumes[-1])
    out.write(directory, True)
    out.write(end_record(len(entries), len(directory), offset, disk=disk, directory_disk=disk), True)
    return out.volumes


def main():
    files = {
        "document.txt": DOCUMENT,
        "short.txt": SHORT,
        "stored.zip": archive([Entry(b"document.txt", DOCUMENT, STORED)]),
        "deflated.zip": archive([Entry(b"document.txt", DOCUMENT, DEFLATED)]),
        "bzip2.zip": archive([Entry(b"document.txt", DOCUMENT, BZIP2)]),
        "traditional.zip": archive([traditional(b"document.txt", DOCUMENT, PASSWORD)]),
        "aes128.zip": archive([aes_entry(b"document.txt", DOCUMENT, PASSWORD, 1, DEFLATED)]),
        "aes192.zip": archive([aes_entry(b"document.txt", DOCUMENT, PASSWORD, 2, DEFLATED)]),
        "aes256.zip": archive([aes_entry(b"document.txt", DOCUMENT, PASSWORD, 3, DEFLATED)]),
        "aes256-bzip2.zip": archive([aes_entry(b"document.txt", DOCUMENT, PASSWORD, 3, BZIP2)]),
        "aes256-short.zip": archive([aes_entry(b"short.txt", SHORT, PASSWORD, 3, DEFLATED)]),
        "stub-in-front.zip": b"MZ this is a stub\r\n" + archive([Entry(b"document.txt", DOCUMENT, DEFLATED)]),
        "longest-comment-before.zip": archive([Entry(b"document.txt", DOCUMENT, DEFLATED)], b"c" * 65535),
        "longest-comment.zip": archive([Entry(b"document.txt", DOCUMENT, DEFLATED), Entry(b"short.txt", SHORT, STORED)],
                                       b"c" * 65535),
        "random_pool.bin": RandomPool().read(600),
    }
    volumes = segmented([Entry(b"document.txt", DOCUMENT, STORED), Entry(b"short.txt", SHORT, STORED)], 1000)
    for i, volume in enumerate(volumes[:-1]):
        files["segmented.z%02d" % (i + 1)] = volume
    files["segmented.zip"] = volumes[-1]
    for name, data in files.items():
        (FOLDER / name).write_bytes(data)


if __name__ == "__main__":
    main()

"""Reads what a host looks for in a Windows module's file: processor, exported names, libraries, resources."""
import struct

EXPORTS, IMPORTS, RESOURCES = 0, 1, 2
FOLDER = 0x80000000


class PortableExecutable:
    def __init__(self, data):
        self.data = data
        head = self.u32(0x3C)
        if data[:2] != b"MZ" or data[head:head + 4] != b"PE\0\0":
            raise ValueError("no program or library for Windows")
        self.processor, sections = struct.unpack_from("<HH", data, head + 4)
        options = head + 24
        self.is_64 = self.u16(options) == 0x20B
        self.directories = options + (112 if self.is_64 else 96)
        table = options + self.u16(head + 20)
        self.sections = [struct.unpack_from("<4I", data, table + 40 * i + 8) for i in range(sections)]

    def u16(self, at):
        return struct.unpack_from("<H", self.data, at)[0]

    def u32(self, at):
        return struct.unpack_from("<I", self.data, at)[0]

    def place(self, address):
        """Where in the file stands what is loaded to this address."""
        for size, start, _, raw in self.sections:
            if start <= address < start + size:
                return raw + address - start
        raise ValueError(f"nothing is loaded to {address:#x}")

    def directory(self, number):
        return self.place(self.u32(self.directories + 8 * number))

    def text(self, address):
        at = self.place(address)
        return self.data[at:self.data.index(b"\0", at)].decode("ascii")

    def exports(self):
        """The exported names; a function without one is listed as its number."""
        table = self.directory(EXPORTS)
        functions, count = self.u32(table + 20), self.u32(table + 24)
        names = self.place(self.u32(table + 32))
        return [self.text(self.u32(names + 4 * i)) for i in range(count)] + list(range(count, functions))

    def imports(self):
        """The names of the libraries that the system has to find."""
        table, names = self.directory(IMPORTS), []
        while self.u32(table + 12):
            names.append(self.text(self.u32(table + 12)).lower())
            table += 20
        return names

    def resources(self):
        """{(type, id, language): bytes}"""
        root, found = self.directory(RESOURCES), {}
        for path, leaf in self._leaves(root, 0):
            address, size = struct.unpack_from("<II", self.data, root + leaf)
            at = self.place(address)
            found[path] = self.data[at:at + size]
        return found

    def _leaves(self, root, folder):
        entries = self.u16(root + folder + 12) + self.u16(root + folder + 14)
        for i in range(entries):
            name, target = struct.unpack_from("<II", self.data, root + folder + 16 + 8 * i)
            if name & FOLDER:
                at = root + (name & ~FOLDER)
                name = self.data[at + 2:at + 2 + 2 * self.u16(at)].decode("utf-16-le")
            if target & FOLDER:
                for path, leaf in self._leaves(root, target & ~FOLDER):
                    yield (name, *path), leaf
            else:
                yield (name,), target

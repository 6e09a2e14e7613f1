"""Reduces what abidw writes to the interface of the library.

Classes of the public headers stay whole, but for private functions that are not virtual, which no
application can call. Of all other types only the name stays: another point release of Qt, or another
internal class, is no change, and where it matters it shows in the places and sizes of members.
Places in sources, and what the compiler alone decides, go; all object files become one.
"""

import re
import xml.etree.ElementTree as ElementTree

NAMESPACE = "HmiStateMachine"
CLASSES = ("class-decl", "union-decl")
DROPPED_ATTRIBUTES = ("filepath", "line", "column", "hash")


def is_virtual(member):
    return int(member.get("vtable-offset", "-1")) >= 0


def is_private(member):
    return member.get("access") == "private" and not is_virtual(member)


def is_kept_function(member):
    """Virtual, or there to be linked to; what is neither is inline or a constructor's declaration."""
    return is_virtual(member) or (
        not is_private(member) and member[0].get("elf-symbol-id") is not None)


def key_of(child):
    """By which a member is the same in two descriptions of its class."""
    subject = child[0] if len(child) else child
    return (child.tag, subject.get("mangled-name") or subject.get("name") or subject.get("type-id"),
            subject.get("elf-symbol-id"), child.get("vtable-offset"))


def place_of(child):
    if child.tag == "member-function":
        return (child.tag, int(child.get("vtable-offset", "-1")), child[0].get("mangled-name", ""),
                child[0].get("elf-symbol-id", ""))
    return (child.tag,)


class Type:
    """All that the object files say of one type."""

    def __init__(self, element, scope):
        self.element = element
        self.scope = scope  # of Type, or of a namespace's name
        self.access = None  # of a member type
        self.members = {}

    def add(self, element):
        if self.element.get("is-declaration-only") and not element.get("is-declaration-only"):
            self.element = element
        for child in element:
            if child.tag != "member-type":
                self.members.setdefault(key_of(child), child)

    def contents(self):
        if self.element.tag not in CLASSES:
            return list(self.element)
        return sorted(self.members.values(), key=place_of)  # data members stay in their order


class Reduction:
    def __init__(self, corpus, sources):
        self.sources = str(sources).rstrip("/") + "/"
        self.corpus = corpus
        self.types = {}
        self.reduced = {}
        for instruction in corpus.iter("abi-instr"):
            self.read(instruction, ())

    def read(self, parent, scope):
        for child in parent:
            if child.tag == "namespace-decl":
                self.read(child, scope + (child.get("name"),))
            elif "id" in child.attrib:
                self.read_type(child, scope)

    def read_type(self, element, scope):
        known = self.types.setdefault(element.get("id"), Type(element, scope))
        known.add(element)
        for member in element.findall("member-type"):
            inner = self.read_type(member[0], scope + (known,))
            inner.access = member.get("access")
        return known

    def is_public(self, known):
        path = known.element.get("filepath", "")
        return path.startswith(self.sources) and "/internal/" not in path \
            and NAMESPACE in known.scope

    def reach(self):
        """Reduces the public types, and all that they refer to."""
        waiting = [key for key, known in self.types.items()
                   if self.is_public(known) and not known.element.get("is-anonymous")]
        while waiting:
            key = waiting.pop()
            if key in self.reduced:
                continue
            known = self.types[key]
            reduced = self.reduce(known)
            self.reduced[key] = reduced
            for element in reduced.iter():
                for name in ("type-id", "naming-typedef-id", "method-class-id"):
                    if name in element.attrib:
                        waiting.append(element.get(name))
            waiting.extend(outer.element.get("id") for outer in known.scope if isinstance(outer, Type))

    def reduce(self, known):
        result = shell_of(known.element)
        if known.element.tag in CLASSES and not self.is_public(known):
            result.attrib.pop("size-in-bits", None)
            result.set("is-declaration-only", "yes")
            return result
        for child in known.contents():
            if child.tag == "member-function" and not is_kept_function(child):
                continue
            if child.tag == "enumerator" and not self.is_public(known):
                continue
            result.append(copy_of(child))
        return result

    def symbols(self):
        """The names of the symbols that belong to public classes and may be linked to."""
        private = {function.get("elf-symbol-id")
                   for known in self.types.values()
                   for member in known.members.values()
                   if member.tag == "member-function" and is_private(member)
                   for function in member}
        classes = {known.element.get("name").split("<")[0] for known in self.types.values()
                   if self.is_public(known) and known.element.tag in CLASSES}
        names = {symbol.get("name") for symbol in self.corpus.iter("elf-symbol")}
        return {name for name in names - private if class_of(name) in classes}

    def result(self):
        self.reach()
        corpus = ElementTree.Element("abi-corpus", {
            name: value for name, value in self.corpus.attrib.items()
            if name in ("version", "architecture", "soname")})
        symbols = self.symbols()
        for tag in ("elf-function-symbols", "elf-variable-symbols"):
            table = ElementTree.SubElement(corpus, tag)
            kept = [symbol for symbol in self.corpus.iterfind(f"{tag}/elf-symbol")
                    if symbol.get("name") in symbols]
            table.extend(sorted(kept, key=lambda symbol: symbol.get("name")))
        corpus.append(self.instruction())
        return corpus

    def instruction(self):
        """All types, in an order that does not depend on how they were found."""
        result = ElementTree.Element("abi-instr", {"address-size": "64", "path": NAMESPACE})
        namespaces = {(): result}
        for key, element in sorted(self.reduced.items(), key=self.order):
            known = self.types[key]
            if known.scope and isinstance(known.scope[-1], Type):
                outer = self.reduced[known.scope[-1].element.get("id")]
                member = ElementTree.SubElement(outer, "member-type", {"access": known.access or "public"})
                member.append(element)
                continue
            for depth in range(1, len(known.scope) + 1):
                scope = known.scope[:depth]
                if scope not in namespaces:
                    namespaces[scope] = ElementTree.SubElement(
                        namespaces[scope[:-1]], "namespace-decl", {"name": scope[-1]})
            namespaces[known.scope].append(element)
        return result

    def order(self, item):
        key, element = item
        return (element.tag, element.get("name", ""), key)


def shell_of(element):
    return ElementTree.Element(element.tag, {
        name: value for name, value in element.attrib.items() if name not in DROPPED_ATTRIBUTES})


def copy_of(element):
    result = shell_of(element)
    if element.tag == "function-decl":
        result.attrib.pop("size-in-bits", None)
    result.extend(copy_of(child) for child in element)
    return result


def class_of(symbol):
    """The class in the library's namespace that a mangled name begins with; None without one."""
    match = re.match(rf"_Z(?:T[VTIS]|Thn?\d+_|Tvn?\d+_n?\d+_)?NK?{len(NAMESPACE)}{NAMESPACE}(\d+)",
                     symbol)
    if not match:
        return None
    return symbol[match.end():match.end() + int(match.group(1))]


def reduce_file(source, target, sources):
    """False when nothing is left."""
    reduction = Reduction(ElementTree.parse(source).getroot(), sources)
    tree = ElementTree.ElementTree(reduction.result())
    ElementTree.indent(tree, " ")
    tree.write(target, encoding="utf-8")
    with open(target, "a", encoding="utf-8") as file:
        file.write("\n")
    return bool(reduction.reduced)

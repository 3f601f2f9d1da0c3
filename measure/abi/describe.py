#!/usr/bin/env python3
"""Prints the binary interface of the library, one fact per line, for scripts/abi.

    describe.py NM OBJECT CLASSES ARCHIVE

OBJECT contains the debug information of all public types, CLASSES is the compiler's list of classes
with their alignment, ARCHIVE is the library and NM the tool that lists its symbols. Every line
begins with its subject, and the output does not depend on the position of declarations.
"""

import itertools
import re
import subprocess
import sys

from elftools.elf.elffile import ELFFile

NAMESPACES = ("bd", "bdmv", "bdstreaming")
PLATFORM = re.compile(r"(KEVRO_\w+|Assert|g_u1Bduopmask)$")
# The kinds of symbols that only the library defines. Weak functions (inline functions and instances
# of templates) depend on the optimisation, and every caller has its own copy.
EXPORTED = "BDRTV"
KINDS = {
    "DW_TAG_class_type": "class",
    "DW_TAG_structure_type": "struct",
    "DW_TAG_union_type": "union",
    "DW_TAG_enumeration_type": "enum",
    "DW_TAG_typedef": "typedef",
}


def attribute(die, name, default=None):
    """The value of an attribute; texts are decoded."""
    if name not in die.attributes:
        return default
    value = die.attributes[name].value
    return value.decode() if isinstance(value, bytes) else value


def type_of(die):
    """The type of a declaration; None for void."""
    return die.get_DIE_from_attribute("DW_AT_type") if "DW_AT_type" in die.attributes else None


def qualified_name(die):
    """A name as written in a program; a template of the standard library without its arguments,
    which are internal to that library."""
    names = []
    while die is not None and die.tag != "DW_TAG_compile_unit":
        names.insert(0, attribute(die, "DW_AT_name", "(unnamed)"))
        die = die.get_parent()
    if names[0] == "std":
        return "std::" + names[-1].split("<")[0]
    return "::".join(names)


def type_name(die):
    """The name of a type, which for a pointer or reference includes the type it refers to."""
    if die is None:
        return "void"
    if die.tag == "DW_TAG_const_type":
        return type_name(type_of(die)) + " const"
    if die.tag == "DW_TAG_volatile_type":
        return type_name(type_of(die)) + " volatile"
    if die.tag == "DW_TAG_pointer_type":
        return type_name(type_of(die)) + "*"
    if die.tag == "DW_TAG_reference_type":
        return type_name(type_of(die)) + "&"
    if die.tag == "DW_TAG_rvalue_reference_type":
        return type_name(type_of(die)) + "&&"
    if die.tag == "DW_TAG_ptr_to_member_type":
        owner = die.get_DIE_from_attribute("DW_AT_containing_type")
        return f"{type_name(type_of(die))} {qualified_name(owner)}::*"
    if die.tag == "DW_TAG_subroutine_type":
        return f"{type_name(type_of(die))}({', '.join(parameters(die))})"
    if die.tag == "DW_TAG_array_type":
        bounds = [attribute(child, "DW_AT_upper_bound", -1) + 1 for child in die.iter_children()]
        return type_name(type_of(die)) + "".join(f"[{bound}]" for bound in bounds)
    return qualified_name(die)


def parameters(function):
    return [
        type_name(type_of(child))
        for child in function.iter_children()
        if child.tag == "DW_TAG_formal_parameter" and "DW_AT_artificial" not in child.attributes
    ]


def is_const(function):
    """Whether a member function is const: its object is."""
    for child in function.iter_children():
        if child.tag == "DW_TAG_formal_parameter" and "DW_AT_artificial" in child.attributes:
            pointer = type_of(child)
            if pointer.tag == "DW_TAG_const_type":
                pointer = type_of(pointer)
            return type_of(pointer).tag == "DW_TAG_const_type"
    return False


def slot_of(function):
    """The slot of a virtual function in the table, an expression with one constant."""
    operation, *bytes_of_number = function.attributes["DW_AT_vtable_elem_location"].value
    assert operation == 0x10, "DW_OP_constu"
    return sum((byte & 0x7F) << (7 * index) for index, byte in enumerate(bytes_of_number))


def slot_text(function):
    name = attribute(function, "DW_AT_name")
    const = " const" if is_const(function) else ""
    return f"{type_name(type_of(function))} {name}({', '.join(parameters(function))}){const}"


def describe_class(die, subject, alignments):
    name = qualified_name(die)
    size = attribute(die, "DW_AT_byte_size")
    lines = [f"{subject} size {size} align {alignments[name]}"]
    slots = []
    destructor = None
    for child in die.iter_children():
        if child.tag == "DW_TAG_inheritance":
            offset = attribute(child, "DW_AT_data_member_location", 0)
            lines.append(f"{subject} offset {offset} base {type_name(type_of(child))}")
        elif child.tag == "DW_TAG_member" and "DW_AT_data_member_location" in child.attributes:
            member = attribute(child, "DW_AT_name")
            member = f"{member}: {type_name(type_of(child))}"
            if member.startswith("_vptr"):
                member = "virtual table"
            offset = attribute(child, "DW_AT_data_member_location")
            lines.append(f"{subject} offset {offset} {member}")
        elif "DW_AT_vtable_elem_location" in child.attributes:
            slots.append((slot_of(child), slot_text(child)))
        elif "DW_AT_virtuality" in child.attributes:
            destructor = attribute(child, "DW_AT_name")
    if destructor:
        # Debug information omits the destructor's two slots; they are the slots that are left.
        taken = {slot for slot, _ in slots}
        free = itertools.filterfalse(taken.__contains__, itertools.count())
        slots.append((next(free), f"{destructor}(), which destroys"))
        slots.append((next(free), f"{destructor}(), which destroys and deletes"))
    lines.extend(f"{subject} slot {slot} {text}" for slot, text in sorted(slots))
    return lines


def without_aliases(die):
    while die.tag in ("DW_TAG_typedef", "DW_TAG_const_type"):
        die = type_of(die)
    return die


def describe_enumeration(die, subject):
    encoding = attribute(without_aliases(type_of(die)), "DW_AT_encoding")
    signed = encoding in (0x05, 0x06)  # DW_ATE_signed, DW_ATE_signed_char
    size = attribute(die, "DW_AT_byte_size")
    lines = [f"{subject} size {size} {'signed' if signed else 'unsigned'}"]
    for child in die.iter_children():
        value = attribute(child, "DW_AT_const_value")
        lines.append(f"{subject} {attribute(child, 'DW_AT_name')} = {value}")
    return lines


def describe_typedef(die, subject):
    size = attribute(without_aliases(die), "DW_AT_byte_size")  # none for a pointer to member
    return [f"{subject} = {type_name(type_of(die))}" + (f", size {size}" if size else "")]


def describe_type(die, alignments):
    subject = f"{KINDS[die.tag]} {qualified_name(die)}"
    if die.tag == "DW_TAG_enumeration_type":
        return describe_enumeration(die, subject)
    if die.tag == "DW_TAG_typedef":
        return describe_typedef(die, subject)
    return describe_class(die, subject, alignments)


def public_types(die, public=False):
    """The types that the library's namespaces and the platform interface define."""
    for child in die.iter_children():
        name = attribute(child, "DW_AT_name", "")
        if child.tag == "DW_TAG_namespace":
            if public or name in NAMESPACES:
                yield from public_types(child, True)
        elif child.tag in KINDS and (public or PLATFORM.match(name)):
            if "DW_AT_declaration" not in child.attributes and name:
                yield child
                yield from public_types(child, True)


def read_alignments(path):
    """The alignment of each class, from the compiler's dump."""
    with open(path, encoding="utf-8") as dump:
        return dict(re.findall(r"^Class (.+)\n   size=\d+ align=(\d+)$", dump.read(), re.MULTILINE))


def read_symbols(nm, archive, kinds, *options):
    """The names of the given kinds, sorted."""
    output = subprocess.run(
        [nm, "--extern-only", *options, archive], check=True, capture_output=True, text=True
    ).stdout
    return sorted(set(re.findall(rf"^[0-9a-f ]*[{kinds}] (\S.*)$", output, re.MULTILINE)))


def main():
    nm, object_path, classes_path, archive = sys.argv[1:]
    alignments = read_alignments(classes_path)
    facts = {}
    with open(object_path, "rb") as file:
        for unit in ELFFile(file).get_dwarf_info().iter_CUs():
            for die in public_types(unit.get_top_DIE()):
                lines = describe_type(die, alignments)
                facts[lines[0].split(" ", 1)[1]] = lines
    for _, lines in sorted(facts.items()):
        print("\n".join(lines))
    for name in read_symbols(nm, archive, EXPORTED, "--demangle", "--defined-only"):
        if not name.startswith("DW.ref."):  # the compiler's own
            print(f"exports {name}")
    for name in filter(PLATFORM.match, read_symbols(nm, archive, "U", "--undefined-only")):
        print(f"requires {name}")


main()

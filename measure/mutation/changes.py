"""Finds the changes that may be made to a C++ file, in libclang's syntax tree of it.

A statement is dropped, or swapped with the next one; a condition is inverted; an operator, a
literal, an argument, an enumerator or a constant is replaced; another function of the same signature
is called.
"""

import bisect
import ctypes
import dataclasses

from clang import cindex
from clang.cindex import CursorKind, TokenKind, TypeKind

FUNCTIONS = {CursorKind.FUNCTION_DECL, CursorKind.CXX_METHOD, CursorKind.CONSTRUCTOR,
             CursorKind.DESTRUCTOR, CursorKind.CONVERSION_FUNCTION, CursorKind.FUNCTION_TEMPLATE}
VARIABLES = {CursorKind.VAR_DECL, CursorKind.FIELD_DECL}
CLASSES = {CursorKind.CLASS_DECL, CursorKind.STRUCT_DECL, CursorKind.CLASS_TEMPLATE}
BLOCKS = {CursorKind.IF_STMT, CursorKind.FOR_STMT, CursorKind.CXX_FOR_RANGE_STMT,
          CursorKind.WHILE_STMT, CursorKind.DO_STMT, CursorKind.SWITCH_STMT,
          CursorKind.COMPOUND_STMT, CursorKind.CXX_TRY_STMT, CursorKind.CASE_STMT,
          CursorKind.DEFAULT_STMT}
CONDITIONAL = {CursorKind.IF_STMT, CursorKind.WHILE_STMT, CursorKind.CONDITIONAL_OPERATOR}
REFERENCES = {CursorKind.DECL_REF_EXPR, CursorKind.MEMBER_REF_EXPR}
LITERALS = {CursorKind.INTEGER_LITERAL, CursorKind.FLOATING_LITERAL, CursorKind.STRING_LITERAL,
            CursorKind.CHARACTER_LITERAL, CursorKind.CXX_BOOL_LITERAL_EXPR}

OPERATORS = {
    "&&": ["||"], "||": ["&&"], "==": ["!="], "!=": ["=="],
    "<": ["<=", "!="], "<=": ["<", "=="], ">": [">=", "!="], ">=": [">", "=="],
    "+": ["-"], "-": ["+"], "*": ["/"], "/": ["*"], "%": ["*"], "<<": [">>"], ">>": ["<<"],
    "&": ["|"], "|": ["&"], "+=": ["-="], "-=": ["+="], "|=": ["&="], "&=": ["|="],
}


@dataclasses.dataclass(frozen=True)
class Change:
    """Replaces the bytes from begin to end by a text."""
    file: str  # relative to the root of the sources
    line: int
    what: str
    begin: int
    end: int
    text: bytes

    def applied_to(self, source):
        return source[:self.begin] + self.text + source[self.end:]

    def __str__(self):
        return f"{self.file}:{self.line}: {self.what}"


def file_offset(location):
    """The offset of a location in the file: for an argument of a macro, where it is written."""
    function = cindex.conf.lib.clang_getFileLocation
    function.argtypes = [cindex.SourceLocation, ctypes.POINTER(ctypes.c_void_p),
                         *3 * [ctypes.POINTER(ctypes.c_uint)]]
    offset = ctypes.c_uint()
    function(location, None, None, None, ctypes.byref(offset))
    return offset.value


def is_of_system(cursor):
    return bool(cindex.conf.lib.clang_Location_isInSystemHeader(cursor.location))


def public_methods(declaration):
    """The methods of a class and of its bases."""
    declaration = declaration.get_definition() or declaration
    for child in declaration.get_children():
        if child.kind == CursorKind.CXX_METHOD:
            if child.access_specifier == cindex.AccessSpecifier.PUBLIC:
                yield child
        elif child.kind == CursorKind.CXX_BASE_SPECIFIER:
            yield from public_methods(child.type.get_canonical().get_declaration())


class Finder:
    """Finds the changes of one file."""

    def __init__(self, path, name, arguments):
        self.name = name
        with open(path, "rb") as file:
            self.source = file.read()
        self.unit = cindex.Index.create().parse(
            str(path), arguments, options=cindex.TranslationUnit.PARSE_DETAILED_PROCESSING_RECORD)
        errors = [d for d in self.unit.diagnostics if d.severity >= cindex.Diagnostic.Error]
        if errors:
            raise ValueError(f"libclang cannot read {name}: {errors[0]}")
        self.tokens = [(t.extent.start.offset, t.extent.end.offset, t)
                       for t in self.unit.get_tokens(extent=self.unit.cursor.extent)
                       if t.kind != TokenKind.COMMENT]
        self.begins = [begin for begin, _, _ in self.tokens]
        children = [c for c in self.unit.cursor.get_children() if self.is_here(c)]
        self.macros = {c.extent.start.offset for c in children
                       if c.kind == CursorKind.MACRO_INSTANTIATION}
        self.references = {reference for child in children
                           for reference in self.references_below(child)}
        self.constants = {}
        self.alike = {}
        self.found = {}
        for child in children:
            self.collect_constants(child)
        for child in children:
            self.visit_declaration(child)

    def is_here(self, cursor):
        file = cursor.location.file
        return file is not None and file.name == self.unit.spelling

    def changes(self):
        return sorted(self.found.values(), key=lambda change: (change.begin, change.end, change.what))

    def add(self, what, begin, end, text):
        text = text.encode() if isinstance(text, str) else text
        if 0 <= begin <= end and text != self.source[begin:end]:
            line = self.source.count(b"\n", 0, begin) + 1
            change = Change(self.name, line, " ".join(what.split()), begin, end, text)
            self.found.setdefault((begin, end, text), change)

    def text(self, begin, end):
        return self.source[begin:end].decode()

    def range_of(self, cursor):
        """The bytes of a cursor; None for one in a macro's expansion."""
        begin, end = file_offset(cursor.extent.start), file_offset(cursor.extent.end)
        return (begin, end) if begin < end and begin not in self.macros else None

    def token_from(self, offset):
        """The index of the first token at or after an offset."""
        return bisect.bisect_left(self.begins, offset)

    # Declarations

    def collect_constants(self, cursor):
        """Constants of one structure at namespace scope, by its name: each may replace another."""
        if cursor.kind == CursorKind.NAMESPACE:
            for child in cursor.get_children():
                self.collect_constants(child)
        elif cursor.kind == CursorKind.VAR_DECL and cursor.type.is_const_qualified() and \
                cursor.type.get_canonical().kind == TypeKind.RECORD:
            self.constants.setdefault(cursor.type.get_canonical().spelling, []).append(cursor.spelling)

    def visit_declaration(self, cursor):
        if cursor.kind in FUNCTIONS:
            if cursor.is_definition():
                for child in cursor.get_children():
                    if child.kind.is_expression() or child.kind.is_statement():
                        self.visit(child)
        elif cursor.kind in VARIABLES:
            for child in cursor.get_children():
                if child.kind.is_expression():
                    self.visit(child)
        elif cursor.kind in CLASSES or cursor.kind == CursorKind.NAMESPACE or \
                cursor.kind in (CursorKind.LINKAGE_SPEC, CursorKind.UNEXPOSED_DECL):
            for child in cursor.get_children():
                self.visit_declaration(child)

    @staticmethod
    def references_below(cursor):
        return {c.referenced.hash for c in cursor.walk_preorder()
                if c.kind in REFERENCES and c.referenced is not None}

    # Statements and expressions

    def visit(self, cursor):
        kind = cursor.kind
        children = list(cursor.get_children())
        if kind == CursorKind.COMPOUND_STMT:
            self.statements(children)
        elif kind in (CursorKind.CASE_STMT, CursorKind.DEFAULT_STMT) and children:
            self.drop(children[-1])
        if kind in CONDITIONAL and children and children[0].kind.is_expression():
            self.invert(children[0])
        if kind in (CursorKind.BINARY_OPERATOR, CursorKind.COMPOUND_ASSIGNMENT_OPERATOR) and \
                len(children) == 2:
            self.operator(children[0], children[1])
        elif kind == CursorKind.CALL_EXPR:
            self.call(cursor, children)
        elif kind in REFERENCES:
            self.reference(cursor, children)
        elif kind in LITERALS:
            self.literal(cursor)
        for child in children:
            if child.kind in VARIABLES:
                self.visit_declaration(child)
            elif child.kind != CursorKind.STATIC_ASSERT:
                self.visit(child)

    def is_block(self, statement):
        """Whether a statement contains others, apart from those in a macro's expansion."""
        return statement.kind in BLOCKS and statement.extent.start.offset not in self.macros

    def statement_range(self, statement):
        """A statement with its semicolon."""
        begin, end = statement.extent.start.offset, statement.extent.end.offset
        following = self.token_from(end)
        if following < len(self.tokens) and self.tokens[following][2].spelling == ";" and \
                (statement.kind == CursorKind.DO_STMT or not self.is_block(statement)):
            end = self.tokens[following][1]
        return begin, end

    def statements(self, children):
        ranges = [self.statement_range(child) for child in children]
        for child in children:
            self.drop(child)
        for first, second, (b1, e1), (b2, e2) in zip(children, children[1:], ranges, ranges[1:]):
            if e1 > b2 or self.declares_for(first, second):
                continue
            between = self.source[e1:b2]
            self.add(f"swap {self.text(b1, e1)[:60]} | {self.text(b2, e2)[:60]}", b1, e2,
                     self.source[b2:e2] + between + self.source[b1:e1])

    def declares_for(self, first, second):
        """Whether the second statement needs what the first declares."""
        if first.kind != CursorKind.DECL_STMT:
            return False
        declared = {child.hash for child in first.get_children()}
        return bool(declared & self.references_below(second))

    def drop(self, statement):
        if self.is_block(statement) or statement.kind == CursorKind.NULL_STMT:
            return
        if statement.kind == CursorKind.DECL_STMT and \
                any(child.hash in self.references for child in statement.get_children()):
            return  # would not compile
        begin, end = self.statement_range(statement)
        self.add(f"drop {self.text(begin, end)}", begin, end, ";")

    def invert(self, condition):
        place = self.range_of(condition)
        if place:
            text = self.text(*place)
            self.add(f"invert ({text})", *place, f"(!({text}))")

    def operator(self, left, right):
        places = self.range_of(left), self.range_of(right)
        if None in places:
            return
        (_, begin), (end, _) = places
        for at in range(self.token_from(begin), self.token_from(end)):
            start, stop, token = self.tokens[at]
            for other in OPERATORS.get(token.spelling, ()):
                around = self.text(places[0][0], places[1][1])
                self.add(f"{token.spelling} becomes {other} in {around[:80]}", start, stop, other)

    def call(self, cursor, children):
        target = cursor.referenced
        if target is not None and target.spelling.startswith("operator"):
            if len(children) == 3:
                self.operator(children[0], children[2])
            return
        parameters = []
        if target is not None and target.type.kind == TypeKind.FUNCTIONPROTO:
            parameters = list(target.type.argument_types())
        name = cursor.spelling or "a call"
        for index, argument in enumerate(cursor.get_arguments()):
            if argument is None or argument.kind == CursorKind.LAMBDA_EXPR:
                continue
            if index < len(parameters) and self.is_output(parameters[index]):
                continue
            kind = argument.type.get_canonical().kind
            if kind in (TypeKind.MEMBERPOINTER, TypeKind.FUNCTIONPROTO):
                continue  # replaced by another function instead
            if kind == TypeKind.RECORD and \
                    cursor.type.get_canonical() == argument.type.get_canonical():
                continue  # a copy
            if argument.type.spelling == "std::memory_order":
                continue  # most processors do not reorder in a way that a test can detect
            place = self.range_of(argument)
            if place and not self.is_literal(*place):
                text = self.text(*place)
                self.add(f"argument {text} of {name}", *place, f"mutation::Mutated({text})")

    def is_literal(self, begin, end):
        _, stop, token = self.tokens[self.token_from(begin)]
        return token.kind == TokenKind.LITERAL and stop == end

    @staticmethod
    def is_output(parameter):
        return parameter.kind == TypeKind.LVALUEREFERENCE and \
            not parameter.get_pointee().is_const_qualified()

    def reference(self, cursor, children):
        place = self.range_of(cursor)
        declaration = cursor.referenced
        if place is None or declaration is None:
            return
        # The name is the last token: a qualifier or an object may come before it.
        begin, end, token = self.tokens[self.token_from(place[1]) - 1]
        if token.spelling != declaration.spelling or end > place[1]:
            return
        if declaration.kind == CursorKind.ENUM_CONSTANT_DECL:
            names = [c.spelling for c in declaration.semantic_parent.get_children()
                     if c.kind == CursorKind.ENUM_CONSTANT_DECL]
            self.next_of(names, "enumerator", begin, end)
        elif declaration.kind == CursorKind.CXX_METHOD and not is_of_system(declaration):
            self.other_method(cursor, declaration, children, begin, end)
        elif declaration.kind == CursorKind.VAR_DECL and declaration.type.is_const_qualified() and \
                declaration.semantic_parent.kind not in FUNCTIONS:
            alike = self.constants.get(declaration.type.get_canonical().spelling, ())
            for other in alike:
                if other != declaration.spelling:
                    self.add(f"{declaration.spelling} becomes {other}", begin, end, other)
            if not alike:
                text = self.text(*place)
                self.add(f"constant {text}", *place, f"mutation::Mutated({text})")

    def next_of(self, names, what, begin, end):
        name = self.text(begin, end)
        if len(names) > 1 and name in names:
            other = names[(names.index(name) + 1) % len(names)]
            self.add(f"{what} {name} becomes {other}", begin, end, other)

    def other_method(self, cursor, declaration, children, begin, end):
        owner = declaration.semantic_parent
        qualifiers = [c for c in children if c.kind == CursorKind.TYPE_REF]
        if qualifiers:
            owner = qualifiers[-1].referenced
        elif children:
            kind = children[0].type.get_canonical()
            kind = kind.get_pointee() if kind.kind == TypeKind.POINTER else kind
            owner = kind.get_declaration()
        if owner.hash not in self.alike:
            self.alike[owner.hash] = methods = {}
            for method in public_methods(owner):
                names = methods.setdefault(method.type.spelling, [])
                if method.spelling not in names:
                    names.append(method.spelling)
        names = self.alike[owner.hash].get(declaration.type.spelling, ())
        self.next_of(names, "function", begin, end)

    def literal(self, cursor):
        place = self.range_of(cursor)
        if place is None:
            return
        at = self.token_from(place[0])
        while at < len(self.tokens) and self.tokens[at][0] < max(place[1], place[0] + 1):
            begin, end, token = self.tokens[at]
            text = token.spelling
            if text in ("true", "false"):
                self.add(f"{text} becomes the other", begin, end,
                         "false" if text == "true" else "true")
            elif text.endswith('"') and not text.startswith("R"):
                self.add(f"text {text}", begin, end, text[:-1] + '~"')
            elif text.endswith("'"):
                self.add(f"character {text}", begin, end, f"static_cast<char>({text} + 1)")
            elif text[0].isdigit():
                self.add(f"number {text}", begin, end, f"({text} + 1)")
            at += 1


def changes_of(path, name, arguments):
    """The changes of a file, in its order."""
    return Finder(path, name, arguments).changes()

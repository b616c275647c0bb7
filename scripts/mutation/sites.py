# SPDX-License-Identifier: MIT
"""Finds what can be changed in one C++ file, and writes the file with every change in it.

A change (a mutant) has a number; which of them is alive is asked when the program runs, so that one
build holds them all: `a < b` becomes `(penwick_mutant(7) ? (a <= b) : (a < b))`.
"""
import re
from clang.cindex import CursorKind, Diagnostic, Index, TranslationUnit

INSTEAD = {
    '<': ['<=', '>='], '<=': ['<', '>'], '>': ['>=', '<='], '>=': ['>', '<'],
    '==': ['!='], '!=': ['=='], '&&': ['||'], '||': ['&&'],
    '+': ['-'], '-': ['+'], '*': ['/'], '/': ['*'], '%': ['*'],
    '+=': ['-='], '-=': ['+='], '*=': ['/='], '/=': ['*='],
    '&': ['|'], '|': ['&'], '|=': ['&='], '&=': ['|='], '<<': ['>>'], '>>': ['<<'],
}
COMPARISONS = {'<', '<=', '>', '>=', '==', '!='}
BODIES = {CursorKind.IF_STMT, CursorKind.FOR_STMT, CursorKind.WHILE_STMT,
          CursorKind.CXX_FOR_RANGE_STMT}
OPERATORS = {CursorKind.BINARY_OPERATOR, CursorKind.COMPOUND_ASSIGNMENT_OPERATOR}
NAMES = {CursorKind.DECL_REF_EXPR, CursorKind.MEMBER_REF_EXPR}
WRAPPERS = {CursorKind.UNEXPOSED_EXPR, CursorKind.PAREN_EXPR}


class Mutant:
    """One change: where it is, and what it is in words."""

    def __init__(self, line, words, text):
        self.line = line
        self.words = words
        self.text = text  # what stands there instead; None for a statement that is skipped
        self.number = 0


class Site:
    """A piece of the file with its mutants: an expression, or a statement that can be skipped."""

    def __init__(self, start, end, is_statement):
        self.start, self.end, self.is_statement = start, end, is_statement
        self.mutants = []


class SourceFile:
    def __init__(self, path, flags):
        self.path, self.flags, self.unit = path, flags, None
        self.source = self._with_changeable_constants(path.read_bytes())
        self.sites = {}
        unit = self._parse(self.source)
        errors = self._errors(unit)
        if errors:
            raise SystemExit(f'{path} cannot be parsed: {errors[0][1]}')
        self._visit(unit.cursor, None, None)

    def _with_changeable_constants(self, source):
        """A constant can be changed only if it need not be known to the compiler."""
        constant = re.compile(rb'\bconstexpr (?=(?:int|double|float|std::uint32_t) \w+ = )')
        for match in constant.finditer(source):
            # Of the same length, so that places stay what they are.
            changed = source[:match.start()] + b'const     ' + source[match.end():]
            if not self._errors(self._parse(changed)):
                source = changed
        return source

    def mutants(self):
        return [mutant for site in self._in_order() for mutant in site.mutants]

    def drop_what_does_not_compile(self):
        """Compiles all mutants, and takes out those that are no C++; until none is left of them."""
        for _ in range(40):
            for number, mutant in enumerate(self.mutants(), 1):
                mutant.number = number
            text = self.rewritten()
            wrong = set()
            for offset, words in self._errors(self._parse(text)):
                # An error at a name of our own is about what follows it.
                name = re.match(rb'penwick_mutant\((\d+)\)', text[offset:])
                numbers = [name.group(1)] if name else re.findall(
                    rb'penwick_mutant\((\d+)\)', text[:offset])
                if not numbers:
                    raise SystemExit(f'{self.path}: {words}')
                wrong.add(int(numbers[-1]))
            if not wrong:
                return
            for site in self.sites.values():
                site.mutants = [m for m in site.mutants if m.number not in wrong]
        raise SystemExit(f'{self.path}: the mutants do not compile')

    def rewritten(self):
        sites = self._in_order()
        include = b'#include "penwick_mutant.h"\n'
        if self.path.suffix == '.h':
            include = b'#pragma GCC system_header\n' + include
        pragma = self.source.find(b'#pragma once\n')
        body = self._piece(0, len(self.source), sites)
        if pragma < 0:
            return include + body
        return body.replace(b'#pragma once\n', b'#pragma once\n' + include, 1)

    # Writing

    def _in_order(self):
        return sorted((s for s in self.sites.values() if s.mutants), key=lambda s: (s.start, -s.end))

    def _piece(self, start, end, sites):
        """The text from start to end with the given sites, which lie in it, rewritten."""
        out, at, index = b'', start, 0
        while index < len(sites):
            site, inner = sites[index], index + 1
            while inner < len(sites) and sites[inner].start < site.end:
                inner += 1
            out += self.source[at:site.start] + self._site(site, sites[index + 1:inner])
            at, index = site.end, inner
        return out + self.source[at:end]

    def _site(self, site, inner):
        text = self._piece(site.start, site.end, inner)
        if site.is_statement:
            return b'if (penwick_mutant(%d)) { } else %s' % (site.mutants[0].number, text)
        if any(m.words == 'negated' for m in site.mutants):
            text = b'bool(' + text + b')'  # both sides of the choice are of one type
        chosen = b''.join(b'penwick_mutant(%d) ? (%s) : ' % (m.number, m.text) for m in site.mutants)
        return b'(' + chosen + b'(' + text + b'))'

    # Reading

    def _parse(self, text):
        unsaved = [('/penwick_mutant/penwick_mutant.h', 'bool penwick_mutant(int);\n'),
                   (str(self.path), text.decode())]
        # What the file includes is read once, and not each time that the file itself is read anew.
        if self.unit:
            self.unit.reparse(unsaved)
        else:
            self.unit = Index.create().parse(
                str(self.path),
                args=self.flags + ['-I/penwick_mutant', '-Wno-everything', '-ferror-limit=0'],
                unsaved_files=unsaved, options=TranslationUnit.PARSE_PRECOMPILED_PREAMBLE)
        return self.unit

    def __getstate__(self):
        return {**self.__dict__, 'unit': None}

    @staticmethod
    def _errors(unit):
        # As plain values: a diagnostic does not keep alive what it points into.
        return [(d.location.offset, d.spelling) for d in unit.diagnostics
                if d.severity >= Diagnostic.Error]

    def _text(self, cursor):
        return self.source[cursor.extent.start.offset:cursor.extent.end.offset]

    def _add(self, cursor, words, text, is_statement=False):
        start, end = cursor.extent.start.offset, cursor.extent.end.offset
        site = self.sites.setdefault((start, end, is_statement), Site(start, end, is_statement))
        if all(m.text != text for m in site.mutants):
            site.mutants.append(Mutant(cursor.extent.start.line, words, text))

    def _visit(self, cursor, parent, grandparent):
        children = list(cursor.get_children())
        if cursor.kind != CursorKind.TRANSLATION_UNIT:
            if not cursor.location.file or cursor.location.file.name != str(self.path):
                return
            if cursor.kind == CursorKind.VAR_DECL and b'constexpr ' in self._text(cursor):
                return
            self._look(cursor, children, parent, grandparent)
            if self._is_constant_if(cursor):
                children = children[1:]
            children = [c for c in children if not self._is_template_argument(c, cursor)]
        for child in children:
            self._visit(child, cursor, parent)

    def _is_constant_if(self, cursor):
        return cursor.kind == CursorKind.IF_STMT and self._text(cursor).startswith(b'if constexpr')

    @staticmethod
    def _is_template_argument(child, parent):
        """Behind a name that is used, or a part of the type before a name that is declared."""
        if not child.kind.is_expression():
            return False
        if parent.kind in NAMES:
            return child.location.offset > parent.location.offset
        return parent.kind.is_declaration() and child.location.offset < parent.location.offset

    def _look(self, cursor, children, parent, grandparent):
        kind, text = cursor.kind, self._text(cursor)
        if kind in OPERATORS and len(children) == 2:
            self._operator(cursor, text, *children)
        elif kind == CursorKind.CALL_EXPR:
            self._call(cursor, text, children)
        elif kind == CursorKind.UNARY_OPERATOR and children:
            self._unary(cursor, text, children[0])
        elif kind in (CursorKind.INTEGER_LITERAL, CursorKind.FLOATING_LITERAL):
            self._literal(cursor, text)
        elif kind == CursorKind.CXX_BOOL_LITERAL_EXPR and text in (b'true', b'false'):
            other = b'false' if text == b'true' else b'true'
            self._add(cursor, f'{text.decode()} -> {other.decode()}', other)
        elif kind in (CursorKind.IF_STMT, CursorKind.WHILE_STMT, CursorKind.CONDITIONAL_OPERATOR):
            if children and children[0].kind.is_expression() and not self._is_constant_if(cursor):
                self._negate(children[0])
        elif kind == CursorKind.RETURN_STMT and children:
            if children[0].type.spelling == 'bool':
                self._negate(children[0])
        if parent is not None:
            self._statement(cursor, text, parent, grandparent)

    def _operator(self, cursor, text, left, right):
        start = left.extent.end.offset - cursor.extent.start.offset
        end = right.extent.start.offset - cursor.extent.start.offset
        operator = text[start:end].strip().decode(errors='replace')
        for other in INSTEAD.get(operator, []):
            self._add(cursor, f'{operator} -> {other}',
                      text[:start] + b' ' + other.encode() + b' ' + text[end:])

    def _call(self, cursor, text, children):
        name = re.match(rb'std::(min|max)\(', text)
        if name:
            other = b'max' if name.group(1) == b'min' else b'min'
            self._add(cursor, f'{name.group(1).decode()} -> {other.decode()}',
                      b'std::' + other + text[8:])
        # A key with its modifiers: compilers differ in what else may stand there.
        if cursor.type.spelling == 'QKeyCombination':
            return
        # An overloaded operator: its first child is the left side, its last one the right side.
        if len(children) == 3 and cursor.spelling.startswith('operator'):
            self._operator(cursor, text, children[0], children[2])
        elif (len(children) == 2 and cursor.spelling == 'operator!'
              and text.startswith(b'!')):
            self._add(cursor, '! taken away', b'bool(' + text[1:] + b')')

    def _unary(self, cursor, text, operand):
        for operator, other in ((b'++', b'--'), (b'--', b'++')):
            if text.startswith(operator):
                self._add(cursor, f'{operator.decode()} -> {other.decode()}', other + text[2:])
            elif text.endswith(operator):
                self._add(cursor, f'{operator.decode()} -> {other.decode()}', text[:-2] + other)
        if text.startswith(b'!'):
            self._add(cursor, '! taken away', b'bool(' + self._text(operand) + b')')
        elif text.startswith(b'-') and not text.startswith(b'--'):
            self._add(cursor, '- taken away', self._text(operand))

    def _literal(self, cursor, text):
        number = re.fullmatch(rb'([0-9.]+(?:e[-+]?[0-9]+)?)([FUful]*)', text)
        if not number:
            return
        other = b'0' if text == b'1' else text + (b' + 1' if b'.' not in text else b' + 1.0')
        if b'.' in text or b'e' in text:
            other = text + b' + 1' + (b'.0F' if text[-1:] in b'Ff' else b'.0')
        self._add(cursor, f'{text.decode()} -> {other.decode()}', other)

    def _negate(self, expression):
        inner = expression
        while inner.kind in WRAPPERS and len(list(inner.get_children())) == 1:
            inner = next(inner.get_children())
        text = self._text(expression)
        if inner.kind == CursorKind.CXX_BOOL_LITERAL_EXPR or text.startswith(b'!'):
            return  # changed already
        if inner.kind in OPERATORS:
            left, right = inner.get_children()
            operator = self.source[left.extent.end.offset:right.extent.start.offset].strip()
            if operator.decode() in COMPARISONS:
                return
        self._add(expression, 'negated', b'!(' + text + b')')

    def _statement(self, cursor, text, parent, grandparent):
        is_body = parent.kind in BODIES and cursor == list(parent.get_children())[-1]
        in_block = parent.kind in (CursorKind.COMPOUND_STMT, CursorKind.CASE_STMT,
                                   CursorKind.DEFAULT_STMT)
        if parent.kind == CursorKind.IF_STMT:
            is_body = cursor in list(parent.get_children())[1:]
        # The value after `case` and the condition after `if` are children too.
        if not (is_body or in_block) or not re.match(rb'\s*;', self.source[cursor.extent.end.offset:]):
            return
        words = None
        if cursor.kind.is_expression() and not text.startswith(b'{'):
            words = 'skipped: '
        elif cursor.kind in (CursorKind.BREAK_STMT, CursorKind.CONTINUE_STMT):
            words = 'taken away: '
        elif cursor.kind == CursorKind.RETURN_STMT:
            # Only an early one: without its last one a function ends in nowhere.
            if parent.kind == CursorKind.IF_STMT or (
                    in_block and grandparent is not None and grandparent.kind == CursorKind.IF_STMT):
                words = 'taken away: '
        if words:
            shown = ' '.join(text.decode(errors='replace').split())
            self._add(cursor, words + shown[:70], None, is_statement=True)

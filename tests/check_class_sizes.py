#!/usr/bin/env python3
"""Checks that no class is too large: check_class_sizes.py ROOT

Counts the functions that each class of the headers declares: overloads one by one, with constructors and slots, but
not those that are defaulted or deleted, and not signals, whose bodies moc writes. Prints each class that has more than it may have, and
each exception that is no longer needed, and ends 1 if there is one. With --self-test it checks that it counts
right in a small tree.
"""
import os
import re
import sys

import sourcetree

LIMIT = 60
# Classes that may have more, each with how many.
EXCEPTIONS = {
    "CanvasScene": 77,
    "KSScrollViewerWidget": 109,
    "TitlerWindow": 89,
}

COMMENT_OR_STRING = re.compile(r'//[^\n]*|/\*.*?\*/|"(?:\\.|[^"\\\n])*"|\'(?:\\.|[^\'\\\n])\'|^\s*#[^\n]*',
                               re.DOTALL | re.MULTILINE)
CLASS = re.compile(r"(?<!enum )\b(?:class|struct)\s+(\w+)\b(?:\s+final)?(?:\s*:[^;{}()]*)?\s*\{")
SIGNALS = re.compile(r"\bQ_SIGNALS\s*:.*?(?=\b(?:public|protected|private)\s*(?:Q_SLOTS\s*)?:(?!:)|\Z)", re.DOTALL)
SECTION = re.compile(r"\b(?:public|protected|private|Q_SIGNALS)(?:\s+Q_SLOTS)?\s*:(?!:)")
NO_FUNCTION = re.compile(r"^(?:using|typedef|friend|static_assert|enum|class|struct|union)\b|^[A-Z][A-Z0-9_]*\s*\(")
NAME = re.compile(r"(?:~?\w+|operator\s*[^\s\w(]+|operator\s*\(\)|operator\s+[\w:]+)\s*\((?!\s*\*)")


def body_of(text, begin):
    """The text from behind the brace that ends at begin to before the brace that closes it."""
    depth = 1
    for end in range(begin, len(text)):
        depth += {"{": 1, "}": -1}.get(text[end], 0)
        if depth == 0:
            return text[begin:end]
    return text[begin:]


def declarations(body):
    """What stands in the body of a class, one by one and without the bodies of functions and classes."""
    depth, current = 0, ""
    for character in body:
        if character == "{":
            if depth == 0:
                current += "{"
            depth += 1
        elif character == "}":
            depth -= 1
            if depth == 0 and is_function(current):
                yield current
                current = ""
        elif depth == 0 and character == ";":
            yield current
            current = ""
        elif depth == 0:
            current = SECTION.sub("", current + character)


def is_function(declaration):
    text = re.sub(r"\bQ_OBJECT\b|\[\[.*?\]\]", "", declaration).strip()
    if NO_FUNCTION.match(text) or text.startswith((",", "{")) or re.search(r"=\s*(?:default|delete)\s*$", text):
        return False
    if "operator" not in text:
        inner = None
        while inner != text:  # the arguments of templates, from the innermost
            inner, text = text, re.sub(r"<[^<>]*>", "", text)
        text = text.split("=")[0]
    return NAME.search(text.split("{")[0]) is not None


def sizes(root):
    """The number of functions of every class, by name and path of the header."""
    found = {}
    for path in sourcetree.files(root, sourcetree.LAYERS + sourcetree.PROGRAMS, (".h",)):
        text = COMMENT_OR_STRING.sub("", sourcetree.read(os.path.join(root, path)))
        for match in CLASS.finditer(text):
            count = sum(is_function(one) for one in declarations(SIGNALS.sub("", body_of(text, match.end()))))
            found[match.group(1), path] = count
    return found


def check(root):
    errors = []
    for (name, path), count in sorted(sizes(root).items()):
        limit = EXCEPTIONS.get(name, LIMIT)
        if count > limit:
            errors.append(f"{path}: {name} has {count} functions, more than {limit}")
        elif name in EXCEPTIONS and count <= LIMIT:
            errors.append(f"{path}: {name} has {count} functions and needs no exception")
    return errors


def self_test(tree):
    tree.write("canvas/A.h", """
        class B;
        class A : public QObject, private I<B>
        {
            Q_OBJECT
            Q_DISABLE_COPY(A)
            enum class Kind { One, Two };
            struct Part { int x = f(); int y() const { return 1; } };
        public:
            using QObject::QObject;
            explicit A(int a) : m_a{a}, m_b(a) { if (a) { g(); } }
            A(const A&) = default;
            ~A() override;
            bool operator==(const A&) const = default;
            bool operator<(const A&) const;
            static constexpr int SIZE = int(3.0); // not f();
        Q_SIGNALS:
            void signalDone(int a, int b = 0);
        public Q_SLOTS:
            void slotDone() { }
            [[nodiscard]] std::map<int, int> values(const std::vector<int>& of) const override;
        private:
            friend class B;
            std::function<void(int)> m_f;
            int m_a{int(2)};
            int m_b = int(1);
        };
        """)
    assert sizes(tree.root) == {("A", "canvas/A.h"): 5, ("Part", "canvas/A.h"): 1}, sizes(tree.root)
    assert check(tree.root) == [], check(tree.root)
    tree.write("canvas/C.h", "class C\n{\nQ_SIGNALS:\n    void a();\n    void b();\nprivate:\n    void c();\nQ_SIGNALS:\n    void d();\n};\n")
    assert sizes(tree.root)["C", "canvas/C.h"] == 1, sizes(tree.root)
    functions = "".join(f"    void f{i}();\n" for i in range(LIMIT))
    tree.write("canvas/B.h", f"class B\n{{\n{functions}}};\n")
    tree.write("canvas/TitlerWindow.h", f"class TitlerWindow\n{{\n{functions}}};\n")
    assert check(tree.root) == [
        f"canvas/TitlerWindow.h: TitlerWindow has {LIMIT} functions and needs no exception"], check(tree.root)
    tree.write("canvas/B.h", f"class B\n{{\n{functions}    void more();\n}};\n")
    tree.write("canvas/TitlerWindow.h")
    assert check(tree.root) == [f"canvas/B.h: B has {LIMIT + 1} functions, more than {LIMIT}"], check(tree.root)


if __name__ == "__main__":
    sys.exit(sourcetree.main(__doc__, check, self_test))

"""Writes the stubs of the package, with what help says of each thing: make_stubs.py SIGNATURES PACKAGE_FOLDER.

The classes of the sections have all that is known of their keywords; the functions and members of the extension
modules, whose types are written by hand, have their docstrings.
"""

import ast
import sys
import textwrap
from pathlib import Path

HEADER = '''"""The sections of a setup, with units and defaults."""

from ._sections import File, Flag, ListOf, Moment, Number, Numbers, Section, Sub, Text, Values, Whole
'''


def literal(text, indent):
    """A text as a docstring; one that does not end in a line alone has the quotes below it."""
    text = textwrap.indent(text.replace("\\", "\\\\"), indent).lstrip()
    return f'{indent}"""{text}' + (f"\n{indent}" if "\n" in text or text.endswith('"') else "") + '"""\n'


def section_text(kind):
    lines = [f"\nclass {kind.__name__}(Section):\n", literal(kind.__doc__, "    ")]
    for name, field in vars(kind).items():
        if not hasattr(field, "__get__") or name.startswith("_"):
            continue
        held = getattr(field, "kind", None)
        of = f"[{held.__name__}]" if isinstance(held, type) else ""
        lines.append(f"    {name}: {type(field).__name__}{of}\n{literal(field.__doc__, '    ')}")
    return "".join(lines)


def model_stub():
    from gridbay_setup import model
    from gridbay_setup._sections import Section

    kinds = [kind for kind in vars(model).values()
             if isinstance(kind, type) and issubclass(kind, Section) and kind is not Section]  # fmt: skip
    return HEADER + "".join(section_text(kind) for kind in kinds)


def doc_of(thing):
    """What stands behind the line that tells the arguments, of a function or member."""
    text = (getattr(thing, "__doc__", None) or "").strip()
    return text.partition("\n\n")[2].strip() if text.partition("\n")[0].find("(") > 0 and "\n\n" in text else text


def documented(source, module):
    """The stub with a docstring for each class, function and member that has no body."""
    lines = source.splitlines(keepends=True)

    def put(node, holder, indent):
        thing = getattr(holder, node.name, None)
        doc = doc_of(thing) if thing is not None else ""
        for inner in node.body if isinstance(node, ast.ClassDef) else []:
            if isinstance(inner, ast.FunctionDef):
                put(inner, thing or sharers(node.name), indent + "    ")
        if not doc or node.name.startswith("__"):
            return
        if isinstance(node, ast.ClassDef):
            lines[node.lineno - 1] += literal(doc, indent + "    ")
        else:
            end = node.end_lineno - 1
            lines[end] = lines[end].rstrip().removesuffix("...").rstrip() + "\n" + literal(doc, indent + "    ")

    def sharers(base):
        """A class that inherits from one that stands in the stub alone."""
        of = next(node for node in tree.body if isinstance(node, ast.ClassDef)
                  and any(isinstance(each, ast.Name) and each.id == base for each in node.bases))  # fmt: skip
        return getattr(module, of.name)

    tree = ast.parse(source)
    for node in tree.body:
        if isinstance(node, (ast.ClassDef, ast.FunctionDef)):
            put(node, module, "")
    return "".join(lines)


def main():
    signatures, folder = Path(sys.argv[1]), Path(sys.argv[2])
    sys.path.insert(0, str(folder.parent))
    from gridbay_setup import _flow_model

    (folder / "model.pyi").write_text(model_stub(), encoding="utf-8")
    stub = documented(signatures.read_text(encoding="utf-8"), _flow_model)
    (folder / "_flow_model.pyi").write_text(stub, encoding="utf-8")


if __name__ == "__main__":
    main()

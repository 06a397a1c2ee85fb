"""Writes the classes of all sections (module `model`) from what the built modules tell of their tables.

make_model.py PACKAGE_FOLDER: the folder of the package with its extension modules.
"""

import importlib.machinery
import importlib.util
import re
import sys
from pathlib import Path

HEADER = '''"""The sections of a setup, made from the tables of the model and the controls of its pages."""

from ._sections import File, Flag, ListOf, Moment, Number, Numbers, Part, Section, Sub, Text, Values, Whole

'''
KINDS = ["Flag", "Whole", "Number", "Text", "File", "File"]  # by the numbers of the kinds of values
DATE_PARTS = 6
RESERVED = {"path", "paths", "walk", "text", "fields", "file", "kind", "notes", "validate", "save", "copy"}
WORDS = {"None", "True", "False", "and", "as", "class", "def", "del", "from", "global", "if", "import", "in", "is",
         "lambda", "not", "or", "pass", "return", "try", "while", "with", "yield"}  # fmt: skip


def load(folder, name):
    """An extension module by itself: the package needs what is made here."""
    path = folder / f"{name}.so"
    loader = importlib.machinery.ExtensionFileLoader(name, str(path))
    spec = importlib.util.spec_from_file_location(name, path, loader=loader)
    module = importlib.util.module_from_spec(spec)
    loader.exec_module(module)
    return module


def snake(name):
    """Constant_Value, IncludeInundationStatistics, AREA -> constant_value, include_inundation_statistics, area."""
    text = re.sub(r"([a-z0-9])([A-Z])", r"\1_\2", name.strip())
    text = re.sub(r"([A-Z]+)([A-Z][a-z])", r"\1_\2", text)
    text = re.sub(r"[^a-z0-9]+", "_", text.lower()).strip("_")
    if text[:1].isdigit() or not text:
        text = "n" + text
    return text + "_" if text in WORDS | RESERVED else text


def plural(name):
    if name.endswith("data"):
        return name
    if name.endswith("y") and name[-2:-1] not in "aeiou":
        return name[:-1] + "ies"
    return name + "es" if name.endswith(("s", "x", "ch")) else name + "s"


def camel(name):
    return "".join(part.capitalize() for part in snake(name).split("_"))


class Node:
    """A section, with what all its items have where it is one of a list."""

    def __init__(self, class_name, path=""):
        self.class_name = class_name
        self.path = path
        self.keywords = {}  # by name
        self.sections = {}  # by name; of a list by the name with {}
        self.lists = {}  # count and what is followed, by the name with {}


def step_of(step):
    """The name of a section, with {} for the number where it is an item of a list."""
    if found := re.fullmatch(r"(.*_)\d+", step):
        return found[1] + "{}"
    return re.sub(r"\[\d+\]$", "", step)


class Maker:
    def __init__(self):
        self.class_names = {}
        self.root = Node("Model")

    def class_name(self, parent, step):
        name = camel(re.sub(r"_MODULE$|(_|\[)\{\}\]?$", "", step))
        wanted = ("" if parent is self.root else parent.class_name) + name
        number = self.class_names[wanted] = self.class_names.get(wanted, 0) + 1
        return wanted if number == 1 else f"{wanted}{number}"

    def node(self, steps):
        node = self.root
        for step in steps:
            if step not in node.sections:
                # Case differs here and there in the places that a name is written at.
                same = next((each for each in node.sections if each.lower() == step.lower()), None)
                if same is None:
                    path = step.format("n") if node is self.root else f"{node.path}/{step.format('n')}"
                    node.sections[step] = Node(self.class_name(node, step), path)
                step = same or step
            node = node.sections[step]
        return node

    def take(self, keywords, lists):
        for name, count, followed in lists:
            *parents, last = name.split("/")
            steps = [step_of(step) for step in parents]
            holder = self.node(self.resolved(steps))
            self.node([*self.resolved(steps), last])
            old = holder.lists.get(last, ("", ""))
            holder.lists[last] = (old[0] or count.split("/")[-1], old[1] or followed)
        for path, values, any_number, settable, page, parts in keywords:
            *parents, name = path.split("/")
            node = self.node(self.resolved([step_of(step) for step in parents]))
            new = dict(values=values, any_number=any_number, settable=settable, page=page, parts=parts)
            held = node.keywords.setdefault(name, new)
            if not held["page"] and page:
                held.update(page=page, parts=parts)

    def resolved(self, steps):
        """The steps with those of repeated sections, which have no number for the first, as their lists."""
        node, found = self.root, []
        for step in steps:
            if step + "[{}]" in node.lists:
                step += "[{}]"
            found.append(step)
            same = next((each for each in node.sections if each.lower() == step.lower()), None)
            node = node.sections[same] if same else Node("")
        return found

    def attributes(self, node):
        taken = set()

        def free(name, other):
            name = name if name not in taken else other
            while name in taken:
                name += "_"
            taken.add(name)
            return name

        lines = []
        for name, note in node.keywords.items():
            lines.append(f"    {free(snake(name), snake(name))} = {keyword_text(name, note)}")
        for name, child in node.sections.items():
            if name in node.lists or "{}" in name:
                count, follows = node.lists.get(name, ("", ""))
                plain = re.sub(r"(_|\[)\{\}\]?$", "", name)
                attribute = free(plural(snake(plain)), snake(plain) + "_list")
                further = "".join(f", {key}={value!r}" for key, value in (("count", count), ("follows", follows)) if value)
                lines.append(f"    {attribute} = ListOf({name!r}, {child.class_name}{further})")
            else:
                plain = re.sub(r"_MODULE$", "", name) if node is self.root else name
                attribute = free(snake(plain), snake(plain) + "_section")
                lines.append(f"    {attribute} = Sub({name!r}, {child.class_name})")
        return lines

    def text(self, node=None):
        """The classes of the sections in a section, and then its own."""
        node = node or self.root
        inner = "".join(self.text(child) for child in node.sections.values())
        lines = self.attributes(node) or ["    pass"]
        doc = f"Section {node.path}." if node.path else "All that a setup holds."
        head = f'\nclass {node.class_name}(Section):\n    """{doc}"""\n\n    __slots__ = ()\n'
        return inner + head + "\n".join(lines) + "\n\n"


def keyword_text(name, note):
    values = note["values"]
    kinds = [kind for kind, _ in values]
    if note["any_number"]:
        kind = "Numbers"
    elif len(kinds) == DATE_PARTS and set(kinds) == {1}:
        kind = "Moment"
    elif len(kinds) == 1:
        kind = KINDS[kinds[0]]
    else:
        kind = "Values"
    default = " ".join(text if k < 3 else f'"{text}"' if k == 3 else text for k, text in values)
    if kind == "Flag":
        default = default.capitalize()
    # What holds for all values is said of the keyword.
    whole = same_part(note["parts"])
    given = {"default": default, **(part_given(whole) if whole else {}), "page": note["page"]}
    if not whole:
        given["parts"] = [f"Part({named(part_given(part))})" for part in note["parts"]]
    further = "".join(f", {text}" for text in [named(given)] if text)
    if not note["settable"]:
        further += ", settable=False"
    return f"{kind}({name!r}{further})"


def same_part(parts):
    return parts[0] if all(part == parts[0] for part in parts) else None


def part_given(part):
    label, quantity, unit, choices = part
    return dict(quantity=quantity, unit=unit, label=label, choices=dict(sorted(choices, key=number_first)))


def named(given):
    """Arguments by name, those that say nothing left out."""
    return ", ".join(f"{key}=({', '.join(value)},)" if key == "parts" else f"{key}={value!r}"
                     for key, value in given.items() if value)  # fmt: skip


def number_first(choice):
    try:
        return float(choice[0]), ""
    except ValueError:
        return 0.0, choice[0]


def main():
    folder, definition = Path(sys.argv[1]), sys.argv[2]
    maker = Maker()
    for name in ("_flow_model", "_wetland_sweep_kit"):
        maker.take(*load(folder, name).keyword_list(definition))
    text = HEADER + maker.text()
    (folder / "model.py").write_text(text.rstrip() + "\n", encoding="utf-8")


if __name__ == "__main__":
    main()

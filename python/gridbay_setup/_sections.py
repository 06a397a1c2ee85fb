"""Sections, keywords and lists of a setup, as attributes.

The classes of all sections (module `model`) are made from the tables of the model when the package is built.
"""

from __future__ import annotations

import datetime
import difflib
import os
import pathlib
from typing import (
    TYPE_CHECKING,
    Any,
    Generic,
    Iterator,
    Mapping,
    NamedTuple,
    Optional,
    Sequence,
    TypeVar,
    Union,
    overload,
)

from .errors import PathError, RangeError, WrongType, WrongValue

Get = TypeVar("Get")
Set = TypeVar("Set")
S = TypeVar("S", bound="Section")

FileName = Union[str, "os.PathLike[str]", None]


class Section:
    """A section of a setup: its keywords, sections and lists are attributes.

    `section["NAME/OF/Keyword"]` is a keyword by its path from here. A section holds nothing: it looks at the
    setup each time.
    """

    __slots__ = ("_document", "_path")
    _document: Any  # of the extension module
    _path: str

    def __init__(self, document: Any, path: str) -> None:
        object.__setattr__(self, "_document", document)
        object.__setattr__(self, "_path", path)

    @property
    def path(self) -> str:
        """The path of the section in the setup; empty for the setup as a whole."""
        return self._path

    def _at(self, name: str) -> str:
        return f"{self._path}/{name}" if self._path else name

    def __getitem__(self, path: str) -> Any:
        return self._document.get(self._at(_checked(path)))

    def __setitem__(self, path: str, value: Any) -> None:
        self._document.set(self._at(_checked(path)), value)

    def __contains__(self, path: object) -> bool:
        """Whether the model has a keyword or section of that path, from here."""
        at = self._at(_checked(path))
        return bool(self._document.has(at, False) or self._document.has(at, True))

    __iter__ = None  # not a list: `paths` has all keywords

    def paths(self) -> list[str]:
        """The paths, from here, of all keywords that a save would write, in order."""
        skip = len(self._path) + 1 if self._path else 0
        return [path[skip:] for path in self._document.paths(self._path)]

    def walk(self) -> Iterator[tuple[str, Any]]:
        """All keywords that a save would write: path, from here, and value."""
        for path in self.paths():
            yield path, self[path]

    def text(self) -> str:
        """What a save would write of the section."""
        return str(self._document.text(self._path))

    @classmethod
    def fields(cls) -> dict[str, Field]:
        """What the section can have, by attribute."""
        return {
            name: value
            for kind in reversed(cls.__mro__)
            for name, value in vars(kind).items()
            if isinstance(value, Field)
        }

    def _unknown(self, name: str, verb: str) -> PathError:
        names = list(dict.fromkeys([*self.fields(), *(n for n in dir(type(self)) if not n.startswith("_"))]))
        near = difflib.get_close_matches(name, names, 3, 0.5)
        allowed = ", ".join(near or self.fields())
        where = self._path or "the setup"
        return PathError(
            f"{where}: there is no attribute '{name}' {verb}; "
            f"{'did you mean' if near else 'there are'} {allowed}",
            self._path, name, allowed)  # fmt: skip

    def _further(self, name: str) -> Optional[Keyword[Any, Any]]:
        """The keyword of an attribute that no new setup has: one that is numbered higher, as constant_value_7, or one
        that stands in this section alone."""
        stem, _, number = name.rpartition("_")
        first = self.fields().get(f"{stem}_1")
        if number.isdecimal() and isinstance(first, Keyword) and first.name.endswith("1"):
            held = first.name[:-1] + number
            if self._document.has(self._at(held), False):
                return type(first)(held, first.default, first.quantity, first.unit, first.label, first.page,
                                   first.choices, first.parts, first.settable)  # fmt: skip
        for path in self.paths():
            if "/" not in path and path.lower() == name:
                return Keyword(path)
        return None

    if not TYPE_CHECKING:  # whose tools know what there is

        def __getattr__(self, name: str) -> Any:
            if name.startswith("_"):
                raise AttributeError(name)
            keyword = self._further(name)
            if keyword is None:
                raise self._unknown(name, "to read")
            return keyword.__get__(self, type(self))

        def __setattr__(self, name: str, value: Any) -> None:
            if hasattr(type(self), name):
                object.__setattr__(self, name, value)
                return
            keyword = self._further(name)
            if keyword is None:
                raise self._unknown(name, f"to be {value!r}")
            keyword.__set__(self, value)

    def __eq__(self, other: object) -> bool:
        return isinstance(other, Section) and (self._document, self._path) == (other._document, other._path)

    def __hash__(self) -> int:
        return hash((id(self._document), self._path))

    def __repr__(self) -> str:
        return f"<{type(self).__name__} {self._path or 'setup'}>"


def _checked(path: object) -> str:
    if not isinstance(path, str):
        raise WrongType(
            f"A path is a text, as 'NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth'; {path!r} was given",
            "", repr(path), "a text")  # fmt: skip
    return path


def file_name(given: object, path: str) -> str:
    """The name of a file; path says what it is for, as "open(path)"."""
    name = os.fspath(given) if isinstance(given, (str, os.PathLike)) else None
    if isinstance(name, str):
        return name
    allowed = "the name of a file (str or a path)"
    raise WrongType(f"{path}: {given!r} ({type(given).__name__}) was given; allowed is {allowed}", path, repr(given), allowed)


class Field:
    """What an attribute of a section stands for, by its name in the file."""

    def __init__(self, name: str, doc: str) -> None:
        self.name = name
        self.__doc__ = doc


def _with_unit(quantity: str, unit: str) -> str:
    return f"{quantity} ({unit})" if unit else quantity


def _meanings(choices: Mapping[str, str]) -> str:
    return "; ".join(f"{value}: {text}" for value, text in choices.items()) + "." if choices else ""


class Part(NamedTuple):
    """One of several values of a keyword."""

    quantity: str = ""
    unit: str = ""
    label: str = ""
    choices: Mapping[str, str] = {}


class Keyword(Field, Generic[Get, Set]):
    """A keyword: its value is read from the model and set in it.

    default: the value in a new setup, as text; quantity and unit: those of a number, empty where its page
    names none; label and page: of the control that edits it; choices: what its values mean; parts: the same
    for each of several values, where they differ.
    """

    kind = "a value"

    def __init__(self, name: str, default: str = "", quantity: str = "", unit: str = "", label: str = "",
                 page: str = "", choices: Mapping[str, str] = {}, parts: Sequence[Part] = (),
                 settable: bool = True) -> None:  # fmt: skip
        self.default = default
        self.quantity = quantity
        self.unit = unit
        self.label = label
        self.page = page
        self.choices = dict(choices)
        self.parts = tuple(parts)
        self.settable = settable
        lines = [f"{name}: {_with_unit(quantity, unit) or self.kind}; {default or 'empty'} in a new setup."]
        if choices:
            lines.append(_meanings(choices))
        if label:
            lines.append(f'"{label}" of page "{page}".')
        elif parts:
            lines.append(f'Of page "{page}":')
        for number, part in enumerate(parts, 1):
            what = [f'"{part.label}"', _with_unit(part.quantity, part.unit), _meanings(part.choices)]
            text = ", ".join(each for each in what if each) if part.label else "no control"
            lines.append(f"  value {number}: {text}")
        if not settable:
            lines.append("It follows from other values, and is not set by itself.")
        super().__init__(name, "\n".join(lines))

    @overload
    def __get__(self, section: None, owner: type) -> Keyword[Get, Set]: ...
    @overload
    def __get__(self, section: Section, owner: type) -> Get: ...
    def __get__(self, section: Optional[Section], owner: type) -> Any:
        return self if section is None else section._document.get(section._at(self.name))

    def __set__(self, section: Section, value: Set) -> None:
        try:
            section._document.set(section._at(self.name), value)
        except WrongValue as fault:
            if not self.choices:
                raise
            allowed = ", ".join(f"{choice} ({text.strip()})" for choice, text in self.choices.items())
            raise WrongValue(f"{fault}; allowed may be {allowed}", fault.path, fault.given, allowed) from None


class Flag(Keyword[bool, bool]):
    kind = "True or False"


class Whole(Keyword[int, int]):
    kind = "a whole number"


class Number(Keyword[float, float]):
    kind = "a number"


class Text(Keyword[str, str]):
    kind = "a text"


class File(Keyword[Optional[pathlib.Path], FileName]):
    """The name of a file as it stands in the setup: relative to the folder of the setup, or absolute. None for
    none."""

    kind = "a file"


class Moment(Keyword[Optional[datetime.datetime], datetime.datetime]):
    kind = "a datetime"


class Values(Keyword["tuple[Any, ...]", Sequence[Any]]):
    """A fixed number of values."""

    kind = "several values"


class Numbers(Keyword["list[Any]", Sequence[Any]]):
    """A list of any number of numbers."""

    kind = "a list of numbers"


class Sub(Field, Generic[S]):
    """A section in a section."""

    def __init__(self, name: str, kind: type[S]) -> None:
        super().__init__(name, f"Section {name}.")
        self.kind = kind

    @overload
    def __get__(self, section: None, owner: type) -> Sub[S]: ...
    @overload
    def __get__(self, section: Section, owner: type) -> S: ...
    def __get__(self, section: Optional[Section], owner: type) -> Any:
        return self if section is None else self.kind(section._document, section._at(self.name))

    def __set__(self, section: Section, value: Any) -> None:
        path = section._at(self.name)
        raise PathError(f"{path} is a section ({value!r} was given); allowed is to set a keyword in it", path, repr(value),
                        "to set a keyword in it")  # fmt: skip


class ListOf(Field, Generic[S]):
    """A list of like sections.

    count: the keyword beside it by which it is resized; follows: the path of the keyword that its length
    follows, where that is another list's.
    """

    def __init__(self, name: str, kind: type[S], count: str = "", follows: str = "") -> None:
        how = f"resized by {count}" if count else f"its length follows {follows or 'from other values'}"
        super().__init__(name, f"List of the sections {name.format('n')}, n from 1; {how}.")
        self.kind = kind
        self.count = count
        self.follows = follows

    @overload
    def __get__(self, section: None, owner: type) -> ListOf[S]: ...
    @overload
    def __get__(self, section: Section, owner: type) -> Items[S]: ...
    def __get__(self, section: Optional[Section], owner: type) -> Any:
        return self if section is None else Items(section, self)

    def __set__(self, section: Section, value: Any) -> None:
        path = section._at(self.name.format("n"))
        raise PathError(f"{path} is a list ({value!r} was given); allowed is to resize it, and to set keywords of its "
                        "items", path, repr(value), "to resize it, and to set keywords of its items")  # fmt: skip


class Items(Generic[S]):
    """The items of a list, counted from 1."""

    def __init__(self, section: Section, field: ListOf[S]) -> None:
        self._section = section
        self._field = field

    def __len__(self) -> int:
        return int(self._section._document.count(self._section._at(self._field.name)))

    def __getitem__(self, number: int) -> S:
        path = self._section._at(self._field.name.format("n"))
        if isinstance(number, bool) or not hasattr(number, "__index__"):
            raise WrongType(f"{path}: {number!r} was given; allowed is the number of an item, from 1", path,
                            repr(number), "a whole number")  # fmt: skip
        at = number.__index__()
        item = self._section._at(self._field.name.format(at))
        if at < 1 or not self._section._document.has(item, True):
            count = len(self)
            allowed = f"1 to {count}" if count else "none: the list is empty"
            raise RangeError(f"{path}: item {at} was given; allowed is {allowed}", path, str(at), allowed)
        return self._field.kind(self._section._document, item)

    def __setitem__(self, number: int, item: object) -> None:
        path = self._section._at(self._field.name.format(number))
        raise WrongType(f"{path}: {item!r} ({type(item).__name__}) was given; allowed is to set what the item has, "
                        "by its attributes", path, repr(item), "the attributes of the item")  # fmt: skip

    def __iter__(self) -> Iterator[S]:
        for number in range(1, len(self) + 1):
            yield self[number]

    def __reversed__(self) -> Iterator[S]:
        for number in range(len(self), 0, -1):
            yield self[number]

    def __contains__(self, item: object) -> bool:
        return any(item == each for each in self)

    def resize(self, count: int) -> None:
        """Appends items with defaults, or takes items from the end."""
        path = self._section._at(self._field.name.format("n"))
        if not self._field.count:
            follows = self._field.follows
            allowed = f"to set {follows}, which its length follows" if follows else "what follows from other values"
            raise PathError(f"{path}: {count!r} items were asked for; allowed is {allowed}", path, repr(count), allowed)
        self._section._document.set(self._section._at(self._field.count), count)

    def append(self) -> S:
        """Appends an item with defaults, and gives it."""
        count = len(self) + 1
        self.resize(count)
        return self[count]

    def __repr__(self) -> str:
        return f"<{len(self)} items {self._section._at(self._field.name.format('n'))}>"

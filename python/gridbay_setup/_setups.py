"""Whole setups: opened, made, saved, checked."""

from __future__ import annotations

import dataclasses
import datetime
import enum
import os
from collections.abc import Iterable
from types import ModuleType
from typing import Any, Optional, Union

from . import _flow_model, _wetland_sweep_kit
from ._sections import file_name
from .errors import WrongType, WrongValue
from .model import Model

_EDITIONS: dict[str, ModuleType] = {
    module.FILE_KIND: module for module in (_flow_model, _wetland_sweep_kit)
}

PathLike = Union[str, "os.PathLike[str]"]
Area = Union[PathLike, "tuple[PathLike, tuple[int, int]]", "tuple[PathLike, tuple[int, int], int]"]


class Severity(enum.IntEnum):
    """How much a message weighs."""

    FAULT = 1
    DEPENDED_UPON = 2  # a fault in a thing that others depend on


@dataclasses.dataclass(frozen=True)
class Message:
    """What a check found. page is the number of the page to look at, page_name its caption."""

    text: str
    severity: Severity
    page: int
    page_name: str

    def __str__(self) -> str:
        return f"{self.page_name}: {self.text}" if self.page_name else self.text


class Setup(Model):
    """A setup with all that it holds as attributes, and by path: setup["MODULE/SECTION/Keyword"].

    Different setups may be used from different threads. In one that several threads use, each reading and setting
    of a keyword, each check and each save is done as a whole, one after the other; what two threads set is a mixture
    of both, and a list may be shorter than it was when it was counted.
    """

    __slots__ = ()

    @property
    def file(self) -> str:
        """The file that it was read from or saved to; empty until there is one."""
        return str(self._document.path)

    @property
    def kind(self) -> str:
        """The extension of its files, "v27" or "v27wsk", which tells the edition."""
        return next(kind for kind, module in _EDITIONS.items() if isinstance(self._document, module.Document))

    @property
    def notes(self) -> list[str]:
        """What the load had to say, as that a section is missing."""
        return list(self._document.said)

    def unknown_sections(self) -> list[str]:
        """The sections of its file that this version does not know, and that a save leaves out."""
        return list(self._document.unknown_sections())

    def validate(self) -> list[Message]:
        """Checks the setup and the data files that it names; empty when nothing is wrong."""
        return [
            Message(text, Severity(severity), page, caption)
            for page, caption, severity, text in self._document.validate()
        ]

    def save(self, path: Optional[PathLike] = None) -> None:
        """Writes the setup, to the file that it has or to another one, which it has from then on. A file that is
        there is replaced, whole or not at all."""
        target = file_name(path, "save(path)") if path is not None else self.file
        if not target:
            raise WrongValue("save(path): None was given, and the setup has no file yet; allowed is a file "
                             f"*.{self.kind}", "save(path)", "None", f"*.{self.kind}")  # fmt: skip
        if _kind_of(target) != self.kind:
            raise WrongValue(f"{target}: a file of another kind was given; allowed is *.{self.kind}", target,
                             _kind_of(target), f"*.{self.kind}")  # fmt: skip
        self._document.save(target)

    def copy(self) -> Setup:
        """Another setup in the same exact state, with the same file."""
        return Setup(self._document.copy(), "")

    def same_as(self, other: Setup) -> bool:
        """Whether two setups of one edition are in the same exact state."""
        if not isinstance(other, Setup):
            raise WrongType(f"same_as(other): {other!r} ({type(other).__name__}) was given; allowed is a setup", "other",
                            repr(other), "a setup")  # fmt: skip
        return self.kind == other.kind and bool(self._document.is_same(other._document))

    def detect_boundaries(self) -> int:
        """Finds the open boundaries on the border of the first area's grid, and the projection of that. The number
        of boundaries."""
        return int(self._document.detect_boundaries())


def _kind_of(path: str) -> str:
    return os.path.splitext(path)[1].lstrip(".").lower()


def _edition_of(kind: str, given: str, form: str = "*.{}") -> ModuleType:
    if not isinstance(kind, str) or kind not in _EDITIONS:
        allowed = " or ".join(form.format(each) for each in _EDITIONS)
        raise WrongValue(f"{given}: {kind!r} was given; allowed is {allowed}", str(given), repr(kind), allowed)
    return _EDITIONS[kind]


def open(path: PathLike) -> Setup:
    """Reads a setup; the extension tells the edition."""
    name = file_name(path, "open(path)")
    return Setup(_edition_of(_kind_of(name), name).open(name), "")


def new(
    kind: str = "v27",
    areas: Iterable[Area] = (),
    start: Optional[datetime.datetime] = None,
    time_step: Optional[float] = None,
    time_steps: Optional[int] = None,
) -> Setup:
    """A setup with the defaults of a new one.

    kind: "v27" or "v27wsk", the edition. areas: the grid files, outermost first; a nested one as (file, (J, K)),
    the point of the enclosing grid that holds its first point, or (file, (J, K), number of the enclosing area),
    which is the area before it otherwise; with them the projection and the open boundaries that follow from the first
    one. A place that cannot be is a WrongValue, a file that is no grid a FileError.
    start: of the simulation; time_step: s; time_steps: how many.
    """
    setup = Setup(_edition_of(kind, "new(kind)", "{!r}").new(areas), "")
    period = setup.nested_model_globals.simulation_period
    if start is not None:
        period.start_time = start
    if time_step is not None:
        period.time_step_interval = time_step
    if time_steps is not None:
        period.number_of_timesteps = time_steps
    return setup

"""The exceptions of the package."""

__all__ = ["SetupError", "FileError", "PathError", "RangeError", "WrongType", "WrongValue", "Stopped"]


class SetupError(Exception):
    """The base of them all.

    path: what it is about, a path in the setup or of a file; given: what was given; allowed: what is allowed.
    Each is empty where it does not apply; the text of the exception says all of it.
    """

    def __init__(self, text: str, path: str = "", given: str = "", allowed: str = "") -> None:
        super().__init__(text)
        self.text = text
        self.path = path
        self.given = given
        self.allowed = allowed

    def __str__(self) -> str:
        return self.text

    def __reduce__(self) -> "tuple[type[SetupError], tuple[str, str, str, str]]":
        return type(self), (self.text, self.path, self.given, self.allowed)


class FileError(SetupError, OSError):
    """A file that cannot be read or written, or is none of its kind."""


class PathError(SetupError, KeyError, AttributeError):
    """There is no such section or keyword, or it is not set by itself."""


class RangeError(SetupError, IndexError):
    """A number of an item or time step that is not there."""


class WrongType(SetupError, TypeError):
    """A value of a wrong type."""


class WrongValue(SetupError, ValueError):
    """A value that is not allowed."""


class Stopped(SetupError):
    """A conversion that the script has stopped; nothing is written."""

"""What the package raises.

An exception of any class that is raised while the control calls a model written in Python reaches the
control as error 440 with the exception's text; a NumberedError keeps its number and description, and
a MemoryError is error 7. The control shows it to the user and ends the procedure that called.
The functions make the errors that a model of one's own is asked for.
"""

from zandor._zandor import (
    duplicateKey,
    invalidProcedureCall,
    invalidPropertyValue,
    objectNotSet,
    subscriptOutOfRange,
)

__all__ = [
    "DatabaseError",
    "Error",
    "FileError",
    "NumberedError",
    "duplicateKey",
    "invalidProcedureCall",
    "invalidPropertyValue",
    "objectNotSet",
    "subscriptOutOfRange",
]


class Error(Exception):
    """The base of all of them. Its text is one line that says what went wrong."""


class NumberedError(Error):
    """An error of the classic runtime, as the control and the ready-made model raise them."""

    def __init__(self, number: int, description: str):
        super().__init__(number, description)
        self.number = number
        self.description = description

    def __str__(self) -> str:
        return f"{self.description} (error {self.number})"


class FileError(Error):
    """A query file that cannot be read or written."""

    def __init__(self, text: str, code: str = "", reason: str = ""):
        super().__init__(text)
        #: Of the message; stays as it is from version to version.
        self.code = code
        #: The system's own words; empty when it was not the system that refused.
        self.reason = reason


class DatabaseError(Error):
    """A database that cannot be opened or read."""

    def __init__(self, text: str, code: str = "", reason: str = ""):
        super().__init__(text)
        #: Of the message; stays as it is from version to version.
        self.code = code
        self.reason = reason

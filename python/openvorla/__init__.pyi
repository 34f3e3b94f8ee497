"""Python plug-ins for the Vorla application.

`OpenVorla` holds the host's value classes and function sets; `OpenVorlaVPx`
holds the proxy classes that plug-ins derive from and `VFnPlugin`.
"""

from typing import Protocol, TypeVar


class _SwigPyObject:
    """The wrapped pointer both extensions make (its type is named
    SwigPyObject): the `this` of every proxy object, and what a host object
    of a type no module wraps reaches Python as."""
    def own(self, value: object = ..., /) -> bool: ...
    def disown(self) -> None: ...
    def acquire(self) -> None: ...
    def append(self, other: _SwigPyObject, /) -> None: ...
    def next(self) -> _SwigPyObject | None: ...
    def __int__(self) -> int: ...


_T_co = TypeVar('_T_co', covariant=True)


class _Sequence(Protocol[_T_co]):
    """What stands for a value class's object where one is taken: anything
    with a length and items by index (a list, a tuple, a numpy array, another
    value)."""
    def __len__(self) -> int: ...
    def __getitem__(self, index: int, /) -> _T_co: ...

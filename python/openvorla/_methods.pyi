"""The method type of the proxy classes."""
from typing import Any, Callable, final


@final
class method:
    """method(builtin, doc=None, signature=None): the built-in as a method of a proxy class"""
    __wrapped__: Callable[..., Any]
    __text_signature__: str | None
    # None, so that inspect.signature reads __text_signature__ here
    __signature__: None
    @property
    def __name__(self) -> str: ...
    def __new__(cls, builtin: Callable[..., Any], doc: str | None = ...,
                signature: str | None = ..., /) -> method: ...
    def __get__(self, obj: object, cls: type | None = ..., /) -> Any: ...
    def __call__(self, *args: Any) -> Any: ...

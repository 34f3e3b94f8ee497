"""The binding model. Every rule that a generated module applies is decided
here, once: calling forms, argument and result conversions with their message
texts, overload candidates and their tests, which constructors refuse a plain
object, director classes and their forwarding overrides, type descriptors and
their cast lists, installation order. Emitters only print what it builds."""
from ..parse import CType
from .builder import OVERLOAD_HEAD, REFUSE_PLAIN, build
from .naming import GeneratorError, c_string, pointer_descriptor_name, spell
from .records import (METH_FASTCALL, METH_NOARGS, METH_O, METH_VARARGS, Arg, Candidate, Cast, Companion,
                      Constant, Descriptor, DirectorClass, DispatchRule, EntryPoint, Forward,
                      ForwardArg, ForwardResult, GlobalVariable, MethodEntry, Module,
                      PointerClass, Result, WrappedClass)

__all__ = ['CType', 'OVERLOAD_HEAD', 'REFUSE_PLAIN', 'build', 'GeneratorError', 'c_string',
           'pointer_descriptor_name', 'spell', 'METH_FASTCALL', 'METH_NOARGS', 'METH_O', 'METH_VARARGS', 'Arg',
           'Candidate', 'Cast', 'Companion', 'Constant', 'Descriptor', 'DirectorClass',
           'DispatchRule', 'EntryPoint', 'Forward', 'ForwardArg', 'ForwardResult',
           'GlobalVariable', 'MethodEntry', 'Module', 'PointerClass', 'Result', 'WrappedClass']

"""The binding model. Every rule that a generated module applies is decided
here, once: calling forms, argument and result conversions with their message
texts, overload candidates and their tests, which constructors refuse a plain
object, type descriptors and their cast lists, installation order. Emitters
only print what it builds."""
from .builder import OVERLOAD_HEAD, REFUSE_PLAIN, build
from .records import (METH_NOARGS, METH_O, METH_VARARGS, Arg, Candidate, Cast, Constant,
                      Descriptor, DispatchRule, EntryPoint, GlobalVariable, MethodEntry, Module,
                      PointerClass, Result, WrappedClass)
from .types import GeneratorError, c_string, pointer_descriptor_name, spell
from ..parse import CType

__all__ = ['OVERLOAD_HEAD', 'REFUSE_PLAIN', 'build', 'METH_NOARGS', 'METH_O', 'METH_VARARGS',
           'Arg', 'Candidate', 'Cast', 'Constant', 'Descriptor', 'DispatchRule', 'EntryPoint',
           'GlobalVariable', 'MethodEntry', 'Module', 'PointerClass', 'Result', 'WrappedClass',
           'GeneratorError', 'c_string', 'pointer_descriptor_name', 'spell', 'CType']

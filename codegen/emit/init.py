"""Module initialisation, the constants and variables it installs, and the
data the host reads from the plug-in file."""
from __future__ import annotations

from .common import banner, c_string, namespace_close, namespace_open
from . import variables
from ..model import Constant, GlobalVariable, Module


def _exports(module: Module) -> str:
    """VApiVersion and the signature block right after it, as one 16-byte
    aligned run of writable data, so the host finds the block at a fixed
    offset from the version string."""
    sig = module.signature()
    rows = ''.join('  "  .byte ' + ', '.join(f'0x{b:02x}' for b in sig[i:i + 16]) + '\\n"\n'
                   for i in range(0, len(sig), 16))
    version = module.api_version.encode()
    pad = 16 - len(version)
    return ('// The interface version and the plug-in signature, read by the host\n'
            '// without importing the module.\n'
            '__asm__(\n'
            '  "  .pushsection .data.plugin_exports,\\"aw\\",@progbits\\n"\n'
            '  "  .balign 16\\n"\n'
            '  "  .globl VApiVersion\\n"\n'
            '  "  .type VApiVersion, @object\\n"\n'
            '  "  .size VApiVersion, 16\\n"\n'
            '  "VApiVersion:\\n"\n'
            f'  "  .ascii \\"{module.api_version}\\"\\n"\n'
            f'  "  .zero {pad}\\n"\n'
            '  "  .globl HLVN_PLUGIN_SIGNATURE\\n"\n'
            '  "  .type HLVN_PLUGIN_SIGNATURE, @object\\n"\n'
            f'  "  .size HLVN_PLUGIN_SIGNATURE, {len(sig)}\\n"\n'
            '  "HLVN_PLUGIN_SIGNATURE:\\n"\n'
            f'{rows}'
            '  "  .popsection\\n");\n\n')


def _constant(c: Constant) -> str:
    if isinstance(c.value, str):
        value = f'PyUnicode_DecodeUTF8({c.cpp}, sizeof({c.cpp}) - 1, "surrogateescape")'
    elif c.make:
        value = f'{c.make}({c.cpp})'
    else:
        value = f'PyLong_FromLong(static_cast<long>({c.cpp}))'
    return f'  swigrt::SetConstant(d, {c_string(c.name)}, {value});\n'


def _variable(v: GlobalVariable) -> str:
    return (f'  swigrt::AddVariable(globals, {c_string(v.name)}, {variables.getter(v)}, '
            f'{variables.setter(v)});\n')


def emit(module: Module) -> str:
    out = [banner(module, 'module initialisation'), f'#include "{module.ident}_wrap.h"\n\n']
    if module.api_version:
        out.append(_exports(module))
    out.append(namespace_open(module))
    if module.resources:
        out.append('\n// Message resources of the scripting engine, made in this order when the\n'
                   '// library loads and destroyed in reverse when it unloads.\n')
        out += [f'TstringId {key}({c_string(table)}, {c_string(key)});\n'
                for table, key in module.resources]
    out.append('\nnamespace {\n\n'
               'swig_const_info constant_table[] = {{0, nullptr, 0, 0, nullptr, nullptr}};\n\n'
               'PyModuleDef module_def = {\n'
               f'    PyModuleDef_HEAD_INIT, {c_string(module.name)}, nullptr, -1, module_methods,\n'
               '    nullptr, nullptr, nullptr, nullptr};\n\n')
    out.append('// The explicit constants, stored before the link object exists.\n'
               'void install_start_constants([[maybe_unused]] PyObject *d) {\n')
    out += [_constant(c) for c in module.start_constants]
    out.append('}\n\n// Class by class: its constants, then its variables.\n'
               'void install_class_members([[maybe_unused]] PyObject *d, '
               '[[maybe_unused]] PyObject *globals) {\n')
    out += [_constant(c) if isinstance(c, Constant) else _variable(c) for c in module.installs]
    out.append('}\n\nPyObject *init_module() {\n'
               '  swigrt::ThisString();\n'
               '  swigrt::TypeCache();\n'
               '  swigrt::SwigPyPacked_type();\n'
               '  swigrt::SwigPyObject_type();\n'
               '  swigrt::SetProxyDocMethods(proxydoc_methods);\n'
               '  swigrt::FixMethods(module_methods, constant_table, swig_types, '
               'swig_module.type_initial);\n'
               '  PyObject *m = PyModule_Create2(&module_def, 1013);\n'
               '  PyObject *d = PyModule_GetDict(m);\n'
               '  swigrt::InitializeModule(&swig_module);\n'
               '  swigrt::InstallConstants(d, constant_table);\n'
               '  install_start_constants(d);\n'
               '  PyObject *globals = swigrt::Globals();\n'
               '  if (!globals) {\n'
               '    PyErr_SetString(PyExc_TypeError, "Failure to create SWIG globals.");\n'
               '    return nullptr;\n'
               '  }\n'
               '  PyDict_SetItemString(d, "cvar", globals);\n'
               '  install_class_members(d, globals);\n'
               '  return m;\n'
               '}\n\n}  // namespace\n\n')
    out.append(namespace_close(module))
    out.append(f'\nextern "C" __attribute__((visibility("default"))) PyObject *PyInit_{module.name}() {{\n'
               '  try {\n'
               f'    return {module.ident}_wrap::init_module();\n'
               '  } catch (...) {\n'
               '    PyErr_SetString(PyExc_SystemError, "unexpected C++ exception during module '
               'initialisation");\n'
               '    return nullptr;\n'
               '  }\n}\n')
    return ''.join(out)

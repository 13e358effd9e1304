# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""The C library as ctypes sees it: where it is found, and the forms of its structs and calls.

The library is the one that the environment names in OLVANE_LIBRARY, else the one that lies in the package, else the one
that the system knows.
"""

from __future__ import annotations

import ctypes
import os
from ctypes import POINTER, c_char_p, c_float, c_int, c_int32, c_int64, c_size_t, c_uint32, c_void_p

_SONAME = "libolvane_c.so.0.1"

ParentCallback = ctypes.CFUNCTYPE(c_int, c_void_p, c_int64, POINTER(c_int64))
ListCallback = ctypes.CFUNCTYPE(c_int, c_void_p, c_int64, c_void_p)
PreferredCallback = ctypes.CFUNCTYPE(c_int, c_void_p, c_int64, c_int64, POINTER(c_int))
DeadCallback = ctypes.CFUNCTYPE(c_int, c_void_p, c_int64, POINTER(c_int))
DateCallback = ctypes.CFUNCTYPE(c_int, c_void_p, c_int64, c_int, c_void_p)
SexCallback = ctypes.CFUNCTYPE(c_int, c_void_p, c_int64, POINTER(c_int32))


class HostStruct(ctypes.Structure):
    """olvane_host"""

    _fields_ = [
        ("struct_size", c_size_t),
        ("context", c_void_p),
        ("father_of", ParentCallback),
        ("mother_of", ParentCallback),
        ("spouses_of", ListCallback),
        ("children_of", ListCallback),
        ("is_preferred_spouse", PreferredCallback),
        ("is_dead", DeadCallback),
        ("date_of", DateCallback),
        ("sex_of", SexCallback),
    ]


class SizesStruct(ctypes.Structure):
    """olvane_sizes"""

    _fields_ = [
        ("node_width", c_float),
        ("node_height", c_float),
        ("horz_padding", c_float),
        ("vert_padding", c_float),
        ("spouse_line_step", c_float),
        ("line_inset", c_float),
    ]


class OptionsStruct(ctypes.Structure):
    """olvane_options"""

    _fields_ = [
        ("struct_size", c_size_t),
        ("sizes", SizesStruct),
        ("shown", c_uint32),
        ("generations", c_int32),
        ("flag_depth", c_int32),
    ]


def _library_name() -> str:
    beside = os.path.join(os.path.dirname(__file__), _SONAME)
    return os.environ.get("OLVANE_LIBRARY") or (beside if os.path.exists(beside) else _SONAME)


def _load() -> ctypes.CDLL:
    name = _library_name()
    try:
        return ctypes.CDLL(name)
    except OSError as error:
        raise ImportError(f"the layout library can't be loaded: {error}; OLVANE_LIBRARY may name it") from error


def _declare(loaded: ctypes.CDLL) -> None:
    layout_pointer = POINTER(c_void_p)
    signatures = {
        "olvane_status_text": ([c_int], c_char_p),
        "olvane_version": ([], c_char_p),
        "olvane_person_list_append": ([c_void_p, POINTER(c_int64), c_size_t], c_int),
        "olvane_date_set": ([c_void_p, c_char_p], c_int),
        "olvane_options_default": ([POINTER(OptionsStruct)], c_int),
        "olvane_layout_family": ([POINTER(HostStruct), c_int64, POINTER(OptionsStruct), layout_pointer], c_int),
        "olvane_layout_pedigree": ([POINTER(HostStruct), c_int64, POINTER(OptionsStruct), layout_pointer], c_int),
        "olvane_layout_free": ([c_void_p], None),
        "olvane_layout_text": ([c_void_p, layout_pointer, POINTER(c_size_t)], c_int),
        "olvane_layout_records": ([c_void_p, layout_pointer, POINTER(c_size_t)], c_int),
        "olvane_layout_host_code": ([c_void_p, POINTER(c_int)], c_int),
    }
    for name, (arguments, result) in signatures.items():
        function = getattr(loaded, name)
        function.argtypes = arguments
        function.restype = result


def decoded(text: c_void_p, length: c_size_t) -> str:
    """The library's own ASCII text as a str, copied once."""
    made: str = _decode(text, length, None) if text else ""
    return made


_decode = ctypes.pythonapi.PyUnicode_DecodeASCII
_decode.argtypes = [c_void_p, c_size_t, c_char_p]
_decode.restype = ctypes.py_object

library = _load()
_declare(library)

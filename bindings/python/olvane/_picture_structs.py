# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""The structs of olvane_picture.h as ctypes sees them, field by field in their order."""

from __future__ import annotations

import ctypes
from ctypes import POINTER, c_char_p, c_double, c_float, c_int32, c_int64, c_size_t, c_uint32, c_void_p

from olvane import _native


class Fold(ctypes.Structure):
    """olvane_fold"""

    _fields_ = [("person", c_int64), ("branch", c_int32)]


class BoxSize(ctypes.Structure):
    """olvane_box_size"""

    _fields_ = [("person", c_int64), ("width", c_float), ("height", c_float)]


class OptionsStruct(ctypes.Structure):
    """olvane_picture_options"""

    _fields_ = [
        ("struct_size", c_size_t),
        ("view", c_int32),
        ("up", c_int32),
        ("down", c_int32),
        ("direction", c_int32),
        ("spouses", c_int32),
        ("siblings", c_int32),
        ("compact", c_int32),
        ("fan_of", c_int32),
        ("fan_angle", c_double),
        ("other", c_int64),
        ("ways", c_int32),
        ("most_ways", c_int32),
        ("language", c_int32),
        ("marks", c_int32),
        ("effort", c_int32),
        ("all_parts", c_int32),
        ("unknown_parents", c_int32),
        ("hide_living", c_int32),
        ("year", c_int32),
        ("mirrored", c_int32),
        ("folds", POINTER(Fold)),
        ("fold_count", c_size_t),
        ("layout", _native.OptionsStruct),
        ("earlier", c_void_p),
        ("box_sizes", POINTER(BoxSize)),
        ("box_size_count", c_size_t),
        ("aspect", c_double),
    ]


class OptionInfoStruct(ctypes.Structure):
    """olvane_picture_option"""

    _fields_ = [
        ("struct_size", c_size_t),
        ("name", c_char_p),
        ("kind", c_int32),
        ("views", c_uint32),
        ("least", c_double),
        ("most", c_double),
        ("usual", c_double),
    ]


class BoxStruct(ctypes.Structure):
    _fields_ = [
        ("id", c_int64),
        ("x", c_double),
        ("y", c_double),
        ("width", c_float),
        ("height", c_float),
        ("kind", c_int32),
        ("sex", c_int32),
        ("child_of", c_int32),
        ("repeat", c_int32),
        ("flag", c_int32),
        ("hidden_parents", c_int32),
        ("hidden_partners", c_int32),
        ("hidden_children", c_int32),
        ("further_parents", c_int32),
        ("living", c_int32),
    ]


class FamilyStruct(ctypes.Structure):
    _fields_ = [
        ("first_member", c_uint32),
        ("parent_count", c_uint32),
        ("child_count", c_uint32),
        ("first_line", c_uint32),
        ("line_count", c_uint32),
        ("number", c_uint32),
        ("state", c_int32),
    ]


class LineStruct(ctypes.Structure):
    _fields_ = [
        ("x1", c_double),
        ("y1", c_double),
        ("x2", c_double),
        ("y2", c_double),
        ("role", c_int32),
        ("child", c_int32),
        ("first_bridge", c_uint32),
        ("bridge_count", c_uint32),
    ]


class MarkStruct(ctypes.Structure):
    _fields_ = [("kind", c_int32), ("number", c_int32), ("boxes", c_int32 * 3)]


class ArcStruct(ctypes.Structure):
    _fields_ = [("start", c_double), ("end", c_double), ("ring", c_int32), ("line", c_int32)]


class WayStruct(ctypes.Structure):
    _fields_ = [
        ("first_box", c_uint32),
        ("box_count", c_uint32),
        ("ancestor_count", c_uint32),
        ("first_piece", c_uint32),
        ("piece_count", c_uint32),
        ("kind", c_int32),
        ("words", c_char_p),
    ]


class PieceStruct(ctypes.Structure):
    _fields_ = [("x1", c_double), ("y1", c_double), ("x2", c_double), ("y2", c_double)]


class FoldedStruct(ctypes.Structure):
    _fields_ = [("box", c_int32), ("count", c_int32), ("branch", c_int32), ("side", c_int32)]


class ArraysStruct(ctypes.Structure):
    _fields_ = [
        ("struct_size", c_size_t),
        ("boxes", POINTER(BoxStruct)),
        ("box_count", c_size_t),
        ("families", POINTER(FamilyStruct)),
        ("family_count", c_size_t),
        ("members", POINTER(c_int32)),
        ("child_kinds", POINTER(c_int32)),
        ("member_count", c_size_t),
        ("lines", POINTER(LineStruct)),
        ("line_count", c_size_t),
        ("bridges", POINTER(c_double)),
        ("bridge_count", c_size_t),
        ("marks", POINTER(MarkStruct)),
        ("mark_count", c_size_t),
        ("focus", c_int32),
        ("other", c_int32),
        ("arcs", POINTER(ArcStruct)),
        ("arc_count", c_size_t),
        ("ring_radii", POINTER(c_double)),
        ("ring_radius_count", c_size_t),
        ("middle_x", c_double),
        ("middle_y", c_double),
        ("ways", POINTER(WayStruct)),
        ("way_count", c_size_t),
        ("way_boxes", POINTER(c_int32)),
        ("way_box_count", c_size_t),
        ("way_pieces", POINTER(PieceStruct)),
        ("way_piece_count", c_size_t),
        ("focus_is", c_char_p),
        ("other_is", c_char_p),
        ("folded", POINTER(FoldedStruct)),
        ("folded_count", c_size_t),
    ]

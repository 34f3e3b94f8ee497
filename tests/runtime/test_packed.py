"""SwigPyPacked: the printed forms of a copied byte block."""

import vorlatesthost as host


def test_packed_text_is_hex_in_memory_order():
    packed = host.new_packed(bytes([0x00, 0x9F, 0xA0, 0xFF]), "_p_VPxNode")
    assert repr(packed) == "<Swig Packed at _009fa0ff_p_VPxNode>"
    assert str(packed) == "_009fa0ff_p_VPxNode"


def test_blocks_too_large_for_the_text_fall_back_to_the_type_name():
    fits = bytes(range(256)) + bytes(range(255))
    assert len(fits) == 511
    packed = host.new_packed(fits, "_p_VPxNode")
    assert repr(packed) == "<Swig Packed at _" + fits.hex() + "_p_VPxNode>"
    assert str(packed) == "_" + fits.hex() + "_p_VPxNode"

    too_big = host.new_packed(fits + b"\x01", "_p_VPxNode")
    assert repr(too_big) == "<Swig Packed _p_VPxNode>"
    assert str(too_big) == "_p_VPxNode"


def test_the_block_is_a_copy():
    packed = host.new_packed(bytes([1, 2]), "_p_VObject")
    # The source bytes are gone; reuse their memory before reading back.
    filler = [bytes([0xEE, 0xEE]) * 1 for _ in range(100)]
    assert filler and str(packed) == "_0102_p_VObject"

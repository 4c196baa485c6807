"""Which words are instructions of ARMv4, and where execution can go from one of them.

After the encoding tables of the architecture: what a processor of that version would not run as
meant is refused, including what later versions made of the gaps.
"""

ALWAYS, NEVER = 14, 15
LR, PC = 14, 15


class NotArmv4(Exception):
    pass


def _bits(word, high, low):
    return word >> low & (1 << (high - low + 1)) - 1


def _check_multiply_or_small_transfer(word):
    """Bits 7 and 4 set in a data-processing word with a register operand."""
    kind = _bits(word, 6, 5)
    if kind == 0:
        group = _bits(word, 27, 23)
        if group == 0 and not _bits(word, 22, 22):
            return  # MUL, MLA
        if group == 1:
            return  # UMULL, UMLAL, SMULL, SMLAL
        if group == 2 and not _bits(word, 21, 20) and not _bits(word, 11, 8):
            return  # SWP
        raise NotArmv4("a multiplication of later versions")
    if not _bits(word, 20, 20) and kind != 1:
        raise NotArmv4("LDRD or STRD")
    # LDRH, STRH, LDRSB, LDRSH
    if not _bits(word, 22, 22) and _bits(word, 11, 8):
        raise NotArmv4("a halfword transfer with stray bits")


def _check_miscellaneous(word):
    """TST, TEQ, CMP and CMN without flags: MRS and MSR in version 4, much else later."""
    reads_status = word & 0x0FBF0FFF == 0x010F0000
    writes_status = word & 0x0FB0FFF0 == 0x0120F000 or word & 0x0FB0F000 == 0x0320F000
    if not reads_status and not writes_status:
        raise NotArmv4("BX, BLX, CLZ or another of the later miscellaneous instructions")


def check(word):
    """Raises NotArmv4 for a word that is no instruction of that version."""
    if word >> 28 == NEVER:
        raise NotArmv4("an unconditional instruction of later versions")
    group = _bits(word, 27, 25)
    if group in (0, 1):
        if group == 0 and word & 0x90 == 0x90:
            _check_multiply_or_small_transfer(word)
        elif _bits(word, 24, 23) == 2 and not _bits(word, 20, 20):
            _check_miscellaneous(word)
    elif group == 3 and word & 0x10:
        raise NotArmv4("a media instruction")
    elif group in (6, 7) and word & 0x0F000000 != 0x0F000000:
        raise NotArmv4("a coprocessor instruction")


def branch_target(word, address):
    """Where B or BL at this address goes, or None for other instructions."""
    if _bits(word, 27, 25) != 5:
        return None
    offset = (word & 0xFFFFFF) - (1 << 24 if word & 0x800000 else 0)
    return address + 8 + 4 * offset


def ends_flow(word):
    """Whether execution never goes on at the next word."""
    if word >> 28 != ALWAYS:
        return False
    group = _bits(word, 27, 25)
    if group == 5:
        return not _bits(word, 24, 24)  # B, not BL
    if group == 4:
        return bool(_bits(word, 20, 20) and word >> PC & 1)  # LDM with the program counter
    if group in (2, 3):
        return bool(_bits(word, 20, 20) and _bits(word, 15, 12) == PC)  # LDR into it
    if group in (0, 1) and word & 0x0E000090 != 0x90 and _bits(word, 15, 12) == PC:
        compares = 8 <= _bits(word, 24, 21) <= 11
        # ADD to the program counter jumps a little ahead, into code that follows.
        adds_ahead = _bits(word, 24, 21) == 4 and _bits(word, 19, 16) == PC
        return not compares and not adds_ahead
    return False


def is_call_through_register(word, before):
    """MOV PC after MOV LR, PC: execution comes back to the next word."""
    saves_return = before & 0x0FFFFFFF == 0x01A0E00F
    return saves_return and (_bits(word, 15, 12) == PC)

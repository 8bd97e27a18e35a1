"""The library's enumerations. Every function takes a member, its name, or its number."""

from enum import IntEnum


class IllumObs(IntEnum):
    """A CIE illuminant with the 1931 2-degree or the 1964 10-degree standard observer.

    F12 is a three-narrow-band lamp of 3000 K.
    """

    A_2DEG = 0
    A_10DEG = 1
    C_2DEG = 2
    C_10DEG = 3
    D50_2DEG = 4
    D50_10DEG = 5
    D65_2DEG = 6
    D65_10DEG = 7
    F2_2DEG = 8
    F2_10DEG = 9
    F7_2DEG = 10
    F7_10DEG = 11
    F11_2DEG = 12
    F11_10DEG = 13
    F12_2DEG = 14
    F12_10DEG = 15
    D75_2DEG = 16
    D75_10DEG = 17


class Status(IntEnum):
    """Density status: a family of filters (ISO 5-3 Statuses A, E, I and T, and six more).

    SPECTRAL_STATUS reads one wavelength: its response is that wavelength in nm. SPECTRALX_STATUS
    reads a five-band window where the ink absorbs: its response is a band. Names are accepted
    without their ending too: "E" is "E_STATUS".
    """

    A_STATUS = 0
    E_STATUS = 1
    I_STATUS = 2
    T_STATUS = 3
    SPECTRAL_STATUS = 4
    SPECTRALX_STATUS = 5
    HIFI_STATUS = 6
    HEXACHROME_STATUS = 7
    CCR1_STATUS = 8
    CCR2_STATUS = 9


class Response(IntEnum):
    """Density response: one filter of a status, and the index of its density in a set.

    Names are accepted without their ending too: "RED" is "RED_RESPONSE".
    """

    VISUAL_RESPONSE = 0
    RED_RESPONSE = 1
    GREEN_RESPONSE = 2
    BLUE_RESPONSE = 3
    HIFI1_RESPONSE = 4
    HIFI2_RESPONSE = 5
    HIFI3_RESPONSE = 6
    HEXACHROME1_RESPONSE = 7
    HEXACHROME2_RESPONSE = 8

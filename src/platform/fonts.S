/* The font files as read-only data; the build defines their paths. */

#define FONT_FILE(name, path) \
    .global name;             \
    .balign 16;               \
    name: .incbin path

    .section .rodata
    FONT_FILE(quabbleFontSans, FONT_SANS)
    FONT_FILE(quabbleFontSansBold, FONT_SANS_BOLD)
    FONT_FILE(quabbleFontSansNarrowBold, FONT_SANS_NARROW_BOLD)
    FONT_FILE(quabbleFontSerifBold, FONT_SERIF_BOLD)

    .section .note.GNU-stack, "", %progbits

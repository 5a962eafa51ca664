/* The rendered icon as read-only data; the build defines its path. */

    .section .rodata
    .global quabbleIcon
    .balign 16
quabbleIcon:
    .incbin ICON_PIXELS

    .section .note.GNU-stack, "", %progbits

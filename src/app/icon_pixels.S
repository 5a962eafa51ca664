/* The rendered icon in all its sizes as read-only data; the build defines the paths. */

    .section .rodata
    .global quabbleIcons
    .balign 16
quabbleIcons:
    .incbin ICON_16
    .incbin ICON_32
    .incbin ICON_48
    .incbin ICON_64
    .incbin ICON_128

    .section .note.GNU-stack, "", %progbits

# The core-suite noise hook.  The host calls core slot 3 with a pointer to its
# noise bytes (rdi), their count (esi) and the wrap distance (edx), followed by
# arguments the plug-in does not know.  The hook records the first three and
# jumps to the host's saved slot-3 routine: every register argument (rax, which
# carries the vector-register count of a variadic call, included) and every
# stack argument reaches it unchanged, and no frame of the hook's stays
# between the host and its routine.

    .text
    .globl  HalideQKCoreNoiseHook
    .type   HalideQKCoreNoiseHook, @function
    .p2align 4
HalideQKCoreNoiseHook:
    .cfi_startproc
    movq    gNoiseData@GOTPCREL(%rip), %r11
    movq    %rdi, (%r11)
    movq    gNoisePtr@GOTPCREL(%rip), %r11
    movq    %rdi, (%r11)
    movq    gNoiseLength@GOTPCREL(%rip), %r11
    movl    %esi, (%r11)
    movq    gNoiseWrap@GOTPCREL(%rip), %r11
    movl    %edx, (%r11)
    # gNoiseLimit = p + w, w taken as unsigned 32-bit.
    pushq   %rax
    .cfi_adjust_cfa_offset 8
    movl    %edx, %eax
    addq    %rdi, %rax
    movq    gNoiseLimit@GOTPCREL(%rip), %r11
    movq    %rax, (%r11)
    popq    %rax
    .cfi_adjust_cfa_offset -8
    movq    halideQKOriginalCoreQKTable@GOTPCREL(%rip), %r11
    jmpq    *24(%r11)
    .cfi_endproc
    .size   HalideQKCoreNoiseHook, .-HalideQKCoreNoiseHook

    .section .note.GNU-stack,"",@progbits

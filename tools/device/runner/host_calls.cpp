// In assembly, since no C++ function type says "as many words as the callee pops". See
// host_calls.h.
#include "runner/host_calls.h"

asm(R"(
    .globl _CallHost, _CallHostForDouble
_CallHost:
_CallHostForDouble:
    pushl %ebp
    movl %esp, %ebp
    pushl %esi
    pushl %edi
    subl $64, %esp
    andl $-16, %esp
    movl 12(%ebp), %esi
    movl %esp, %edi
    movl $16, %ecx
    cld
    rep movsl
    call *8(%ebp)
    leal -8(%ebp), %esp
    popl %edi
    popl %esi
    popl %ebp
    ret
)");

#define KOR_ENTRY(name, words, bytes)                                                              \
    asm("    .globl _" name "\n_" name ":\n"                                                       \
        "    leal 4(%esp), %ecx\n"                                                                 \
        "    pushl $" words "\n"                                                                   \
        "    pushl %ecx\n"                                                                         \
        "    pushl %eax\n"                                                                         \
        "    call _EnterFromHost\n"                                                                \
        "    addl $12, %esp\n"                                                                     \
        "    ret $" bytes "\n")

KOR_ENTRY("EnterWith2Words", "2", "8");
KOR_ENTRY("EnterWith3Words", "3", "12");
KOR_ENTRY("EnterWith4Words", "4", "16");
KOR_ENTRY("EnterCdecl", "2", "0");

# Rewrites the assembly of arm-none-eabi-gcc for the assembler of arm-wince-pe: the instructions are
# the same, the directives around them are not. Whatever it does not know stops the build, and so do
# the two things that the library promises not to have: code that runs at load, and thread-local data.
#
# Sections keep the compiler's one section per function and per variable, so that the linker can
# leave out what nobody uses: ".text.f" becomes ".text$f". Groups (inline functions and variables
# that several files define) become sections of which the linker keeps the first.

function fail(what) {
    print "elf_to_coff: " what > "/dev/stderr"
    failed = 1
    exit 1
}

# section_base(NAME): the section of the image that an ELF section goes to, "" for one that has none.
# Leaves in `kind` the flags that it has there. There is no ".bss$f": what is zero at load goes to .data.
function section_base(name) {
    if (name ~ /^\.text(\.|$)/) { kind = "x"; return ".text" }
    if (name ~ /^\.rodata(\.|$)/) { kind = "dr"; return ".rdata" }
    if (name ~ /^\.(data|bss)(\.|$)/) { kind = "dw"; return ".data" }
    return ""
}

function start_section(name, flags, group,    base) {
    ignored = name ~ /^\.(note|comment|ARM\.attributes)/
    if (ignored) return
    base = section_base(name)
    if (base == "") fail("section " name " has no place in the library")
    # A name after the dollar keeps sections apart; the linker sorts by it and drops it.
    print "\t.section\t" base "$" substr(name, 2) ",\"" kind "\""
    if (flags ~ /G/) print "\t.linkonce discard"
}

# .section NAME[, "FLAGS", %TYPE[, GROUP, comdat]]
$1 == ".section" {
    rest = $0
    sub(/^[ \t]*\.section[ \t]+/, "", rest)
    count = split(rest, part, ",")
    start_section(part[1], count > 1 ? part[2] : "")
    next
}

$1 ~ /^\.(text|data|bss)$/ { ignored = 0; print; next }
ignored { next }

# Only in the other object format: types, sizes and visibility of names, marks for its linker.
$1 ~ /^\.(type|size|hidden|internal|protected|ident|file|eabi_attribute|cpu|arch|fpu|arm)$/ { next }

# Merging is what .linkonce does.
$1 == ".weak" { sub(/\.weak/, ".global"); print; next }

# A static variable that is zero at load: .local NAME, then .comm NAME,SIZE,ALIGNMENT.
$1 == ".local" { isLocal[$2] = 1; next }
$1 == ".comm" {
    split($2, part, ",")
    if (!(part[1] in isLocal)) fail("common variable " part[1])
    print "\t.section\t.data$" part[1] ",\"dw\""
    print "\t.balign\t" (part[3] ? part[3] : 4)
    print part[1] ":"
    print "\t.space\t" part[2]
    next
}

{ print }

END { if (failed) exit 1 }

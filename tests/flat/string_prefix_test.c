/* A text's block starts where the runtime in the process frees it. Built as C. */

#include <stdio.h>
#include <stdlib.h>
#include <string.h>

#include "flat/vrl_flat.h"

/* By this name, offered to everybody, a classic Mono is known. It frees a text from its length on. */
VRL_FLAT_API void mono_free_bstr(void* text);
void mono_free_bstr(void* text) {
    if (text != NULL) free((char*)text - 4);
}

int main(void) {
    void* header = CSharp_new_Header__SWIG_0();
    if (CSharp_Header_set_Creator(header, u"Gr\u00FCn") != 0) return 1;
    char16_t* text = CSharp_Header_get_Creator(header);
    uint32_t bytes = 0;
    memcpy(&bytes, (const char*)text - sizeof bytes, sizeof bytes);
    if (bytes != 8 || memcmp(text, u"Gr\u00FCn", 10) != 0) {
        printf("%u bytes, expected 8\n", (unsigned)bytes);
        return 1;
    }
    /* The allocator ends the process when this is not the start of a block. */
    mono_free_bstr(text);
    /* And the library frees from there, too. */
    vrl_free_string(CSharp_Header_get_Creator(header));
    CSharp_delete_Header(header);
    printf("texts start where they are freed\n");
    return 0;
}

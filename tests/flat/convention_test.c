/* The flat layer as a C program sees it: each shape of the convention once. Built as C, not as C++. */

#include <stdio.h>
#include <stdlib.h>
#include <string.h>

#include "flat/vrl_flat.h"

static int g_failures = 0;
static char g_message[256];
static const char* volatile g_replaced_identity = NULL;
static const char* g_parameter = "never called";

#define EXPECT(condition)                                                        \
    do {                                                                         \
        if (!(condition)) {                                                      \
            printf("%s:%d: %s does not hold\n", __FILE__, __LINE__, #condition); \
            ++g_failures;                                                        \
        }                                                                        \
    } while (0)

static void take_null(const char* message, const char* parameter) {
    snprintf(g_message, sizeof g_message, "%s", message);
    g_parameter = parameter;
}

static void never(const char* message) {
    printf("a general callback was called: %s\n", message);
    ++g_failures;
}

static void never_for_arguments(const char* message, const char* parameter) {
    (void)parameter;
    never(message);
}

static char* never_for_strings(const char* text) {
    never(text);
    return NULL;
}

static int message_is(const char* expected) {
    const int same = strcmp(g_message, expected) == 0 && g_parameter == NULL;
    if (!same) printf("message: '%s', expected '%s'\n", g_message, expected);
    g_message[0] = '\0';
    g_parameter = "never called";
    return same;
}

static uint32_t bytes_of(const void* text) {
    uint32_t length = 0;
    memcpy(&length, (const char*)text - sizeof length, sizeof length);
    return length;
}

static int wide_is(char16_t* text, const char16_t* expected, uint32_t units) {
    const int same = text != NULL && bytes_of(text) == units * 2 && memcmp(text, expected, units * 2) == 0 &&
                     text[units] == 0;
    vrl_free_string(text);
    return same;
}

static int bytes_are(char* text, const char* expected) {
    const int same = text != NULL && bytes_of(text) == strlen(expected) && strcmp(text, expected) == 0;
    if (!same) printf("text: '%s', expected '%s'\n", text, expected);
    vrl_free_string(text);
    return same;
}

static void nulls_before_registration_are_survived(void) { EXPECT(CSharp_new_Vrl__SWIG_1(NULL) == NULL); }

static void registration_takes_all_callbacks(void) {
    SWIGRegisterExceptionCallbacks_VrlModule(never, never, never, never, never, never, never, never, never,
                                             never, never);
    SWIGRegisterExceptionArgumentCallbacks_VrlModule(never_for_arguments, take_null, never_for_arguments);
    SWIGRegisterStringCallback_VrlModule(never_for_strings);
}

static void objects_are_made_copied_and_freed(void) {
    void* color = CSharp_new_ColorType__SWIG_0();
    EXPECT(CSharp_ColorType_set_ColorName(color, u"Barn Red") == 0);
    void* copy = CSharp_new_ColorType__SWIG_1(color);
    CSharp_delete_ColorType(color);
    EXPECT(wide_is(CSharp_ColorType_get_ColorName(copy), u"Barn Red", 8));
    CSharp_delete_ColorType(copy);
    CSharp_delete_ColorType(NULL);
    EXPECT(CSharp_new_ColorType__SWIG_1(NULL) == NULL);
    EXPECT(message_is("vrl_v2::ColorType const & type is null"));
}

static void wide_text_crosses_whole(void) {
    void* header = CSharp_new_Header__SWIG_0();
    EXPECT(CSharp_Header_set_Creator(header, u"Gr\u00FCn \u20AC \U0001D11E") == 0);
    EXPECT(wide_is(CSharp_Header_get_Creator(header), u"Gr\u00FCn \u20AC \U0001D11E", 9));
    EXPECT(CSharp_Header_set_Creator(header, NULL) == 0);
    EXPECT(wide_is(CSharp_Header_get_Creator(header), u"", 0));
    CSharp_delete_Header(header);
}

static void embedded_zero_units_come_out_whole(void) {
    static const char xml[] =
        "<Vrl:Standard xmlns:Vrl=\"urn:vrl:document/v2\"><Vrl:CustomAttribute><Vrl:Name>a&#0;b</Vrl:Name>"
        "<Vrl:ValueChoice><Vrl:IntegerValue>1</Vrl:IntegerValue></Vrl:ValueChoice></Vrl:CustomAttribute>";
    void* standard = CSharp_new_Standard__SWIG_0();
    EXPECT(CSharp_Standard_unmarshal__SWIG_1(standard, xml, (uint32_t)(sizeof xml - 1)) != 0);
    EXPECT(CSharp_Standard_size_CustomAttribute(standard) == 1);
    void* attribute = CSharp_Standard_get_CustomAttribute__SWIG_0(standard, 0);
    EXPECT(wide_is(CSharp_CustomAttributeType_get_Name(attribute), u"a\0b", 3));
    CSharp_delete_Standard(standard);
}

static void numbers_and_truth_cross(void) {
    void* cmyk = CSharp_new_ColorSpaceCMYKType__SWIG_0();
    EXPECT(CSharp_ColorSpaceCMYKType_set_Black(cmyk, 100.0) == 0);
    EXPECT(CSharp_ColorSpaceCMYKType_set_Black(cmyk, 100.0000001) == 36);
    EXPECT(CSharp_ColorSpaceCMYKType_set_Black(cmyk, -1.0) == 37);
    EXPECT(CSharp_ColorSpaceCMYKType_get_Black(cmyk) == 100.0);
    EXPECT(CSharp_ColorSpaceCMYKType_is_occurs_ok(cmyk) == 0);
    CSharp_delete_ColorSpaceCMYKType(cmyk);

    void* averaging = CSharp_new_Averaging__SWIG_0();
    EXPECT(CSharp_Averaging_set_Averaging(averaging, 0x100) == 0);
    EXPECT(CSharp_Averaging_get_Averaging(averaging) == 1);
    EXPECT(CSharp_Averaging_set_AveragingValue(averaging, 100) == 36);
    EXPECT(CSharp_Averaging_set_AveragingValue(averaging, 99) == 0);
    EXPECT(CSharp_Averaging_get_AveragingValue(averaging) == 99);
    CSharp_delete_Averaging(averaging);
}

static void dates_cross_as_objects(void) {
    void* set = CSharp_new_ColorSetType__SWIG_0();
    void* date = CSharp_new_c_datetime__SWIG_1("2024-01-15T10:20:30+05:30");
    EXPECT(CSharp_ColorSetType_append_ChangeHistory(set, date) == 0);
    CSharp_delete_c_datetime(date);
    void* held = CSharp_ColorSetType_get_ChangeHistory(set, 0);
    EXPECT(CSharp_c_datetime_get_total_offset_mins(held) == 330);
    EXPECT(bytes_are(CSharp_c_datetime_get_as_string(held), "2024-01-15T10:20:30+05:30"));
    EXPECT(CSharp_ColorSetType_set_ChangeHistory(set, 0, NULL) == 0);
    EXPECT(message_is("qbxV2::tc_datetime const & type is null"));
    CSharp_delete_ColorSetType(set);

    void* file = CSharp_new_ProfileFile__SWIG_0();
    EXPECT(CSharp_ProfileFile_set_ProfileFile(file, NULL) == 0);
    EXPECT(message_is("qbxV2::tc_binary const & type is null"));
    CSharp_delete_ProfileFile(file);
}

static void byte_texts_must_not_be_null(void) {
    EXPECT(CSharp_length("Gr\xC3\xBCn") == 4);
    EXPECT(CSharp_length(NULL) == 0);
    EXPECT(message_is("null string"));
    EXPECT(CSharp_is_valid_float("1e5") == 1);
    EXPECT(CSharp_is_valid_float("1e") == 0);
    EXPECT(CSharp_new_c_decimal__SWIG_2(NULL) == NULL);
    EXPECT(message_is("null string"));
}

static void value_classes_work(void) {
    uint8_t overflow = 1;
    void* big = CSharp_new_c_big_int__SWIG_2("-007");
    EXPECT(CSharp_c_big_int_get(big, &overflow) == -7 && overflow == 0);
    EXPECT(CSharp_c_big_int_get(big, NULL) == -7);
    CSharp_c_big_int_swap(big, NULL);
    EXPECT(message_is("qbxV2::c_big_int & type is null"));
    CSharp_delete_c_big_int(big);

    void* decimal = CSharp_new_c_decimal__SWIG_4(12345, 2);
    EXPECT(bytes_are(CSharp_c_decimal_get_as_string(decimal), "123.45"));
    CSharp_delete_c_decimal(decimal);
    EXPECT(CSharp_new_c_decimal__SWIG_1(NULL) == NULL);
    EXPECT(message_is("qbxV2::c_decimal const & type is null"));

    void* null_pattern = CSharp_new_c_pattern_null(NULL);
    EXPECT(CSharp_c_pattern_null_is_match__SWIG_0(null_pattern, "anything") == 1);
    CSharp_delete_c_pattern_null(null_pattern);
    void* pattern = CSharp_new_c_pattern("[a-c]+");
    EXPECT(CSharp_c_pattern_is_match__SWIG_0(pattern, "abc") == 1);
    EXPECT(CSharp_c_pattern_is_match__SWIG_0(pattern, "abd") == 0);
    CSharp_delete_c_pattern(pattern);

    void* info = CSharp_new_c_any_info__SWIG_2("urn:x", "x:note");
    EXPECT(bytes_are(CSharp_c_any_info_get_namespace(info), "urn:x"));
    EXPECT(bytes_are(CSharp_c_any_info_get_value(info), ""));
    CSharp_delete_c_any_info(info);
    CSharp_delete_c_empty(CSharp_new_c_empty());
}

static void free_functions_work(void) {
    EXPECT(strcmp(CSharp_get_error_description(46), "min/max occurs error on marshaling") == 0);
    EXPECT(strcmp(CSharp_get_error_description(999), "") == 0);
    EXPECT(CSharp_stringncompare("hello world", "world", 6, 5) == 0);
    EXPECT(CSharp_stringncompare("hello", "help", 0, 4) != 0);
    EXPECT(CSharp_stringncompare(NULL, "help", 0, 4) == 0);
    EXPECT(message_is("null string"));
    EXPECT(CSharp_xisdigit('7') == 1 && CSharp_xisdigit('x') == 0 && CSharp_xisdigit(0) == 0);
    EXPECT(CSharp_xisalpha(-1) == 0 && CSharp_xisspace(' ') == 1 && CSharp_xisprint(1000000) == 0);
    EXPECT(CSharp_QBX_ATOFLOAT_MODE_SIMPLE_get() == 3 && CSharp_QBX_VALIDATE_PATTERNS_get() == 1);
    EXPECT(CSharp_QBXNULL_get() == 0 && CSharp_QBX_USE_EXCEPTIONS_get() == 0);
}

static void wildcard_texts_do_not_come_back(void) {
    void* revision = CSharp_new_Revision__SWIG_0();
    EXPECT(CSharp_Revision_append_any(revision, "<a/>") == 0);
    EXPECT(CSharp_Revision_insert_any(revision, 0, "<b/>") == 0);
    EXPECT(CSharp_Revision_append_any(revision, NULL) == 0);
    EXPECT(message_is("null string"));
    char value[] = "untouched";
    CSharp_Revision_get_any(revision, 0, "", "", value);
    EXPECT(strcmp(value, "untouched") == 0);
    CSharp_Revision_get_any(revision, 0, NULL, "", value);
    EXPECT(message_is("null string"));
    CSharp_Revision_get_any(revision, 0, "", NULL, value);
    EXPECT(message_is("null string"));
    CSharp_Revision_get_any(NULL, 0, "", "", NULL);
    EXPECT(message_is("null string"));
    CSharp_Revision_get_any(NULL, 0, "", "", value);
    EXPECT(message_is("vrl_v2::Revision & type is null"));
    EXPECT(CSharp_Revision_append_any(NULL, "<a/>") == 0);
    EXPECT(message_is("vrl_v2::Revision & type is null"));
    EXPECT(CSharp_Revision_insert_any(NULL, 0, "<a/>") == 0);
    EXPECT(message_is("vrl_v2::Revision & type is null"));
    EXPECT(bytes_are(vrl_revision_any(revision, 0, 2), "<b/>"));
    EXPECT(bytes_are(vrl_revision_any(revision, 1, 2), "<a/>"));
    EXPECT(vrl_revision_any(revision, 2, 2) == NULL);
    EXPECT(vrl_revision_any(revision, 0, 3) == NULL);
    EXPECT(vrl_revision_any(NULL, 0, 2) == NULL);
    CSharp_delete_Revision(revision);
}

static void documents_come_and_go(void) {
    void* document = CSharp_new_Vrl__SWIG_0();
    EXPECT(CSharp_Vrl_loadFile(document, NULL) == 1);
    EXPECT(g_message[0] == '\0');
    void* result = CSharp_Vrl_writeString(document);
    EXPECT(CSharp_XMLDocumentResult_getEqbxError(result) == 46);
    EXPECT(wide_is(CSharp_XMLDocumentResult_getXmlDocument(result), u"", 0));
    CSharp_delete_XMLDocumentResult(result);
    EXPECT(CSharp_Vrl_writeFile(document, u"somewhere.txt") == 1001);
    EXPECT(CSharp_Vrl_writeFile(document, NULL) == 1001);
    EXPECT(CSharp_Vrl_loadString(document, NULL) == CSharp_Vrl_loadString(document, u""));
    EXPECT(g_message[0] == '\0');
    CSharp_delete_Vrl(document);
    CSharp_delete_Vrl(NULL);
    EXPECT(g_message[0] == '\0');

    EXPECT(CSharp_Vrl_loadFile(NULL, u"unused.vrl") == 0);
    EXPECT(message_is("vrl_v2::Vrl & type is null"));
    EXPECT(CSharp_Vrl_loadString(NULL, u"<a/>") == 0);
    EXPECT(message_is("vrl_v2::Vrl & type is null"));
    EXPECT(CSharp_Vrl_writeFile(NULL, u"unused.vrl") == 0);
    EXPECT(message_is("vrl_v2::Vrl & type is null"));
    EXPECT(CSharp_Vrl_writeString(NULL) == NULL);
    EXPECT(message_is("vrl_v2::Vrl & type is null"));

    void* made = CSharp_new_XMLDocumentResult(u"text", 7);
    EXPECT(wide_is(CSharp_XMLDocumentResult_getXmlDocument(made), u"text", 4));
    EXPECT(CSharp_XMLDocumentResult_getEqbxError(made) == 7);
    CSharp_delete_XMLDocumentResult(made);
}

static void identities_can_be_replaced(void) {
    const char* const before = CSharp_FunctionType_id_get();
    EXPECT(strcmp(before, "FunctionType") == 0);
    CSharp_FunctionType_id_set("Replaced");
    /* Nobody frees a replaced identity: the test remembers it, so that no leak is seen where one is meant. */
    g_replaced_identity = CSharp_FunctionType_id_get();
    EXPECT(strcmp(g_replaced_identity, "Replaced") == 0);
    CSharp_FunctionType_id_set(NULL);
    EXPECT(CSharp_FunctionType_id_get() == NULL);
    CSharp_FunctionType_id_set(before);
    EXPECT(strcmp(CSharp_FunctionType_id_get(), "FunctionType") == 0);

    void* made = CSharp_FunctionType_factory(1000, "FunctionDE94Type");
    EXPECT(made != NULL && strcmp(CSharp_FunctionType_getid(made), "FunctionDE94Type") == 0);
    CSharp_delete_FunctionType(made);
    EXPECT(CSharp_FunctionType_factory(1000, NULL) == NULL);
    EXPECT(message_is("null string"));
}

static void prefixes_can_be_chosen(void) {
    void* header = CSharp_new_Header__SWIG_0();
    /* No runtime is in this process: a pointer's size, which the allocator would not take for wrong. */
    free((char*)CSharp_Header_get_Creator(header) - sizeof(void*));
    vrl_set_string_prefix(5);
    EXPECT(wide_is(CSharp_Header_get_Creator(header), u"", 0));
    vrl_set_string_prefix(4);
    char16_t* text = CSharp_Header_get_Creator(header);
    EXPECT(bytes_of(text) == 0);
    free((char*)text - 4);
    vrl_set_string_prefix(8);
    text = CSharp_Header_get_Creator(header);
    free((char*)text - 8);
    vrl_set_string_prefix(sizeof(void*));
    CSharp_delete_Header(header);
    vrl_free_string(NULL);
}

int main(void) {
    nulls_before_registration_are_survived();
    registration_takes_all_callbacks();
    objects_are_made_copied_and_freed();
    wide_text_crosses_whole();
    embedded_zero_units_come_out_whole();
    numbers_and_truth_cross();
    dates_cross_as_objects();
    byte_texts_must_not_be_null();
    value_classes_work();
    free_functions_work();
    wildcard_texts_do_not_come_back();
    documents_come_and_go();
    identities_can_be_replaced();
    prefixes_can_be_chosen();
    if (g_failures == 0) printf("the convention holds\n");
    return g_failures == 0 ? 0 : 1;
}

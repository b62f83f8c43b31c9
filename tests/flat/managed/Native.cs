using System;
using System.Runtime.InteropServices;

/// The exported functions that the program uses, as a class library would declare them.
static class Native {
    const string Library = "libvrl.so";

    public delegate void ExceptionCallback(IntPtr message);
    public delegate void ArgumentCallback(IntPtr message, IntPtr parameter);
    public delegate IntPtr StringCallback(IntPtr text);

    [DllImport(Library)] public static extern void SWIGRegisterExceptionCallbacks_VrlModule(
        ExceptionCallback a, ExceptionCallback b, ExceptionCallback c, ExceptionCallback d, ExceptionCallback e,
        ExceptionCallback f, ExceptionCallback g, ExceptionCallback h, ExceptionCallback i, ExceptionCallback j,
        ExceptionCallback k);
    [DllImport(Library)] public static extern void SWIGRegisterExceptionArgumentCallbacks_VrlModule(
        ArgumentCallback argument, ArgumentCallback argumentNull, ArgumentCallback argumentOutOfRange);
    [DllImport(Library)] public static extern void SWIGRegisterStringCallback_VrlModule(StringCallback callback);

    [DllImport(Library)] public static extern IntPtr CSharp_new_Vrl__SWIG_0();
    [DllImport(Library)] public static extern IntPtr CSharp_new_Vrl__SWIG_1(IntPtr other);
    [DllImport(Library)] public static extern void CSharp_delete_Vrl(IntPtr self);
    [DllImport(Library)] public static extern int CSharp_Vrl_loadFile(
        IntPtr self, [MarshalAs(UnmanagedType.LPWStr)] string path);
    [DllImport(Library)] public static extern int CSharp_Vrl_loadString(
        IntPtr self, [MarshalAs(UnmanagedType.LPWStr)] string xml);
    [DllImport(Library)] public static extern int CSharp_Vrl_writeFile(
        IntPtr self, [MarshalAs(UnmanagedType.LPWStr)] string path);
    [DllImport(Library)] public static extern IntPtr CSharp_Vrl_writeString(IntPtr self);
    [DllImport(Library)] public static extern uint CSharp_Vrl_size_Palette(IntPtr self);
    [DllImport(Library)] public static extern IntPtr CSharp_Vrl_get_Palette__SWIG_0(IntPtr self, uint i);
    [DllImport(Library)] public static extern IntPtr CSharp_Vrl_get_Preamble__SWIG_0(IntPtr self);
    [DllImport(Library)] public static extern IntPtr CSharp_Preamble_get_Header__SWIG_0(IntPtr self);
    [DllImport(Library)] public static extern int CSharp_Header_set_Purpose(
        IntPtr self, [MarshalAs(UnmanagedType.LPWStr)] string value);
    [DllImport(Library)] [return: MarshalAs(UnmanagedType.BStr)]
    public static extern string CSharp_Header_get_Purpose(IntPtr self);
    [DllImport(Library)] public static extern uint CSharp_PaletteType_size_ColorSet(IntPtr self);
    [DllImport(Library)] public static extern IntPtr CSharp_PaletteType_get_ColorSet__SWIG_0(IntPtr self, uint i);
    [DllImport(Library)] public static extern uint CSharp_ColorSetType_size_Color(IntPtr self);
    [DllImport(Library)] public static extern IntPtr CSharp_ColorSetType_get_Color__SWIG_0(IntPtr self, uint i);
    [DllImport(Library)] public static extern int CSharp_ColorSetType_append_ChangeHistory(IntPtr self, IntPtr date);
    [DllImport(Library)] [return: MarshalAs(UnmanagedType.BStr)]
    public static extern string CSharp_ColorType_get_ColorName(IntPtr self);
    [DllImport(Library)] public static extern int CSharp_ColorType_set_ColorName(
        IntPtr self, [MarshalAs(UnmanagedType.LPWStr)] string value);

    [DllImport(Library)] public static extern IntPtr CSharp_XMLDocumentResult_getXmlDocument(IntPtr self);
    [DllImport(Library)] public static extern int CSharp_XMLDocumentResult_getEqbxError(IntPtr self);
    [DllImport(Library)] public static extern void CSharp_delete_XMLDocumentResult(IntPtr self);

    [DllImport(Library)] public static extern IntPtr CSharp_new_c_datetime__SWIG_1(string text);
    [DllImport(Library)] public static extern void CSharp_delete_c_datetime(IntPtr self);
    [DllImport(Library)] public static extern IntPtr CSharp_c_datetime_get_as_string(IntPtr self);

    [DllImport(Library)] public static extern IntPtr CSharp_new_Standard__SWIG_0();
    [DllImport(Library)] public static extern void CSharp_delete_Standard(IntPtr self);
    [DllImport(Library)] public static extern int CSharp_Standard_unmarshal__SWIG_1(
        IntPtr self, byte[] bytes, uint length);
    [DllImport(Library)] public static extern IntPtr CSharp_Standard_get_CustomAttribute__SWIG_0(IntPtr self, uint i);
    [DllImport(Library)] [return: MarshalAs(UnmanagedType.BStr)]
    public static extern string CSharp_CustomAttributeType_get_Name(IntPtr self);
    [DllImport(Library)] public static extern IntPtr CSharp_get_error_description(int code);

    /// A byte text of the library's: read by its length, and freed as the runtime frees a BSTR.
    public static string TakeBytes(IntPtr text) {
        int length = Marshal.ReadInt32(text, -4);
        byte[] bytes = new byte[length];
        Marshal.Copy(text, bytes, 0, length);
        Marshal.FreeBSTR(text);
        return System.Text.Encoding.UTF8.GetString(bytes);
    }

    /// A wide text of the library's, taken by hand.
    public static string TakeWide(IntPtr text) {
        string taken = Marshal.PtrToStringBSTR(text);
        Marshal.FreeBSTR(text);
        return taken;
    }
}

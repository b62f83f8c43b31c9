using System;
using System.IO;
using System.Runtime.InteropServices;
using System.Text;

/// Drives a document through the exported functions alone: load, edit, save, and what can go wrong.
static class ManagedCaller {
    [ThreadStatic] static Exception pending;

    // The runtime must not collect what native code holds.
    static readonly Native.ExceptionCallback general = message => { pending = new Exception(Text(message)); };
    static readonly Native.ArgumentCallback argument =
        (message, parameter) => { pending = new ArgumentException(Text(message)); };
    static readonly Native.ArgumentCallback argumentNull =
        (message, parameter) => { pending = new ArgumentNullException(null, Text(message)); };
    static readonly Native.StringCallback strings = text => text;

    static string Text(IntPtr bytes) { return Marshal.PtrToStringAnsi(bytes); }

    static void Register() {
        Native.SWIGRegisterExceptionCallbacks_VrlModule(general, general, general, general, general, general, general,
                                                        general, general, general, general);
        Native.SWIGRegisterExceptionArgumentCallbacks_VrlModule(argument, argumentNull, argument);
        Native.SWIGRegisterStringCallback_VrlModule(strings);
    }

    /// What a proxy does behind a call that can report a null.
    static void RaisePending() {
        Exception raised = pending;
        pending = null;
        if (raised != null) throw raised;
    }

    static void Expect(bool holds, string what) {
        if (!holds) throw new Exception("does not hold: " + what);
    }

    static void ExpectCode(int code, int expected, string what) {
        if (code != expected) {
            throw new Exception(what + " gave " + code + " (" + Text(Native.CSharp_get_error_description(code)) +
                                "), expected " + expected);
        }
    }

    static void LoadEditSave(string path, string folder) {
        IntPtr document = Native.CSharp_new_Vrl__SWIG_0();
        ExpectCode(Native.CSharp_Vrl_loadFile(document, path), 0, "loading " + path);
        Expect(Native.CSharp_Vrl_size_Palette(document) > 0, "there is a palette");
        IntPtr set = Native.CSharp_PaletteType_get_ColorSet__SWIG_0(
            Native.CSharp_Vrl_get_Palette__SWIG_0(document, 0), 0);
        uint count = Native.CSharp_ColorSetType_size_Color(set);
        Expect(count > 0, "there are colors");
        IntPtr color = Native.CSharp_ColorSetType_get_Color__SWIG_0(set, 0);
        Expect(Native.CSharp_ColorType_get_ColorName(color).Length > 0, "the first has a name");
        ExpectCode(Native.CSharp_ColorType_set_ColorName(color, "Grün \u20AC \U0001D11E"), 0, "renaming");
        IntPtr date = Native.CSharp_new_c_datetime__SWIG_1("2024-01-15T10:20:30Z");
        Expect(Native.TakeBytes(Native.CSharp_c_datetime_get_as_string(date)) == "2024-01-15T10:20:30Z",
               "a date comes back as text");
        ExpectCode(Native.CSharp_ColorSetType_append_ChangeHistory(set, date), 0, "dating the change");
        Native.CSharp_delete_c_datetime(date);
        string saved = Path.Combine(folder, "managed_\u00E9\U0001D11E.vrl");
        ExpectCode(Native.CSharp_Vrl_writeFile(document, saved), 0, "saving");
        Native.CSharp_delete_Vrl(document);

        IntPtr again = Native.CSharp_new_Vrl__SWIG_0();
        ExpectCode(Native.CSharp_Vrl_loadFile(again, saved), 0, "loading what was saved");
        IntPtr sameSet = Native.CSharp_PaletteType_get_ColorSet__SWIG_0(
            Native.CSharp_Vrl_get_Palette__SWIG_0(again, 0), 0);
        Expect(Native.CSharp_ColorSetType_size_Color(sameSet) == count, "no color was lost");
        Expect(Native.CSharp_ColorType_get_ColorName(Native.CSharp_ColorSetType_get_Color__SWIG_0(sameSet, 0)) ==
                   "Grün \u20AC \U0001D11E", "characters of every plane come back");
        StringsRoundTrip(again);
        Native.CSharp_delete_Vrl(again);
        File.Delete(saved);
    }

    static void StringsRoundTrip(IntPtr document) {
        IntPtr result = Native.CSharp_Vrl_writeString(document);
        ExpectCode(Native.CSharp_XMLDocumentResult_getEqbxError(result), 0, "writing to a string");
        string xml = Native.TakeWide(Native.CSharp_XMLDocumentResult_getXmlDocument(result));
        Native.CSharp_delete_XMLDocumentResult(result);
        Expect(xml.Contains("Grün \u20AC \U0001D11E"), "the text holds what was set");
        IntPtr copy = Native.CSharp_new_Vrl__SWIG_0();
        ExpectCode(Native.CSharp_Vrl_loadString(copy, xml), 0, "reading from a string");
        Native.CSharp_delete_Vrl(copy);
    }

    static void EmbeddedZeros() {
        byte[] xml = Encoding.UTF8.GetBytes(
            "<Vrl:Standard xmlns:Vrl=\"urn:vrl:document/v2\"><Vrl:CustomAttribute><Vrl:Name>a&#0;b</Vrl:Name>");
        IntPtr standard = Native.CSharp_new_Standard__SWIG_0();
        Expect(Native.CSharp_Standard_unmarshal__SWIG_1(standard, xml, (uint)xml.Length) != 0, "the text is cut");
        IntPtr attribute = Native.CSharp_Standard_get_CustomAttribute__SWIG_0(standard, 0);
        Expect(Native.CSharp_CustomAttributeType_get_Name(attribute) == "a\0b", "a zero unit comes out");
        Native.CSharp_delete_Standard(standard);
    }

    static void NullBecomesAnException() {
        try {
            Expect(Native.CSharp_new_Vrl__SWIG_1(IntPtr.Zero) == IntPtr.Zero, "there is no copy of nothing");
            RaisePending();
        } catch (ArgumentNullException raised) {
            Expect(raised.Message.StartsWith("vrl_v2::Vrl const & type is null"), raised.Message);
            return;
        }
        throw new Exception("no exception was raised");
    }

    static long MemoryInKilobytes() {
        foreach (string line in File.ReadAllLines("/proc/self/status")) {
            if (line.StartsWith("VmRSS:")) {
                return long.Parse(line.Substring(6).Replace("kB", "").Trim());
            }
        }
        throw new Exception("the system does not tell");
    }

    static void MillionTexts() {
        IntPtr document = Native.CSharp_new_Vrl__SWIG_0();
        IntPtr header = Native.CSharp_Preamble_get_Header__SWIG_0(Native.CSharp_Vrl_get_Preamble__SWIG_0(document));
        string text = new string('x', 200);
        Native.CSharp_Header_set_Purpose(header, text);
        for (int i = 0; i < 100000; ++i) Native.CSharp_Header_get_Purpose(header);
        GC.Collect();
        long before = MemoryInKilobytes();
        for (int i = 0; i < 1000000; ++i) {
            if (Native.CSharp_Header_get_Purpose(header).Length != 200) throw new Exception("a text was cut");
        }
        GC.Collect();
        long grown = MemoryInKilobytes() - before;
        // A million leaked texts would be 400 megabytes.
        Expect(grown < 40 * 1024, "memory stays level, and grew by " + grown + " kB");
        Native.CSharp_delete_Vrl(document);
    }

    static int Main(string[] arguments) {
        try {
            Register();
            LoadEditSave(arguments[0], arguments[1]);
            EmbeddedZeros();
            NullBecomesAnException();
            MillionTexts();
        } catch (Exception failure) {
            Console.Error.WriteLine(failure);
            return 1;
        }
        Console.WriteLine("a managed caller drives the model");
        return 0;
    }
}

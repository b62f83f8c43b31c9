// Generated from schema/group.xsd. To change it, change the schema.
#include "tests/driver/model_driver.h"

namespace vrl_driver {

using namespace vrl_v2;

namespace {

class_description describe_ShapeType() {
    class_description c;
    c.name = "ShapeType";
    c.xml_name = "ShapeType";
    c.kind = class_form::type;
    c.polymorphic = true;
    c.declares_namespaces = true;
    describe_operations<ShapeType>(c);
    describe_reading<ShapeType>(c);
    describe_identity<ShapeType>(c);
    {
        member m;
        m.name = "Area";
        m.kind = form::value;
        m.value = value_type::number;
        m.set = [](void* o, const std::string& t) {
            return static_cast<ShapeType*>(o)->set_Area(value_of<double>(t));
        };
        m.get = [](const void* o, unsigned) { return to_text(static_cast<const ShapeType*>(o)->get_Area()); };
        m.isset = [](const void* o) { return static_cast<const ShapeType*>(o)->isset_Area(); };
        m.unset = [](void* o) { static_cast<ShapeType*>(o)->unset_Area(); };
        c.members.push_back(m);
    }
    c.factory = {"CircleType", "SquareType"};
    c.made_by_factory = [](int ns_id, const std::string& name, const char** id) -> const void* {
        static const ShapeType* made = nullptr;
        delete made;
        made = ShapeType::factory(ns_id, name);
        if (made != nullptr) *id = made->getid();
        return made;
    };
    return c;
}

class_description describe_Plate() {
    class_description c;
    c.name = "Plate";
    c.xml_name = "Plate";
    c.kind = class_form::type;
    c.declares_namespaces = true;
    describe_operations<Plate>(c);
    describe_reading<Plate>(c);
    {
        member m;
        m.name = "Shape";
        m.kind = form::group;
        m.required = true;
        m.class_name = "sg_Shape";
        m.make = [](void* o) -> void* { return &static_cast<Plate*>(o)->get_Shape(); };
        m.look = [](const void* o, unsigned) -> const void* {
            return &static_cast<const Plate*>(o)->get_Shape();
        };
        m.assign = [](void* o, unsigned, const void* v) -> void* {
            return &static_cast<Plate*>(o)->assign_Shape(*static_cast<const sg_Shape*>(v));
        };
        c.members.push_back(m);
    }
    {
        member m;
        m.name = "Hole";
        m.kind = form::group_list;
        m.class_name = "sg_Hole";
        m.size = [](const void* o) { return static_cast<const Plate*>(o)->size_Hole(); };
        m.erase = [](void* o, unsigned i) { static_cast<Plate*>(o)->delete_Hole(i); };
        m.clear = [](void* o) { static_cast<Plate*>(o)->clear_Hole(); };
        m.make = [](void* o) -> void* {
            static_cast<Plate*>(o)->append_Hole();
            return &static_cast<Plate*>(o)->back_Hole();
        };
        m.look = [](const void* o, unsigned i) -> const void* {
            return &static_cast<const Plate*>(o)->get_Hole(i);
        };
        m.reach = [](void* o, unsigned i) -> void* { return &static_cast<Plate*>(o)->get_Hole(i); };
        m.assign = [](void* o, unsigned i, const void* v) -> void* {
            return &static_cast<Plate*>(o)->assign_Hole(i, *static_cast<const sg_Hole*>(v));
        };
        c.members.push_back(m);
    }
    {
        member m;
        m.name = "Thickness";
        m.kind = form::value;
        m.value = value_type::number;
        m.set = [](void* o, const std::string& t) {
            return static_cast<Plate*>(o)->set_Thickness(value_of<double>(t));
        };
        m.get = [](const void* o, unsigned) {
            return to_text(static_cast<const Plate*>(o)->get_Thickness());
        };
        m.isset = [](const void* o) { return static_cast<const Plate*>(o)->isset_Thickness(); };
        m.unset = [](void* o) { static_cast<Plate*>(o)->unset_Thickness(); };
        c.members.push_back(m);
    }
    return c;
}

class_description describe_Cover() {
    class_description c;
    c.name = "Cover";
    c.xml_name = "Cover";
    c.kind = class_form::type;
    c.declares_namespaces = true;
    describe_operations<Cover>(c);
    describe_reading<Cover>(c);
    {
        member m;
        m.name = "Shape";
        m.kind = form::group_list;
        m.required = true;
        m.class_name = "sg_Shape";
        m.size = [](const void* o) { return static_cast<const Cover*>(o)->size_Shape(); };
        m.erase = [](void* o, unsigned i) { static_cast<Cover*>(o)->delete_Shape(i); };
        m.clear = [](void* o) { static_cast<Cover*>(o)->clear_Shape(); };
        m.make = [](void* o) -> void* {
            static_cast<Cover*>(o)->append_Shape();
            return &static_cast<Cover*>(o)->back_Shape();
        };
        m.look = [](const void* o, unsigned i) -> const void* {
            return &static_cast<const Cover*>(o)->get_Shape(i);
        };
        m.reach = [](void* o, unsigned i) -> void* { return &static_cast<Cover*>(o)->get_Shape(i); };
        m.assign = [](void* o, unsigned i, const void* v) -> void* {
            return &static_cast<Cover*>(o)->assign_Shape(i, *static_cast<const sg_Shape*>(v));
        };
        c.members.push_back(m);
    }
    {
        member m;
        m.name = "Hole";
        m.kind = form::group;
        m.class_name = "sg_Hole";
        m.make = [](void* o) -> void* { return &static_cast<Cover*>(o)->get_Hole(); };
        m.look = [](const void* o, unsigned) -> const void* {
            return &static_cast<const Cover*>(o)->get_Hole();
        };
        m.assign = [](void* o, unsigned, const void* v) -> void* {
            return &static_cast<Cover*>(o)->assign_Hole(*static_cast<const sg_Hole*>(v));
        };
        m.isset = [](const void* o) { return static_cast<const Cover*>(o)->isset_Hole(); };
        m.unset = [](void* o) { static_cast<Cover*>(o)->unset_Hole(); };
        c.members.push_back(m);
    }
    return c;
}

class_description describe_sg_Shape() {
    class_description c;
    c.name = "sg_Shape";
    c.xml_name = "sg_Shape";
    c.kind = class_form::group;
    describe_operations<sg_Shape>(c);
    c.none_state = sg_Shape::chosen_none;
    c.chosen = [](const void* o) -> int { return static_cast<const sg_Shape*>(o)->getchosen(); };
    c.group.push_back({"Shape", "ShapeType", true,
                       [](void* o) -> void* { return &static_cast<sg_Shape*>(o)->get_Shape(); },
                       [](const void* o) -> const void* {
                           return &static_cast<const sg_Shape*>(o)->get_Shape();
                       }});
    c.group.push_back({"Circle", "CircleType", false,
                       [](void* o) -> void* { return &static_cast<sg_Shape*>(o)->get_Circle(); },
                       [](const void* o) -> const void* {
                           return &static_cast<const sg_Shape*>(o)->get_Circle();
                       }});
    c.group.push_back({"Square", "SquareType", false,
                       [](void* o) -> void* { return &static_cast<sg_Shape*>(o)->get_Square(); },
                       [](const void* o) -> const void* {
                           return &static_cast<const sg_Shape*>(o)->get_Square();
                       }});
    return c;
}

class_description describe_sg_Hole() {
    class_description c;
    c.name = "sg_Hole";
    c.xml_name = "sg_Hole";
    c.kind = class_form::group;
    describe_operations<sg_Hole>(c);
    c.none_state = sg_Hole::chosen_none;
    c.chosen = [](const void* o) -> int { return static_cast<const sg_Hole*>(o)->getchosen(); };
    c.group.push_back({"RoundHole", "CircleType", false,
                       [](void* o) -> void* { return &static_cast<sg_Hole*>(o)->get_RoundHole(); },
                       [](const void* o) -> const void* {
                           return &static_cast<const sg_Hole*>(o)->get_RoundHole();
                       }});
    return c;
}

class_description describe_CircleType() {
    class_description c;
    c.name = "CircleType";
    c.xml_name = "CircleType";
    c.kind = class_form::type;
    c.polymorphic = true;
    c.declares_namespaces = true;
    describe_operations<CircleType>(c);
    describe_reading<CircleType>(c);
    describe_identity<CircleType>(c);
    c.base = "ShapeType";
    describe_base<CircleType, ShapeType>(c);
    return c;
}

class_description describe_SquareType() {
    class_description c;
    c.name = "SquareType";
    c.xml_name = "SquareType";
    c.kind = class_form::type;
    c.polymorphic = true;
    c.declares_namespaces = true;
    describe_operations<SquareType>(c);
    describe_reading<SquareType>(c);
    describe_identity<SquareType>(c);
    c.base = "ShapeType";
    describe_base<SquareType, ShapeType>(c);
    return c;
}

class_description describe_Shape() {
    class_description c;
    c.name = "Shape";
    c.xml_name = "Shape";
    c.kind = class_form::element;
    c.polymorphic = true;
    c.standalone = true;
    c.declares_namespaces = true;
    describe_operations<Shape>(c);
    describe_reading<Shape>(c);
    describe_standalone<Shape>(c);
    describe_identity<Shape>(c);
    c.base = "ShapeType";
    describe_base<Shape, ShapeType>(c);
    return c;
}

class_description describe_Hole() {
    class_description c;
    c.name = "Hole";
    c.xml_name = "Hole";
    c.kind = class_form::element;
    c.polymorphic = true;
    c.standalone = true;
    c.declares_namespaces = true;
    describe_operations<Hole>(c);
    describe_reading<Hole>(c);
    describe_standalone<Hole>(c);
    describe_identity<Hole>(c);
    c.base = "ShapeType";
    describe_base<Hole, ShapeType>(c);
    return c;
}

class_description describe_Circle() {
    class_description c;
    c.name = "Circle";
    c.xml_name = "Circle";
    c.kind = class_form::element;
    c.polymorphic = true;
    c.standalone = true;
    c.declares_namespaces = true;
    describe_operations<Circle>(c);
    describe_reading<Circle>(c);
    describe_standalone<Circle>(c);
    describe_identity<Circle>(c);
    c.base = "CircleType";
    describe_base<Circle, CircleType>(c);
    return c;
}

class_description describe_Square() {
    class_description c;
    c.name = "Square";
    c.xml_name = "Square";
    c.kind = class_form::element;
    c.polymorphic = true;
    c.standalone = true;
    c.declares_namespaces = true;
    describe_operations<Square>(c);
    describe_reading<Square>(c);
    describe_standalone<Square>(c);
    describe_identity<Square>(c);
    c.base = "SquareType";
    describe_base<Square, SquareType>(c);
    return c;
}

class_description describe_RoundHole() {
    class_description c;
    c.name = "RoundHole";
    c.xml_name = "RoundHole";
    c.kind = class_form::element;
    c.polymorphic = true;
    c.declares_namespaces = true;
    describe_operations<RoundHole>(c);
    describe_reading<RoundHole>(c);
    describe_identity<RoundHole>(c);
    c.base = "CircleType";
    describe_base<RoundHole, CircleType>(c);
    return c;
}

}  // namespace

void describe_group(std::vector<class_description>& all) {
    all.push_back(describe_ShapeType());
    all.push_back(describe_Plate());
    all.push_back(describe_Cover());
    all.push_back(describe_sg_Shape());
    all.push_back(describe_sg_Hole());
    all.push_back(describe_CircleType());
    all.push_back(describe_SquareType());
    all.push_back(describe_Shape());
    all.push_back(describe_Hole());
    all.push_back(describe_Circle());
    all.push_back(describe_Square());
    all.push_back(describe_RoundHole());
}

}  // namespace vrl_driver

// Generated from schema/. To change it, change the schema.
#pragma once

namespace vrl_v2 {

class ShapeType;
class Plate;
class Cover;
class sg_Shape;
class sg_Hole;
class CircleType;
class SquareType;
class Shape;
class Hole;
class Circle;
class Square;
class RoundHole;

}  // namespace vrl_v2

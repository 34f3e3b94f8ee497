"""The node proxy classes as plug-ins see them: each class's own name, the
overloads that pick by argument type, output arguments through the pointer
classes, and members kept from ordinary Python code."""
import pytest

import vorlatesthost as host
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx, _OpenVorlaVPx as m

NODE_CLASSES = """VPxSurfaceShape VPxComponentShape VPxCameraSet VPxImagePlane VPxObjectSet
VPxPolyTrg VPxGeometryFilter VPxDeformerNode VPxSkinCluster VPxBlendShape VPxIkSolverNode
VPxConstraint VPxMotionPathNode VPxLocatorNode VPxManipContainer VPxHwShaderNode
VPxHardwareShader VPxManipulatorNode VPxEmitterNode VPxFieldNode VPxFluidEmitterNode
VPxSpringNode VPxParticleAttributeMapperNode""".split()


def test_every_node_class_names_itself():
    assert [getattr(vpx, c).className() for c in NODE_CLASSES] == NODE_CLASSES


class Solver(vpx.VPxIkSolverNode):
    pass


class TestSolver:
    def test_only_a_subclass_makes_a_solver(self):
        with pytest.raises(RuntimeError) as e:
            m.new_VPxIkSolverNode(None)
        assert str(e.value) == 'accessing abstract class or protected constructor'

    def test_joint_angles_round_trip(self):
        solver = Solver()
        solver.setJointAngles(ov.VDoubleArray(6, 0.5))
        assert solver.jointCount() == 2 and solver.jointAngle(4) == 0.5
        with pytest.raises(RuntimeError):
            solver.setJointAngle(6, 1.0)
        solver.setToRestAngles()
        assert solver.jointAngle(4) == 0.0

    def test_space_conversions_pick_the_overload_by_type(self):
        solver = Solver()
        solver.toWorldSpace(ov.VPoint(1, 2, 3))
        solver.toSolverSpace(ov.VVector(1, 0, 0))
        with pytest.raises(TypeError) as e:
            solver.toWorldSpace(1.0)
        assert str(e.value).endswith(
            "  Possible C/C++ prototypes are:\n"
            "    VPxIkSolverNode::toWorldSpace(VPoint &)\n"
            "    VPxIkSolverNode::toWorldSpace(VVector &)\n")


class TestManipulator:
    def test_values_come_back_through_pointer_arguments(self):
        manip = vpx.VPxManipulatorNode()
        index, again, read = vpx.intPtr(), vpx.intPtr(), vpx.doublePtr()
        manip.addDoubleValue('distance', 2.0, index)
        manip.setDoubleValue(index.value(), 5.0)
        manip.getDoubleValue(index.value(), True, read)
        assert index.value() == 0 and read.value() == 2.0
        with pytest.raises(RuntimeError) as e:
            manip.addDoubleValue('distance', 1.0, again)
        assert str(e.value) == 'The value exists already'

    def test_converter_values_exist_only_inside_a_conversion(self):
        container = vpx.VPxManipContainer()
        with pytest.raises(RuntimeError) as e:
            container.getConverterManipValue(0, ov.VPoint())
        assert str(e.value) == 'No manipulator conversion is running'
        assert container.addManipToPlugConversion(ov.VPlug()) == 0
        assert container.addManipToPlugConversion(ov.VPlug()) == 1


def test_protected_constraint_queries_are_kept_from_plain_calls():
    class Constraint(vpx.VPxConstraint):
        pass
    with pytest.raises(RuntimeError) as e:
        Constraint().passiveOutputAttribute()
    assert str(e.value) == 'accessing protected member passiveOutputAttribute'


class TestForwarding:
    def test_the_solver_name_reaches_the_host_as_text(self):
        class Named(vpx.VPxIkSolverNode):
            def solverTypeName(self):
                return 'chainSolver'
        assert host.call(Named(), 'VPxIkSolverNode::solverTypeName') == 'chainSolver'
        assert host.call(Solver(), 'VPxIkSolverNode::solverTypeName') == ''

    def test_deformation_details_come_back_as_flags(self):
        class UVs(vpx.VPxDeformerNode):
            def getDeformationDetails(self):
                return vpx.VPxGeometryFilter.kDeformsUVs
        assert host.call(UVs(), 'VPxGeometryFilter::getDeformationDetails') == 2
        plain = vpx.VPxBlendShape()
        plain.setDeformationDetails(vpx.VPxGeometryFilter.kDeformsColors)
        assert host.call(plain, 'VPxGeometryFilter::getDeformationDetails') == 4

    def test_an_override_written_for_the_short_form_is_not_given_the_context(self):
        calls = []

        class Shape(vpx.VPxSurfaceShape):
            def validateAndSetValue(self, plug, handle):
                calls.append(plug)
                return True
        shape = Shape()
        args = (ov.VPlug(), ov.VDataHandle())
        assert host.call(shape, 'VPxSurfaceShape::validateAndSetValue', *args) is True
        # The context form is the host's own, which asks the short form.
        assert host.call(shape, 'VPxSurfaceShape::validateAndSetValue', *args,
                         ov.VDGContext()) is True
        assert len(calls) == 2

"""Members the proxy classes show Python beyond their virtual operations:
data members, the matrix a transform owns, protected helpers, statics and
constructors with arguments."""
import gc

import pytest

import vorlatesthost as host
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class TestDataMembers:
    def test_material_values_read_and_write_through_properties(self):
        data = vpx.MaterialInputData()
        assert data.shininess == 0.0 and data.hasTransparency is False
        data.shininess = 12.5
        data.hasTransparency = True
        assert data.shininess == 12.5 and data.hasTransparency is True
        # A color member is lent in place: both reads reach the one member.
        assert int(data.diffuse.this) == int(data.diffuse.this) != int(data.specular.this)
        with pytest.raises(TypeError):
            data.shininess = 'shiny'

    def test_a_transform_takes_over_the_matrix_set_on_it(self):
        alive = host.alive('VPxTransformationMatrix')
        transform = vpx.VPxTransform()
        matrix = vpx.VPxTransformationMatrix()
        transform.baseTransformationMatrix = matrix
        assert not matrix.thisown and transform.hasTransformationMatrix()
        assert int(transform.baseTransformationMatrix.this) == int(matrix.this)
        assert matrix.translateTo(ov.VVector(1.0, 2.0, 3.0)) is None
        assert transform.getTranslation().x == 1.0   # the transform reads the matrix it was given
        del transform
        gc.collect()
        assert host.alive('VPxTransformationMatrix') == alive   # deleted with its transform
        del matrix                                            # and not a second time


class TestProtectedHelpers:
    @pytest.mark.parametrize('call, name', [
        (lambda: vpx.VPxCommand().syntax(), 'syntax'),
        (lambda: vpx.VPxCommand().setHistoryOn(True), 'setHistoryOn'),
        (lambda: vpx.VPxGlBuffer().bindFbo(), 'bindFbo'),
        (lambda: vpx.VPx3dModelView().beginGL(), 'beginGL'),
    ])
    def test_refused_from_ordinary_code(self, call, name):
        with pytest.raises(RuntimeError) as e:
            call()
        assert str(e.value) == f'accessing protected member {name}'

    def test_a_protected_hook_is_open_inside_its_own_override(self):
        seen = []

        class Constraint(vpx.VPxConstraintCommand):
            def parseArgs(self, args):
                seen.append(vpx.VPxConstraintCommand.parseArgs(self, args))
                return 'unknown' if args.length() > 1 else None
        command = Constraint()
        # The base doIt parses the arguments, then finds no scene to
        # constrain: its failure comes back to the host as a failed override.
        assert host.call(command, 'VPxCommand::doIt', 'pCube1') == 1 and seen == [None]
        assert 'no scene to constrain' in host.log_entries()[-1]
        assert host.call(command, 'VPxCommand::doIt', 'pCube1', 'pCube2') == 5
        with pytest.raises(RuntimeError) as e:
            vpx.VPxConstraintCommand.parseArgs(command, ov.VArgList())
        assert str(e.value) == 'accessing protected member parseArgs'


class TestStaticsAndConstructors:
    def test_views_are_found_by_name_and_listed(self):
        count = vpx.VPx3dModelView.numberOfViews()
        view = vpx.VPx3dModelView()
        assert view.setName('side') is None
        assert vpx.VPx3dModelView.numberOfViews() == count + 1
        assert int(vpx.VPx3dModelView.getModelView('side').this) == int(view.this)
        assert vpx.VPx3dModelView.getModelView('top') is None
        assert vpx.VPx3dModelView.activeView() is None and not view.isActive()
        del view
        gc.collect()
        assert vpx.VPx3dModelView.numberOfViews() == count

    def test_no_argument_statics(self):
        assert vpx.VPxFileResolver.getURIResolversByName() == []
        assert vpx.VPx3dModelView.isStereoAvailable() is False
        assert vpx.VPxEditData.className() == 'VPxEditData'

    def test_constructors_with_arguments(self):
        class Representation(vpx.VPxRepresentation):
            def activate(self):
                return True

            def getType(self):
                return 'proxy'
        rep = Representation(None, 'box')
        assert rep.getName() == 'box'
        with pytest.raises(TypeError):
            Representation()
        context = vpx.VPxContext('Move')
        assert context.titleString() == 'Move' and vpx.VPxContext().titleString() == ''
        assert vpx.VPxCacheConfigRuleFilter('characters only') is not None

"""Which tests hold each entry of docs/peculiarities.md, and which "Deliberate:" comments mark it in the sources.

A row is an entry's title, its tests, and its marks: each a source and words of the comment there.
"""

ENTRIES = [
    (
        "A file that is no Maya ASCII scene gives a message, and the import returns 0",
        ["FileThatIsNoSceneGivesAMessageAndReturnsZero"],
        [("plugin/ImportDriver.cpp", "a file that is no scene is read with size 0")],
    ),
    (
        "Only the first six characters are looked at, in any case",
        ["HeaderIsTakenInAnyCase"],
        [],
    ),
    (
        "A file shorter than ten bytes fails without a message",
        ["FileShorterThanTenBytesIsRefusedWithoutAMessage"],
        [],
    ),
    (
        'A "//" comment needs its line end',
        ["LineCommentThatEndsTheFileIsRefused"],
        [("maya/MAYA_Lex.cpp", "a line comment that the text ends in is an error")],
    ),
    (
        "A word needs something after it",
        ["WordThatEndsTheFileIsRefused"],
        [],
    ),
    (
        '"/***/" does not end its comment',
        ["SlashThreeStarsSlashLeavesTheCommentOpen"],
        [("maya/MAYA_Lex.cpp", 'after a "*" the byte after it is consumed too')],
    ),
    (
        "A backslash is looked at only as the character before a quote",
        ["EscapedBackslashBeforeAQuoteKeepsTheStringOpen"],
        [("maya/MAYA_Lex.cpp", "a backslash is looked at only as the byte before a quote")],
    ),
    (
        "Keywords act wherever they stand",
        ["KeywordInsideAnIgnoredCommandActs"],
        [("maya/MAYA_Parse.cpp", "a keyword acts wherever it stands")],
    ),
    (
        'An unquoted word that begins with "{", "|", "_" or "#" stops the import',
        ["WordThatBeginsWithAnotherCharacterStopsTheImport"],
        [],
    ),
    (
        "Letters after a number are ignored",
        ["LettersAfterANumberAreIgnored"],
        [],
    ),
    (
        "A name without quotes is not taken",
        ["NameWithoutQuotesIsNotTaken"],
        [],
    ),
    (
        "A name of 253 bytes or more counts as empty",
        ["NameOf253BytesIsEmpty"],
        [],
    ),
    (
        "Of several nodes of one name the first gets all values",
        ["FirstNodeOfANameGetsTheValuesOfAll"],
        [("maya/MAYA_Parse_Attributes.cpp", "it is the first of the name that changes")],
    ),
    (
        "A node type in quotes leaves the node before current",
        ["NodeTypeInQuotesLeavesTheNodeBeforeCurrent"],
        [("maya/MAYA_Parse_Nodes.cpp", "a type that is no plain word leaves the current node as it is")],
    ),
    (
        "A parent comes from `createNode -p` alone",
        ["ParentCommandChangesNothing"],
        [],
    ),
    (
        "Options before an attribute are treated by kind of node",
        ["OptionBeforeATransformAttributeMakesItIgnored", "OptionOfACameraAttributeEatsTheNextToken", "OptionOfACurveEatsTheSemicolon"],
        [
            ("maya/MAYA_Parse_Attributes.cpp", "one option and the token after it are skipped"),
            ("maya/MAYA_Parse_Keys.cpp", "any other option eats the token after it"),
        ],
    ),
    (
        "A triple is replaced as a whole",
        ["MissingComponentTakesItsStartValue"],
        [("maya/MAYA_Parse_Attributes.cpp", "a component that is missing takes its start value")],
    ),
    (
        "Attributes of one axis are not read",
        ["AttributeOfOneAxisIsNotRead"],
        [],
    ),
    (
        "Orthographic is set and never cleared",
        ["OrthographicCameraStaysSo"],
        [("maya/MAYA_Parse_Attributes.cpp", 'only "yes" is looked at')],
    ),
    (
        "Of the film fits only the vertical one counts",
        ["FilmFitOtherThanVerticalCountsAsHorizontal"],
        [("maya/MAYA_Parse_Attributes.cpp", "only the vertical fit counts")],
    ),
    (
        "`select` leaves no node current, unless it ends after a colon",
        ["SelectLeavesNoNodeCurrentUnlessItEndsAfterAColon"],
        [("maya/MAYA_Parse_Render.cpp", "after a colon only the render node has an effect")],
    ),
    (
        "The key attribute is looked for with its case, anywhere in the text",
        ["KeyAttributeIsLookedForWithItsCase"],
        [("maya/MAYA_Parse_Keys.cpp", "the attribute's name is looked for with its case")],
    ),
    (
        "A key whose value is missing has the value 0",
        ["KeyWithoutAValueIsZero"],
        [],
    ),
    (
        "A `setAttr` after a connection can clear it",
        ["AttributeAfterAConnectionClearsIt"],
        [
            ("maya/MAYA_Parse_Connections.cpp", "only the record in the list changes"),
            ("maya/MAYA_Parse_Attributes.cpp", "replaced whole, with the connections that it got since"),
        ],
    ),
    (
        "A constraint's target is found by the word \"target\"",
        ["TargetInItsShortFormDoesNotAim"],
        [("maya/MAYA_Parse_Connections.cpp", '"target" anywhere, with its case')],
    ),
    (
        "A weight that is wired last makes the constraint its own target",
        ["WeightWiredLastMakesTheConstraintItsOwnTarget"],
        [("maya/MAYA_Parse_Connections.cpp", "makes the constraint its own target")],
    ),
    (
        "The axes of the constraint vector have no short forms",
        ["ConstraintVectorAxisHasNoShortForm"],
        [("maya/MAYA_Parse_Connections.cpp", "the axes of the constraint vector have no short")],
    ),
    (
        "An aimed camera looks at the target's own translate",
        ["AimedCameraLooksAtTheTargetsOwnTranslate"],
        [],
    ),
    (
        "Distances stand as they are unless the preference is on",
        ["DistancesStandAsTheyAreUnlessThePreferenceIsOn"],
        [],
    ),
    (
        "Metres and kilometres do not agree with centimetres",
        ["MetreComesOutAHundredTimesTooLarge", "KilometreLacksTheStepFromCentimetresToInches"],
        [("comp/MAYA_Parse_SceneUnits.cpp", "metres come out")],
    ),
    (
        "A scene in radians hardly turns",
        ["SceneInRadiansHardlyTurns"],
        [("comp/MAYA_Parse_SceneUnits.cpp", "radians are multiplied by the factor from degrees to radians")],
    ),
    (
        "Hours, minutes and milliseconds are used as rates",
        ["HoursMinutesAndMillisecondsAreUsedAsRates"],
        [("comp/MAYA_Parse_Timing.cpp", "hours, minutes and milliseconds are used as units per second")],
    ),
    (
        '"game" is a rate, but is not treated as frames',
        ["GameSceneIsNotMovedToTimeZero"],
        [("comp/MAYA_Parse_Timing.cpp", '"game", although a rate, does not move the time offset')],
    ),
    (
        "Scenes in hours, minutes, seconds and milliseconds run at 30 frames per second",
        ["UnitsThatAreNoRateGiveThirtyFramesPerSecond"],
        [],
    ),
    (
        "A frame rate of 0 is passed on as 0/1000",
        ["CustomRateOfZeroIsPassedOn"],
        [("comp/MAYA_Parse_Timing.cpp", "a custom rate that is not positive is passed on as it is")],
    ),
    (
        "Keys are matched by position, not by time",
        ["KeysAreMatchedByPositionAndNotByTime"],
        [],
    ),
    (
        "Unequal key counts stop the import, and the message names a camera",
        ["UnequalKeyCountsStopTheImportWithAMessageAboutACamera"],
        [
            ("comp/MAYA_Parse_Sampling.cpp", "the text names a camera, whatever the node is"),
            ("plugin/Messages.cpp", 'the spelling "Inconsistant"'),
        ],
    ),
    (
        "Every node starts at time 0",
        ["EveryNodeStartsAtTimeZero"],
        [("comp/MAYA_Parse_Timing.cpp", "every node's first key moves the offset anew")],
    ),
    (
        "The duration counts from frame 0",
        ["DurationCountsFromFrameZero"],
        [],
    ),
    (
        "The duration is that of the last key by position",
        ["DurationIsThatOfTheLastKeyByPosition"],
        [("comp/MAYA_Parse_Timing.cpp", "the last key by position, not the latest one")],
    ),
    (
        "A scene without keys has a duration all the same",
        ["SceneWithoutCurvesLastsTenSecondsAndOneWithoutLaterKeysTenFrames"],
        [],
    ),
    (
        "A constant curve can lend its time to key 0",
        ["ConstantCurveLendsItsTimeToTheFirstKey"],
        [("comp/MAYA_Parse_Sampling.cpp", "for key 0 that can be a constant channel, which has no later keys")],
    ),
    (
        "One key animates a focal length, but no transform",
        ["OneKeyAnimatesAFocalLengthAndNoTransform", "OneKeyGivesItsValueToEveryKeyOfAnAnimatedTransform"],
        [("comp/MAYA_Parse_CameraAnimation.cpp", "one key is enough here")],
    ),
    (
        "Rotations run on past a full turn",
        ["RotationRunsOnPastAFullTurn"],
        [],
    ),
    (
        "A zoom that has keys already is left alone",
        ["ZoomThatAlreadyHasKeysIsLeftAloneAndUnreleased"],
        [("comp/MAYA_Parse_CameraAnimation.cpp", "a zoom that already has keys is left alone")],
    ),
    (
        "A scene without cameras makes nothing",
        ["SceneWithoutCamerasMakesNothing"],
        [],
    ),
    (
        'A camera named "perspShape" gets no layer',
        ["CameraNamedPerspShapeGivesNoLayer"],
        [("comp/MAYA_Parse_Assembly.cpp", "this name alone marks the default perspective camera")],
    ),
    (
        'A locator gets a layer when its name holds "null", "NULL" or "Null"',
        ["LocatorNeedsNullInItsOwnName"],
        [("comp/MAYA_Parse_Layers.cpp", "these three spellings alone mark a locator")],
    ),
    (
        "A scene that does not say how its pixels are has a pixel aspect of 0.9091",
        ["SceneThatSaysNothingHasPixelsThatAreNotSquare", "PixelAspectWithinAHundredthOfOneIsSquare"],
        [],
    ),
    (
        "The rotate order is not looked at",
        ["RotateOrderIsNotLookedAt"],
        [("comp/MAYA_Parse_Transform.cpp", "always about X, then Y, then Z")],
    ),
    (
        "Every layer has parent nulls of its own",
        ["EveryLayerHasParentNullsOfItsOwn"],
        [],
    ),
    (
        "A null is named as the child names its parent",
        ["NullIsNamedAsTheChildNamesItsParent"],
        [],
    ),
    (
        "A parent that the scene does not have gives one null",
        ["UnknownParentGivesOneNullAndEndsTheChain"],
        [],
    ),
    (
        "A chain of parents that comes back ends there",
        ["ParentThatWasUsedBeforeEndsTheChain"],
        [],
    ),
    (
        "What was made before a failure stays",
        ["FailureLeavesWhatWasMade", "KeysBeforeAFailureStay"],
        [],
    ),
    (
        "An import keeps its file object",
        ["FileObjectOfAnImportIsKept"],
        [("plugin/ImportDriver.cpp", "the file object is not disposed of")],
    ),
    (
        "A camera's value that cannot be set leaves its stream unreleased",
        ["CameraValueThatCannotBeSetLeavesItsStreamUnreleased"],
        [("comp/MAYA_Parse_Camera.cpp", "a value that cannot be set leaves the stream unreleased")],
    ),
    (
        "An exception out of a suite release ends the process",
        ["ExceptionOutOfASuiteReleaseEndsTheProcess"],
        [("plugin/QZGP_SuiteHandler.h", "an exception out of a release ends the process")],
    ),
]

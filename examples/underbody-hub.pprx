<?xml version="1.0" encoding="UTF-8" standalone="no" ?>
<pprDocument environment="IPDDocEnv" version="1">

  <products>
    <product alias="PPRProduct" id="P2" name="Underbody"/>
    <product father="P2" id="P4" name="Sheet metal parts"/>
    <product father="P4" id="P19" name="Front floor panel"/>
    <product father="P4" id="P20" name="Tunnel reinforcement"/>
    <product father="P4" id="P42" name="Seat cross member front"/>
    <product father="P4" id="P43" name="Seat cross member rear"/>
    <product father="P4" id="P66" name="Front floor side member LH"/>
    <product father="P4" id="P87" name="Heel board"/>
    <product father="P4" id="P106" name="Front floor panel 2"/>
    <product father="P4" id="P107" name="Tunnel reinforcement 2"/>
    <product father="P4" id="P124" name="Seat cross member front 2"/>
    <product father="P4" id="P139" name="Front floor side member LH 2"/>
    <product father="P4" id="P140" name="Front floor side member RH 2"/>
    <product father="P4" id="P164" name="Heel board 2"/>
    <product father="P4" id="P165" name="Tunnel bracket 2"/>
    <product father="P4" id="P190" name="Rear floor panel"/>
    <product father="P4" id="P207" name="Rear cross member"/>
    <product father="P4" id="P228" name="Rear side member RH"/>
    <product father="P4" id="P229" name="Rear floor extension"/>
    <product father="P4" id="P252" name="Jack bracket"/>
    <product father="P4" id="P253" name="Tow hook plate"/>
    <product father="P4" id="P271" name="Rear floor panel 2"/>
    <product father="P4" id="P286" name="Rear cross member 2"/>
    <product father="P4" id="P287" name="Rear side member LH 2"/>
    <product father="P4" id="P307" name="Rear side member RH 2"/>
    <product father="P4" id="P308" name="Rear floor extension 2"/>
    <product father="P4" id="P329" name="Jack bracket 2"/>
    <product father="P4" id="P349" name="Front rail LH"/>
    <product father="P4" id="P363" name="Dash panel"/>
    <product father="P4" id="P364" name="Wheelhouse LH"/>
    <product father="P4" id="P387" name="Wheelhouse RH"/>
    <product father="P4" id="P388" name="Shock tower LH"/>
    <product father="P4" id="P405" name="Shock tower RH"/>
    <product father="P4" id="P424" name="Front rail LH 2"/>
    <product father="P4" id="P442" name="Dash panel 2"/>
    <product father="P4" id="P443" name="Wheelhouse LH 2"/>
    <product father="P4" id="P466" name="Wheelhouse RH 2"/>
    <product father="P4" id="P482" name="Shock tower RH 2"/>
    <product father="P4" id="P502" name="Rear end panel"/>
    <product father="P4" id="P522" name="Battery tray"/>
    <product father="P4" id="P543" name="Underbody reinforcement"/>
    <product father="P4" id="P544" name="Crash box LH"/>
    <product father="P4" id="P567" name="Crash box RH"/>
    <product father="P4" id="P583" name="Gear box support"/>
    <product father="P4" id="P602" name="Rear end panel 2"/>
    <product father="P4" id="P623" name="Battery tray 2"/>
    <product father="P4" id="P642" name="Underbody reinforcement 2"/>
    <product father="P2" id="P5" name="Sub-assemblies"/>
    <product father="P5" id="P25" name="Front floor assembly FF010"/>
    <product father="P5" id="P50" name="Front floor assembly FF020"/>
    <product father="P5" id="P71" name="Front floor assembly FF030"/>
    <product father="P5" id="P92" name="Front floor assembly FF040"/>
    <product father="P5" id="P114" name="Front floor assembly FF050"/>
    <product father="P5" id="P129" name="Front floor assembly FF060"/>
    <product father="P5" id="P147" name="Front floor assembly FF070"/>
    <product father="P5" id="P172" name="Front floor assembly FF080"/>
    <product father="P5" id="P193" name="Rear floor assembly RF010"/>
    <product father="P5" id="P212" name="Rear floor assembly RF020"/>
    <product father="P5" id="P236" name="Rear floor assembly RF030"/>
    <product father="P5" id="P260" name="Rear floor assembly RF040"/>
    <product father="P5" id="P276" name="Rear floor assembly RF050"/>
    <product father="P5" id="P294" name="Rear floor assembly RF060"/>
    <product father="P5" id="P315" name="Rear floor assembly RF070"/>
    <product father="P5" id="P334" name="Rear floor assembly RF080"/>
    <product father="P5" id="P352" name="Engine compartment assembly EC010"/>
    <product father="P5" id="P371" name="Engine compartment assembly EC020"/>
    <product father="P5" id="P395" name="Engine compartment assembly EC030"/>
    <product father="P5" id="P410" name="Engine compartment assembly EC040"/>
    <product father="P5" id="P429" name="Engine compartment assembly EC050"/>
    <product father="P5" id="P450" name="Engine compartment assembly EC060"/>
    <product father="P5" id="P471" name="Engine compartment assembly EC070"/>
    <product father="P5" id="P487" name="Engine compartment assembly EC080"/>
    <product father="P5" id="P511" name="Underbody assembly UB010"/>
    <product father="P5" id="P527" name="Underbody assembly UB020"/>
    <product father="P5" id="P551" name="Underbody assembly UB030"/>
    <product father="P5" id="P572" name="Underbody assembly UB040"/>
    <product father="P5" id="P588" name="Underbody assembly UB050"/>
    <product father="P5" id="P607" name="Underbody assembly UB060"/>
    <product father="P5" id="P628" name="Underbody assembly UB070"/>
    <product father="P5" id="P647" name="Underbody assembly UB080"/>
    <product alias="PPRResources" id="P3" name="Resources"/>
    <product father="P3" id="P16" name="Underbody cell" planType="Line" resourceClass="Resource"/>
    <product father="P16" id="P27" name="FF010" planType="Station" resourceClass="Station"/>
    <product father="P27" id="P28" name="FF010 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P27" id="P29" name="FF010 operator" planType="Worker" resourceClass="Worker"/>
    <product father="P27" id="P31" name="FF010 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P31" id="P32" name="FF010 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P27" id="P34" name="FF010 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P34" id="P35" name="FF010 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P27" id="P37" name="FF010 robot R3" planType="Robot" resourceClass="Robot"/>
    <product father="P37" id="P38" name="FF010 gun G3" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P52" name="FF020" planType="Station" resourceClass="Station"/>
    <product father="P52" id="P53" name="FF020 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P52" id="P55" name="FF020 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P55" id="P56" name="FF020 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P52" id="P58" name="FF020 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P58" id="P59" name="FF020 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P52" id="P61" name="FF020 robot R3" planType="Robot" resourceClass="Robot"/>
    <product father="P61" id="P62" name="FF020 gun G3" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P73" name="FF030" planType="Station" resourceClass="Station"/>
    <product father="P73" id="P74" name="FF030 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P73" id="P76" name="FF030 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P76" id="P77" name="FF030 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P73" id="P79" name="FF030 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P79" id="P80" name="FF030 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P73" id="P82" name="FF030 robot R3" planType="Robot" resourceClass="Robot"/>
    <product father="P82" id="P83" name="FF030 gun G3" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P94" name="FF040" planType="Station" resourceClass="Station"/>
    <product father="P94" id="P95" name="FF040 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P94" id="P96" name="FF040 operator" planType="Worker" resourceClass="Worker"/>
    <product father="P94" id="P98" name="FF040 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P98" id="P99" name="FF040 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P94" id="P101" name="FF040 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P101" id="P102" name="FF040 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P116" name="FF050" planType="Station" resourceClass="Station"/>
    <product father="P116" id="P117" name="FF050 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P116" id="P119" name="FF050 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P119" id="P120" name="FF050 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P131" name="FF060" planType="Station" resourceClass="Station"/>
    <product father="P131" id="P132" name="FF060 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P131" id="P134" name="FF060 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P134" id="P135" name="FF060 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P149" name="FF070" planType="Station" resourceClass="Station"/>
    <product father="P149" id="P150" name="FF070 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P149" id="P151" name="FF070 operator" planType="Worker" resourceClass="Worker"/>
    <product father="P149" id="P153" name="FF070 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P153" id="P154" name="FF070 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P149" id="P156" name="FF070 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P156" id="P157" name="FF070 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P149" id="P159" name="FF070 robot R3" planType="Robot" resourceClass="Robot"/>
    <product father="P159" id="P160" name="FF070 gun G3" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P174" name="FF080" planType="Station" resourceClass="Station"/>
    <product father="P174" id="P175" name="FF080 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P174" id="P177" name="FF080 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P177" id="P178" name="FF080 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P174" id="P180" name="FF080 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P180" id="P181" name="FF080 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P174" id="P183" name="FF080 robot R3" planType="Robot" resourceClass="Robot"/>
    <product father="P183" id="P184" name="FF080 gun G3" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P187" name="FF transfer conveyor" planType="Transport" resourceClass="Transport"/>
    <product father="P16" id="P195" name="RF010" planType="Station" resourceClass="Station"/>
    <product father="P195" id="P196" name="RF010 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P195" id="P197" name="RF010 operator" planType="Worker" resourceClass="Worker"/>
    <product father="P195" id="P199" name="RF010 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P199" id="P200" name="RF010 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P195" id="P202" name="RF010 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P202" id="P203" name="RF010 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P214" name="RF020" planType="Station" resourceClass="Station"/>
    <product father="P214" id="P215" name="RF020 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P214" id="P217" name="RF020 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P217" id="P218" name="RF020 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P214" id="P220" name="RF020 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P220" id="P221" name="RF020 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P214" id="P223" name="RF020 robot R3" planType="Robot" resourceClass="Robot"/>
    <product father="P223" id="P224" name="RF020 gun G3" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P238" name="RF030" planType="Station" resourceClass="Station"/>
    <product father="P238" id="P239" name="RF030 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P238" id="P241" name="RF030 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P241" id="P242" name="RF030 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P238" id="P244" name="RF030 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P244" id="P245" name="RF030 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P238" id="P247" name="RF030 robot R3" planType="Robot" resourceClass="Robot"/>
    <product father="P247" id="P248" name="RF030 gun G3" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P262" name="RF040" planType="Station" resourceClass="Station"/>
    <product father="P262" id="P263" name="RF040 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P262" id="P264" name="RF040 operator" planType="Worker" resourceClass="Worker"/>
    <product father="P262" id="P266" name="RF040 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P266" id="P267" name="RF040 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P278" name="RF050" planType="Station" resourceClass="Station"/>
    <product father="P278" id="P279" name="RF050 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P278" id="P281" name="RF050 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P281" id="P282" name="RF050 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P296" name="RF060" planType="Station" resourceClass="Station"/>
    <product father="P296" id="P297" name="RF060 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P296" id="P299" name="RF060 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P299" id="P300" name="RF060 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P296" id="P302" name="RF060 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P302" id="P303" name="RF060 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P317" name="RF070" planType="Station" resourceClass="Station"/>
    <product father="P317" id="P318" name="RF070 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P317" id="P319" name="RF070 operator" planType="Worker" resourceClass="Worker"/>
    <product father="P317" id="P321" name="RF070 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P321" id="P322" name="RF070 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P317" id="P324" name="RF070 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P324" id="P325" name="RF070 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P336" name="RF080" planType="Station" resourceClass="Station"/>
    <product father="P336" id="P337" name="RF080 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P336" id="P339" name="RF080 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P339" id="P340" name="RF080 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P336" id="P342" name="RF080 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P342" id="P343" name="RF080 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P346" name="RF transfer conveyor" planType="Transport" resourceClass="Transport"/>
    <product father="P16" id="P354" name="EC010" planType="Station" resourceClass="Station"/>
    <product father="P354" id="P355" name="EC010 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P354" id="P356" name="EC010 operator" planType="Worker" resourceClass="Worker"/>
    <product father="P354" id="P358" name="EC010 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P358" id="P359" name="EC010 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P373" name="EC020" planType="Station" resourceClass="Station"/>
    <product father="P373" id="P374" name="EC020 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P373" id="P376" name="EC020 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P376" id="P377" name="EC020 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P373" id="P379" name="EC020 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P379" id="P380" name="EC020 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P373" id="P382" name="EC020 robot R3" planType="Robot" resourceClass="Robot"/>
    <product father="P382" id="P383" name="EC020 gun G3" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P397" name="EC030" planType="Station" resourceClass="Station"/>
    <product father="P397" id="P398" name="EC030 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P397" id="P400" name="EC030 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P400" id="P401" name="EC030 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P412" name="EC040" planType="Station" resourceClass="Station"/>
    <product father="P412" id="P413" name="EC040 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P412" id="P414" name="EC040 operator" planType="Worker" resourceClass="Worker"/>
    <product father="P412" id="P416" name="EC040 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P416" id="P417" name="EC040 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P412" id="P419" name="EC040 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P419" id="P420" name="EC040 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P431" name="EC050" planType="Station" resourceClass="Station"/>
    <product father="P431" id="P432" name="EC050 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P431" id="P434" name="EC050 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P434" id="P435" name="EC050 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P431" id="P437" name="EC050 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P437" id="P438" name="EC050 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P452" name="EC060" planType="Station" resourceClass="Station"/>
    <product father="P452" id="P453" name="EC060 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P452" id="P455" name="EC060 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P455" id="P456" name="EC060 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P452" id="P458" name="EC060 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P458" id="P459" name="EC060 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P452" id="P461" name="EC060 robot R3" planType="Robot" resourceClass="Robot"/>
    <product father="P461" id="P462" name="EC060 gun G3" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P473" name="EC070" planType="Station" resourceClass="Station"/>
    <product father="P473" id="P474" name="EC070 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P473" id="P475" name="EC070 operator" planType="Worker" resourceClass="Worker"/>
    <product father="P473" id="P477" name="EC070 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P477" id="P478" name="EC070 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P489" name="EC080" planType="Station" resourceClass="Station"/>
    <product father="P489" id="P490" name="EC080 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P489" id="P492" name="EC080 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P492" id="P493" name="EC080 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P489" id="P495" name="EC080 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P495" id="P496" name="EC080 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P499" name="EC transfer conveyor" planType="Transport" resourceClass="Transport"/>
    <product father="P16" id="P513" name="UB010" planType="Station" resourceClass="Station"/>
    <product father="P513" id="P514" name="UB010 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P513" id="P515" name="UB010 operator" planType="Worker" resourceClass="Worker"/>
    <product father="P513" id="P517" name="UB010 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P517" id="P518" name="UB010 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P529" name="UB020" planType="Station" resourceClass="Station"/>
    <product father="P529" id="P530" name="UB020 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P529" id="P532" name="UB020 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P532" id="P533" name="UB020 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P529" id="P535" name="UB020 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P535" id="P536" name="UB020 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P529" id="P538" name="UB020 robot R3" planType="Robot" resourceClass="Robot"/>
    <product father="P538" id="P539" name="UB020 gun G3" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P553" name="UB030" planType="Station" resourceClass="Station"/>
    <product father="P553" id="P554" name="UB030 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P553" id="P556" name="UB030 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P556" id="P557" name="UB030 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P553" id="P559" name="UB030 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P559" id="P560" name="UB030 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P553" id="P562" name="UB030 robot R3" planType="Robot" resourceClass="Robot"/>
    <product father="P562" id="P563" name="UB030 gun G3" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P574" name="UB040" planType="Station" resourceClass="Station"/>
    <product father="P574" id="P575" name="UB040 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P574" id="P576" name="UB040 operator" planType="Worker" resourceClass="Worker"/>
    <product father="P574" id="P578" name="UB040 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P578" id="P579" name="UB040 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P590" name="UB050" planType="Station" resourceClass="Station"/>
    <product father="P590" id="P591" name="UB050 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P590" id="P593" name="UB050 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P593" id="P594" name="UB050 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P590" id="P596" name="UB050 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P596" id="P597" name="UB050 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P599" name="Underbody buffer" planType="Buffer" resourceClass="Buffer"/>
    <product father="P16" id="P609" name="UB060" planType="Station" resourceClass="Station"/>
    <product father="P609" id="P610" name="UB060 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P609" id="P612" name="UB060 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P612" id="P613" name="UB060 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P609" id="P615" name="UB060 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P615" id="P616" name="UB060 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P609" id="P618" name="UB060 robot R3" planType="Robot" resourceClass="Robot"/>
    <product father="P618" id="P619" name="UB060 gun G3" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P16" id="P677" name="Respot group" planType="Group" resourceClass="Station"/>
    <product father="P677" id="P630" name="UB070" planType="Station" resourceClass="Station"/>
    <product father="P630" id="P631" name="UB070 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P630" id="P632" name="UB070 operator" planType="Worker" resourceClass="Worker"/>
    <product father="P630" id="P634" name="UB070 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P634" id="P635" name="UB070 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P630" id="P637" name="UB070 robot R2" planType="Robot" resourceClass="Robot"/>
    <product father="P637" id="P638" name="UB070 gun G2" planType="WeldGun" resourceClass="WeldGun"/>
    <product father="P677" id="P649" name="UB080" planType="Station" resourceClass="Station"/>
    <product father="P649" id="P650" name="UB080 fixture" planType="Fixture" resourceClass="Fixture"/>
    <product father="P649" id="P652" name="UB080 robot R1" planType="Robot" resourceClass="Robot"/>
    <product father="P652" id="P653" name="UB080 gun G1" planType="WeldGun" resourceClass="WeldGun"/>
  </products>

  <assemblies>
    <assembly id="M186" name="MA Front floor">
      <component ref="P19"/>
      <component ref="P20"/>
      <component ref="P42"/>
      <component ref="P43"/>
      <component ref="P66"/>
      <component ref="P87"/>
      <component ref="P106"/>
      <component ref="P107"/>
      <component ref="P124"/>
      <component ref="P139"/>
      <component ref="P140"/>
      <component ref="P164"/>
      <component ref="P165"/>
    </assembly>
    <assembly id="M345" name="MA Rear floor">
      <component ref="P190"/>
      <component ref="P207"/>
      <component ref="P228"/>
      <component ref="P229"/>
      <component ref="P252"/>
      <component ref="P253"/>
      <component ref="P271"/>
      <component ref="P286"/>
      <component ref="P287"/>
      <component ref="P307"/>
      <component ref="P308"/>
      <component ref="P329"/>
    </assembly>
    <assembly id="M498" name="MA Engine compartment">
      <component ref="P349"/>
      <component ref="P363"/>
      <component ref="P364"/>
      <component ref="P387"/>
      <component ref="P388"/>
      <component ref="P405"/>
      <component ref="P424"/>
      <component ref="P442"/>
      <component ref="P443"/>
      <component ref="P466"/>
      <component ref="P482"/>
    </assembly>
  </assemblies>

  <process>
    <activity id="A1" label="Underbody line" type="BIWActivityRoot">
      <activity cycleTime="47" height="15" id="A17" label="FF010 Front floor" time="47" type="BIWActivityStation" width="30" x="12.5" y="12.5">
        <input id="IO21" item="P19"/>
        <input id="IO23" item="P20"/>
        <output id="IO26" item="P25"/>
        <item ref="P19" via="IO21"/>
        <item ref="P20" via="IO23"/>
        <resource ref="P27"/>
        <attribute name="Invest" type="double" value="250000"/>
        <attribute name="Shift" type="long" value="1"/>
        <activity id="A18" label="Load FF010" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO22" item="P19"/>
          <input id="IO24" item="P20"/>
          <item ref="P19" via="IO22"/>
          <item ref="P20" via="IO24"/>
          <resource ref="P28"/>
          <resource ref="P29"/>
        </activity>
        <activity id="A30" label="Clinch FF010-1" time="26" type="BIWActivityClinching" x="62.5" y="12.5">
          <resource ref="P31"/>
          <resource ref="P32"/>
        </activity>
        <activity id="A33" label="Spot weld FF010-2" time="22" type="BIWActivitySpotWelding" x="112.5" y="12.5">
          <resource ref="P34"/>
          <resource ref="P35"/>
        </activity>
        <activity id="A36" label="Spot weld FF010-3" time="16" type="BIWActivitySpotWelding" x="162.5" y="12.5">
          <output id="IO39" item="P25"/>
          <resource ref="P37"/>
          <resource ref="P38"/>
        </activity>
        <flow from="A18" to="A30"/>
        <flow from="A30" to="A33"/>
        <flow from="A33" to="A36"/>
      </activity>
      <activity cycleTime="52" height="15" id="A40" label="FF020 Front floor" time="52" type="BIWActivityStation" width="30" x="62.5" y="12.5">
        <input id="IO44" item="P25"/>
        <input id="IO46" item="P42"/>
        <input id="IO48" item="P43"/>
        <output id="IO51" item="P50"/>
        <item ref="P25" via="IO44"/>
        <item ref="P42" via="IO46"/>
        <item ref="P43" via="IO48"/>
        <resource ref="P52"/>
        <attribute name="Invest" type="double" value="251000"/>
        <attribute name="Shift" type="long" value="2"/>
        <activity id="A41" label="Load FF020" time="12" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO45" item="P25"/>
          <input id="IO47" item="P42"/>
          <input id="IO49" item="P43"/>
          <item ref="P42" via="IO47"/>
          <item ref="P43" via="IO49"/>
          <resource ref="P53"/>
        </activity>
        <activity id="A54" label="Stud weld FF020-1" time="21" type="BIWActivityStudWelding" x="62.5" y="12.5">
          <resource ref="P55"/>
          <resource ref="P56"/>
        </activity>
        <activity id="A57" label="Spot weld FF020-2" time="14" type="BIWActivitySpotWelding" x="112.5" y="12.5">
          <resource ref="P58"/>
          <resource ref="P59"/>
        </activity>
        <activity id="A60" label="Arc weld FF020-3" time="24" type="BIWActivityArcWelding" x="162.5" y="12.5">
          <output id="IO63" item="P50"/>
          <resource ref="P61"/>
          <resource ref="P62"/>
        </activity>
        <flow from="A41" to="A54"/>
        <flow from="A54" to="A57"/>
        <flow from="A57" to="A60"/>
      </activity>
      <activity cycleTime="41" height="15" id="A64" label="FF030 Front floor" time="41" type="BIWActivityStation" width="30" x="112.5" y="12.5">
        <input id="IO67" item="P50"/>
        <input id="IO69" item="P66"/>
        <output id="IO72" item="P71"/>
        <item ref="P50" via="IO67"/>
        <item ref="P66" via="IO69"/>
        <resource ref="P73"/>
        <attribute name="Invest" type="double" value="252000"/>
        <attribute name="Shift" type="long" value="3"/>
        <activity id="A65" label="Load FF030" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO68" item="P50"/>
          <input id="IO70" item="P66"/>
          <item ref="P66" via="IO70"/>
          <resource ref="P74"/>
        </activity>
        <activity id="A75" label="Spot weld FF030-1" time="15" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <resource ref="P76"/>
          <resource ref="P77"/>
        </activity>
        <activity id="A78" label="Spot weld FF030-2" time="20" type="BIWActivitySpotWelding" x="112.5" y="12.5">
          <resource ref="P79"/>
          <resource ref="P80"/>
        </activity>
        <activity id="A81" label="Arc weld FF030-3" time="12" type="BIWActivityArcWelding" x="162.5" y="12.5">
          <output id="IO84" item="P71"/>
          <resource ref="P82"/>
          <resource ref="P83"/>
        </activity>
        <flow from="A65" to="A75"/>
        <flow from="A75" to="A78"/>
        <flow from="A78" to="A81"/>
      </activity>
      <activity cycleTime="62" height="15" id="A85" label="FF040 Front floor" time="62" type="BIWActivityStation" width="30" x="162.5" y="12.5">
        <input id="IO88" item="P71"/>
        <input id="IO90" item="P87"/>
        <output id="IO93" item="P92"/>
        <item ref="P71" via="IO88"/>
        <item ref="P87" via="IO90"/>
        <resource ref="P94"/>
        <attribute name="Invest" type="double" value="253000"/>
        <attribute name="Shift" type="long" value="1"/>
        <activity id="A86" label="Load FF040" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO89" item="P71"/>
          <input id="IO91" item="P87"/>
          <item ref="P87" via="IO91"/>
          <resource ref="P95"/>
          <resource ref="P96"/>
        </activity>
        <activity id="A97" label="Arc weld FF040-1" time="29" type="BIWActivityArcWelding" x="62.5" y="12.5">
          <resource ref="P98"/>
          <resource ref="P99"/>
        </activity>
        <activity id="A100" label="Arc weld FF040-2" time="20" type="BIWActivityArcWelding" x="112.5" y="12.5">
          <output id="IO103" item="P92"/>
          <resource ref="P101"/>
          <resource ref="P102"/>
        </activity>
        <flow from="A86" to="A97"/>
        <flow from="A97" to="A100"/>
      </activity>
      <activity cycleTime="51" height="15" id="A104" label="FF050 Front floor" time="51" type="BIWActivityStation" width="30" x="212.5" y="12.5">
        <input id="IO108" item="P92"/>
        <input id="IO110" item="P106"/>
        <input id="IO112" item="P107"/>
        <output id="IO115" item="P114"/>
        <item ref="P92" via="IO108"/>
        <item ref="P106" via="IO110"/>
        <item ref="P107" via="IO112"/>
        <resource ref="P116"/>
        <attribute name="Invest" type="double" value="254000"/>
        <attribute name="Shift" type="long" value="2"/>
        <activity id="A105" label="Load FF050" time="12" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO109" item="P92"/>
          <input id="IO111" item="P106"/>
          <input id="IO113" item="P107"/>
          <item ref="P106" via="IO111"/>
          <item ref="P107" via="IO113"/>
          <resource ref="P117"/>
        </activity>
        <activity id="A118" label="Spot weld FF050-1" time="19" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <output id="IO121" item="P114"/>
          <resource ref="P119"/>
          <resource ref="P120"/>
        </activity>
        <flow from="A105" to="A118"/>
      </activity>
      <activity cycleTime="52" height="15" id="A122" label="FF060 Front floor" time="52" type="BIWActivityStation" width="30" x="262.5" y="12.5">
        <input id="IO125" item="P114"/>
        <input id="IO127" item="P124"/>
        <output id="IO130" item="P129"/>
        <item ref="P114" via="IO125"/>
        <item ref="P124" via="IO127"/>
        <resource ref="P131"/>
        <attribute name="Invest" type="double" value="255000"/>
        <attribute name="Shift" type="long" value="3"/>
        <activity id="A123" label="Load FF060" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO126" item="P114"/>
          <input id="IO128" item="P124"/>
          <item ref="P124" via="IO128"/>
          <resource ref="P132"/>
        </activity>
        <activity id="A133" label="Spot weld FF060-1" time="17" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <output id="IO136" item="P129"/>
          <resource ref="P134"/>
          <resource ref="P135"/>
        </activity>
        <flow from="A123" to="A133"/>
      </activity>
      <activity cycleTime="64" height="15" id="A137" label="FF070 Front floor" time="64" type="BIWActivityStation" width="30" x="312.5" y="12.5">
        <input id="IO141" item="P129"/>
        <input id="IO143" item="P139"/>
        <input id="IO145" item="P140"/>
        <output id="IO148" item="P147"/>
        <item ref="P129" via="IO141"/>
        <item ref="P139" via="IO143"/>
        <item ref="P140" via="IO145"/>
        <resource ref="P149"/>
        <attribute name="Invest" type="double" value="256000"/>
        <attribute name="Shift" type="long" value="1"/>
        <activity id="A138" label="Load FF070" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO142" item="P129"/>
          <input id="IO144" item="P139"/>
          <input id="IO146" item="P140"/>
          <item ref="P139" via="IO144"/>
          <item ref="P140" via="IO146"/>
          <resource ref="P150"/>
          <resource ref="P151"/>
        </activity>
        <activity id="A152" label="Apply sealant FF070-1" time="12" type="BIWActivitySealantApplication" x="62.5" y="12.5">
          <resource ref="P153"/>
          <resource ref="P154"/>
        </activity>
        <activity id="A155" label="Spot glue FF070-2" time="17" type="BIWActivitySpotGluing" x="112.5" y="12.5">
          <resource ref="P156"/>
          <resource ref="P157"/>
        </activity>
        <activity id="A158" label="Clinch FF070-3" time="24" type="BIWActivityClinching" x="162.5" y="12.5">
          <output id="IO161" item="P147"/>
          <resource ref="P159"/>
          <resource ref="P160"/>
        </activity>
        <flow from="A138" to="A152"/>
        <flow from="A152" to="A155"/>
        <flow from="A155" to="A158"/>
      </activity>
      <activity cycleTime="59" height="15" id="A162" label="FF080 Front floor" time="59" type="BIWActivityStation" width="30" x="362.5" y="12.5">
        <input id="IO166" item="P147"/>
        <input id="IO168" item="P164"/>
        <input id="IO170" item="P165"/>
        <output id="IO173" item="P172"/>
        <item ref="P147" via="IO166"/>
        <item ref="P164" via="IO168"/>
        <item ref="P165" via="IO170"/>
        <resource ref="P174"/>
        <item ref="M186"/>
        <resource ref="P187"/>
        <attribute name="Invest" type="double" value="257000"/>
        <attribute name="Shift" type="long" value="2"/>
        <activity id="A163" label="Load FF080" time="9" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO167" item="P147"/>
          <input id="IO169" item="P164"/>
          <input id="IO171" item="P165"/>
          <item ref="P164" via="IO169"/>
          <item ref="P165" via="IO171"/>
          <resource ref="P175"/>
        </activity>
        <activity id="A176" label="Clinch FF080-1" time="26" type="BIWActivityClinching" x="62.5" y="12.5">
          <resource ref="P177"/>
          <resource ref="P178"/>
        </activity>
        <activity id="A179" label="Spot weld FF080-2" time="18" type="BIWActivitySpotWelding" x="112.5" y="12.5">
          <resource ref="P180"/>
          <resource ref="P181"/>
        </activity>
        <activity id="A182" label="Clinch FF080-3" time="13" type="BIWActivityClinching" x="162.5" y="12.5">
          <output id="IO185" item="P172"/>
          <resource ref="P183"/>
          <resource ref="P184"/>
        </activity>
        <flow from="A163" to="A176"/>
        <flow from="A176" to="A179"/>
        <flow from="A179" to="A182"/>
      </activity>
      <activity cycleTime="62" height="15" id="A188" label="RF010 Rear floor" time="62" type="BIWActivityStation" width="30" x="12.5" y="50">
        <input id="IO191" item="P190"/>
        <output id="IO194" item="P193"/>
        <item ref="P190" via="IO191"/>
        <resource ref="P195"/>
        <attribute name="Invest" type="double" value="250000"/>
        <attribute name="Shift" type="long" value="1"/>
        <activity id="A189" label="Load RF010" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO192" item="P190"/>
          <item ref="P190" via="IO192"/>
          <resource ref="P196"/>
          <resource ref="P197"/>
        </activity>
        <activity id="A198" label="Apply adhesive RF010-1" time="29" type="BIWActivityAdhesiveApplication" x="62.5" y="12.5">
          <resource ref="P199"/>
          <resource ref="P200"/>
        </activity>
        <activity id="A201" label="Stud weld RF010-2" time="26" type="BIWActivityStudWelding" x="112.5" y="12.5">
          <output id="IO204" item="P193"/>
          <resource ref="P202"/>
          <resource ref="P203"/>
        </activity>
        <flow from="A189" to="A198"/>
        <flow from="A198" to="A201"/>
      </activity>
      <activity cycleTime="52" height="15" id="A205" label="RF020 Rear floor" time="52" type="BIWActivityStation" width="30" x="62.5" y="50">
        <input id="IO208" item="P193"/>
        <input id="IO210" item="P207"/>
        <output id="IO213" item="P212"/>
        <item ref="P193" via="IO208"/>
        <item ref="P207" via="IO210"/>
        <resource ref="P214"/>
        <attribute name="Invest" type="double" value="251000"/>
        <attribute name="Shift" type="long" value="2"/>
        <activity id="A206" label="Load RF020" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO209" item="P193"/>
          <input id="IO211" item="P207"/>
          <item ref="P207" via="IO211"/>
          <resource ref="P215"/>
        </activity>
        <activity id="A216" label="Stud weld RF020-1" time="27" type="BIWActivityStudWelding" x="62.5" y="12.5">
          <resource ref="P217"/>
          <resource ref="P218"/>
        </activity>
        <activity id="A219" label="Arc weld RF020-2" time="12" type="BIWActivityArcWelding" x="112.5" y="12.5">
          <resource ref="P220"/>
          <resource ref="P221"/>
        </activity>
        <activity id="A222" label="Spot weld RF020-3" time="11" type="BIWActivitySpotWelding" x="162.5" y="12.5">
          <output id="IO225" item="P212"/>
          <resource ref="P223"/>
          <resource ref="P224"/>
        </activity>
        <flow from="A206" to="A216"/>
        <flow from="A216" to="A219"/>
        <flow from="A219" to="A222"/>
      </activity>
      <activity cycleTime="47" height="15" id="A226" label="RF030 Rear floor" time="47" type="BIWActivityStation" width="30" x="112.5" y="50">
        <input id="IO230" item="P212"/>
        <input id="IO232" item="P228"/>
        <input id="IO234" item="P229"/>
        <output id="IO237" item="P236"/>
        <item ref="P212" via="IO230"/>
        <item ref="P228" via="IO232"/>
        <item ref="P229" via="IO234"/>
        <resource ref="P238"/>
        <attribute name="Invest" type="double" value="252000"/>
        <attribute name="Shift" type="long" value="3"/>
        <activity id="A227" label="Load RF030" time="8" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO231" item="P212"/>
          <input id="IO233" item="P228"/>
          <input id="IO235" item="P229"/>
          <item ref="P228" via="IO233"/>
          <item ref="P229" via="IO235"/>
          <resource ref="P239"/>
        </activity>
        <activity id="A240" label="Apply adhesive RF030-1" time="18" type="BIWActivityAdhesiveApplication" x="62.5" y="12.5">
          <resource ref="P241"/>
          <resource ref="P242"/>
        </activity>
        <activity id="A243" label="Stud weld RF030-2" time="22" type="BIWActivityStudWelding" x="112.5" y="12.5">
          <resource ref="P244"/>
          <resource ref="P245"/>
        </activity>
        <activity id="A246" label="Spot weld RF030-3" time="21" type="BIWActivitySpotWelding" x="162.5" y="12.5">
          <output id="IO249" item="P236"/>
          <resource ref="P247"/>
          <resource ref="P248"/>
        </activity>
        <flow from="A227" to="A240"/>
        <flow from="A240" to="A243"/>
        <flow from="A243" to="A246"/>
      </activity>
      <activity cycleTime="57" height="15" id="A250" label="RF040 Rear floor" time="57" type="BIWActivityStation" width="30" x="162.5" y="50">
        <input id="IO254" item="P236"/>
        <input id="IO256" item="P252"/>
        <input id="IO258" item="P253"/>
        <output id="IO261" item="P260"/>
        <item ref="P236" via="IO254"/>
        <item ref="P252" via="IO256"/>
        <item ref="P253" via="IO258"/>
        <resource ref="P262"/>
        <attribute name="Invest" type="double" value="253000"/>
        <attribute name="Shift" type="long" value="1"/>
        <activity id="A251" label="Load RF040" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO255" item="P236"/>
          <input id="IO257" item="P252"/>
          <input id="IO259" item="P253"/>
          <item ref="P252" via="IO257"/>
          <item ref="P253" via="IO259"/>
          <resource ref="P263"/>
          <resource ref="P264"/>
        </activity>
        <activity id="A265" label="Arc weld RF040-1" time="10" type="BIWActivityArcWelding" x="62.5" y="12.5">
          <output id="IO268" item="P260"/>
          <resource ref="P266"/>
          <resource ref="P267"/>
        </activity>
        <flow from="A251" to="A265"/>
      </activity>
      <activity cycleTime="45" height="15" id="A269" label="RF050 Rear floor" time="45" type="BIWActivityStation" width="30" x="212.5" y="50">
        <input id="IO272" item="P260"/>
        <input id="IO274" item="P271"/>
        <output id="IO277" item="P276"/>
        <item ref="P260" via="IO272"/>
        <item ref="P271" via="IO274"/>
        <resource ref="P278"/>
        <attribute name="Invest" type="double" value="254000"/>
        <attribute name="Shift" type="long" value="2"/>
        <activity id="A270" label="Load RF050" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO273" item="P260"/>
          <input id="IO275" item="P271"/>
          <item ref="P271" via="IO275"/>
          <resource ref="P279"/>
        </activity>
        <activity id="A280" label="Spot weld RF050-1" time="29" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <output id="IO283" item="P276"/>
          <resource ref="P281"/>
          <resource ref="P282"/>
        </activity>
        <flow from="A270" to="A280"/>
      </activity>
      <activity cycleTime="50" height="15" id="A284" label="RF060 Rear floor" time="50" type="BIWActivityStation" width="30" x="262.5" y="50">
        <input id="IO288" item="P276"/>
        <input id="IO290" item="P286"/>
        <input id="IO292" item="P287"/>
        <output id="IO295" item="P294"/>
        <item ref="P276" via="IO288"/>
        <item ref="P286" via="IO290"/>
        <item ref="P287" via="IO292"/>
        <resource ref="P296"/>
        <attribute name="Invest" type="double" value="255000"/>
        <attribute name="Shift" type="long" value="3"/>
        <activity id="A285" label="Load RF060" time="9" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO289" item="P276"/>
          <input id="IO291" item="P286"/>
          <input id="IO293" item="P287"/>
          <item ref="P286" via="IO291"/>
          <item ref="P287" via="IO293"/>
          <resource ref="P297"/>
        </activity>
        <activity id="A298" label="Clinch RF060-1" time="21" type="BIWActivityClinching" x="62.5" y="12.5">
          <resource ref="P299"/>
          <resource ref="P300"/>
        </activity>
        <activity id="A301" label="Clinch RF060-2" time="14" type="BIWActivityClinching" x="112.5" y="12.5">
          <output id="IO304" item="P294"/>
          <resource ref="P302"/>
          <resource ref="P303"/>
        </activity>
        <flow from="A285" to="A298"/>
        <flow from="A298" to="A301"/>
      </activity>
      <activity cycleTime="43" height="15" id="A305" label="RF070 Rear floor" time="43" type="BIWActivityStation" width="30" x="312.5" y="50">
        <input id="IO309" item="P294"/>
        <input id="IO311" item="P307"/>
        <input id="IO313" item="P308"/>
        <output id="IO316" item="P315"/>
        <item ref="P294" via="IO309"/>
        <item ref="P307" via="IO311"/>
        <item ref="P308" via="IO313"/>
        <resource ref="P317"/>
        <attribute name="Invest" type="double" value="256000"/>
        <attribute name="Shift" type="long" value="1"/>
        <activity id="A306" label="Load RF070" time="13" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO310" item="P294"/>
          <input id="IO312" item="P307"/>
          <input id="IO314" item="P308"/>
          <item ref="P307" via="IO312"/>
          <item ref="P308" via="IO314"/>
          <resource ref="P318"/>
          <resource ref="P319"/>
        </activity>
        <activity id="A320" label="Apply sealant RF070-1" time="22" type="BIWActivitySealantApplication" x="62.5" y="12.5">
          <resource ref="P321"/>
          <resource ref="P322"/>
        </activity>
        <activity id="A323" label="Apply sealant RF070-2" time="16" type="BIWActivitySealantApplication" x="112.5" y="12.5">
          <output id="IO326" item="P315"/>
          <resource ref="P324"/>
          <resource ref="P325"/>
        </activity>
        <flow from="A306" to="A320"/>
        <flow from="A320" to="A323"/>
      </activity>
      <activity cycleTime="43" height="15" id="A327" label="RF080 Rear floor" time="43" type="BIWActivityStation" width="30" x="362.5" y="50">
        <input id="IO330" item="P315"/>
        <input id="IO332" item="P329"/>
        <output id="IO335" item="P334"/>
        <item ref="P315" via="IO330"/>
        <item ref="P329" via="IO332"/>
        <resource ref="P336"/>
        <item ref="M345"/>
        <resource ref="P346"/>
        <attribute name="Invest" type="double" value="257000"/>
        <attribute name="Shift" type="long" value="2"/>
        <activity id="A328" label="Load RF080" time="13" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO331" item="P315"/>
          <input id="IO333" item="P329"/>
          <item ref="P329" via="IO333"/>
          <resource ref="P337"/>
        </activity>
        <activity id="A338" label="Spot weld RF080-1" time="20" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <resource ref="P339"/>
          <resource ref="P340"/>
        </activity>
        <activity id="A341" label="Clinch RF080-2" time="21" type="BIWActivityClinching" x="112.5" y="12.5">
          <output id="IO344" item="P334"/>
          <resource ref="P342"/>
          <resource ref="P343"/>
        </activity>
        <flow from="A328" to="A338"/>
        <flow from="A338" to="A341"/>
      </activity>
      <activity cycleTime="50" height="15" id="A347" label="EC010 Engine compartment" time="50" type="BIWActivityStation" width="30" x="12.5" y="87.5">
        <input id="IO350" item="P349"/>
        <output id="IO353" item="P352"/>
        <item ref="P349" via="IO350"/>
        <resource ref="P354"/>
        <attribute name="Invest" type="double" value="250000"/>
        <attribute name="Shift" type="long" value="1"/>
        <activity id="A348" label="Load EC010" time="12" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO351" item="P349"/>
          <item ref="P349" via="IO351"/>
          <resource ref="P355"/>
          <resource ref="P356"/>
        </activity>
        <activity id="A357" label="Spot weld EC010-1" time="10" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <output id="IO360" item="P352"/>
          <resource ref="P358"/>
          <resource ref="P359"/>
        </activity>
        <flow from="A348" to="A357"/>
      </activity>
      <activity cycleTime="41" height="15" id="A361" label="EC020 Engine compartment" time="41" type="BIWActivityStation" width="30" x="62.5" y="87.5">
        <input id="IO365" item="P352"/>
        <input id="IO367" item="P363"/>
        <input id="IO369" item="P364"/>
        <output id="IO372" item="P371"/>
        <item ref="P352" via="IO365"/>
        <item ref="P363" via="IO367"/>
        <item ref="P364" via="IO369"/>
        <resource ref="P373"/>
        <attribute name="Invest" type="double" value="251000"/>
        <attribute name="Shift" type="long" value="2"/>
        <activity id="A362" label="Load EC020" time="12" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO366" item="P352"/>
          <input id="IO368" item="P363"/>
          <input id="IO370" item="P364"/>
          <item ref="P363" via="IO368"/>
          <item ref="P364" via="IO370"/>
          <resource ref="P374"/>
        </activity>
        <activity id="A375" label="Spot glue EC020-1" time="20" type="BIWActivitySpotGluing" x="62.5" y="12.5">
          <resource ref="P376"/>
          <resource ref="P377"/>
        </activity>
        <activity id="A378" label="Spot glue EC020-2" time="20" type="BIWActivitySpotGluing" x="112.5" y="12.5">
          <resource ref="P379"/>
          <resource ref="P380"/>
        </activity>
        <activity id="A381" label="Clinch EC020-3" time="18" type="BIWActivityClinching" x="162.5" y="12.5">
          <output id="IO384" item="P371"/>
          <resource ref="P382"/>
          <resource ref="P383"/>
        </activity>
        <flow from="A362" to="A375"/>
        <flow from="A375" to="A378"/>
        <flow from="A378" to="A381"/>
      </activity>
      <activity cycleTime="61" height="15" id="A385" label="EC030 Engine compartment" time="61" type="BIWActivityStation" width="30" x="112.5" y="87.5">
        <input id="IO389" item="P371"/>
        <input id="IO391" item="P387"/>
        <input id="IO393" item="P388"/>
        <output id="IO396" item="P395"/>
        <item ref="P371" via="IO389"/>
        <item ref="P387" via="IO391"/>
        <item ref="P388" via="IO393"/>
        <resource ref="P397"/>
        <attribute name="Invest" type="double" value="252000"/>
        <attribute name="Shift" type="long" value="3"/>
        <activity id="A386" label="Load EC030" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO390" item="P371"/>
          <input id="IO392" item="P387"/>
          <input id="IO394" item="P388"/>
          <item ref="P387" via="IO392"/>
          <item ref="P388" via="IO394"/>
          <resource ref="P398"/>
        </activity>
        <activity id="A399" label="Spot weld EC030-1" time="23" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <output id="IO402" item="P395"/>
          <resource ref="P400"/>
          <resource ref="P401"/>
        </activity>
        <flow from="A386" to="A399"/>
      </activity>
      <activity cycleTime="64" height="15" id="A403" label="EC040 Engine compartment" time="64" type="BIWActivityStation" width="30" x="162.5" y="87.5">
        <input id="IO406" item="P395"/>
        <input id="IO408" item="P405"/>
        <output id="IO411" item="P410"/>
        <item ref="P395" via="IO406"/>
        <item ref="P405" via="IO408"/>
        <resource ref="P412"/>
        <attribute name="Invest" type="double" value="253000"/>
        <attribute name="Shift" type="long" value="1"/>
        <activity id="A404" label="Load EC040" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO407" item="P395"/>
          <input id="IO409" item="P405"/>
          <item ref="P405" via="IO409"/>
          <resource ref="P413"/>
          <resource ref="P414"/>
        </activity>
        <activity id="A415" label="Arc weld EC040-1" time="16" type="BIWActivityArcWelding" x="62.5" y="12.5">
          <resource ref="P416"/>
          <resource ref="P417"/>
        </activity>
        <activity id="A418" label="Arc weld EC040-2" time="16" type="BIWActivityArcWelding" x="112.5" y="12.5">
          <output id="IO421" item="P410"/>
          <resource ref="P419"/>
          <resource ref="P420"/>
        </activity>
        <flow from="A404" to="A415"/>
        <flow from="A415" to="A418"/>
      </activity>
      <activity cycleTime="50" height="15" id="A422" label="EC050 Engine compartment" time="50" type="BIWActivityStation" width="30" x="212.5" y="87.5">
        <input id="IO425" item="P410"/>
        <input id="IO427" item="P424"/>
        <output id="IO430" item="P429"/>
        <item ref="P410" via="IO425"/>
        <item ref="P424" via="IO427"/>
        <resource ref="P431"/>
        <attribute name="Invest" type="double" value="254000"/>
        <attribute name="Shift" type="long" value="2"/>
        <activity id="A423" label="Load EC050" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO426" item="P410"/>
          <input id="IO428" item="P424"/>
          <item ref="P424" via="IO428"/>
          <resource ref="P432"/>
        </activity>
        <activity id="A433" label="Spot glue EC050-1" time="25" type="BIWActivitySpotGluing" x="62.5" y="12.5">
          <resource ref="P434"/>
          <resource ref="P435"/>
        </activity>
        <activity id="A436" label="Spot weld EC050-2" time="25" type="BIWActivitySpotWelding" x="112.5" y="12.5">
          <output id="IO439" item="P429"/>
          <resource ref="P437"/>
          <resource ref="P438"/>
        </activity>
        <flow from="A423" to="A433"/>
        <flow from="A433" to="A436"/>
      </activity>
      <activity cycleTime="43" height="15" id="A440" label="EC060 Engine compartment" time="43" type="BIWActivityStation" width="30" x="262.5" y="87.5">
        <input id="IO444" item="P429"/>
        <input id="IO446" item="P442"/>
        <input id="IO448" item="P443"/>
        <output id="IO451" item="P450"/>
        <item ref="P429" via="IO444"/>
        <item ref="P442" via="IO446"/>
        <item ref="P443" via="IO448"/>
        <resource ref="P452"/>
        <attribute name="Invest" type="double" value="255000"/>
        <attribute name="Shift" type="long" value="3"/>
        <activity id="A441" label="Load EC060" time="8" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO445" item="P429"/>
          <input id="IO447" item="P442"/>
          <input id="IO449" item="P443"/>
          <item ref="P442" via="IO447"/>
          <item ref="P443" via="IO449"/>
          <resource ref="P453"/>
        </activity>
        <activity id="A454" label="Stud weld EC060-1" time="23" type="BIWActivityStudWelding" x="62.5" y="12.5">
          <resource ref="P455"/>
          <resource ref="P456"/>
        </activity>
        <activity id="A457" label="Stud weld EC060-2" time="27" type="BIWActivityStudWelding" x="112.5" y="12.5">
          <resource ref="P458"/>
          <resource ref="P459"/>
        </activity>
        <activity id="A460" label="Spot weld EC060-3" time="24" type="BIWActivitySpotWelding" x="162.5" y="12.5">
          <output id="IO463" item="P450"/>
          <resource ref="P461"/>
          <resource ref="P462"/>
        </activity>
        <flow from="A441" to="A454"/>
        <flow from="A454" to="A457"/>
        <flow from="A457" to="A460"/>
      </activity>
      <activity cycleTime="63" height="15" id="A464" label="EC070 Engine compartment" time="63" type="BIWActivityStation" width="30" x="312.5" y="87.5">
        <input id="IO467" item="P450"/>
        <input id="IO469" item="P466"/>
        <output id="IO472" item="P471"/>
        <item ref="P450" via="IO467"/>
        <item ref="P466" via="IO469"/>
        <resource ref="P473"/>
        <attribute name="Invest" type="double" value="256000"/>
        <attribute name="Shift" type="long" value="1"/>
        <activity id="A465" label="Load EC070" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO468" item="P450"/>
          <input id="IO470" item="P466"/>
          <item ref="P466" via="IO470"/>
          <resource ref="P474"/>
          <resource ref="P475"/>
        </activity>
        <activity id="A476" label="Spot weld EC070-1" time="18" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <output id="IO479" item="P471"/>
          <resource ref="P477"/>
          <resource ref="P478"/>
        </activity>
        <flow from="A465" to="A476"/>
      </activity>
      <activity cycleTime="60" height="15" id="A480" label="EC080 Engine compartment" time="60" type="BIWActivityStation" width="30" x="362.5" y="87.5">
        <input id="IO483" item="P471"/>
        <input id="IO485" item="P482"/>
        <output id="IO488" item="P487"/>
        <item ref="P471" via="IO483"/>
        <item ref="P482" via="IO485"/>
        <resource ref="P489"/>
        <item ref="M498"/>
        <resource ref="P499"/>
        <attribute name="Invest" type="double" value="257000"/>
        <attribute name="Shift" type="long" value="2"/>
        <activity id="A481" label="Load EC080" time="8" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO484" item="P471"/>
          <input id="IO486" item="P482"/>
          <item ref="P482" via="IO486"/>
          <resource ref="P490"/>
        </activity>
        <activity id="A491" label="Stud weld EC080-1" time="21" type="BIWActivityStudWelding" x="62.5" y="12.5">
          <resource ref="P492"/>
          <resource ref="P493"/>
        </activity>
        <activity id="A494" label="Spot glue EC080-2" time="14" type="BIWActivitySpotGluing" x="112.5" y="12.5">
          <output id="IO497" item="P487"/>
          <resource ref="P495"/>
          <resource ref="P496"/>
        </activity>
        <flow from="A481" to="A491"/>
        <flow from="A491" to="A494"/>
      </activity>
      <activity cycleTime="48" height="15" id="A500" label="UB010 Underbody" time="48" type="BIWActivityStation" width="30" x="612.5" y="50">
        <input id="IO503" item="P172"/>
        <input id="IO505" item="P334"/>
        <input id="IO507" item="P487"/>
        <input id="IO509" item="P502"/>
        <output id="IO512" item="P511"/>
        <item ref="P172" via="IO503"/>
        <item ref="P334" via="IO505"/>
        <item ref="P487" via="IO507"/>
        <item ref="P502" via="IO509"/>
        <resource ref="P513"/>
        <attribute name="Invest" type="double" value="250000"/>
        <attribute name="Shift" type="long" value="1"/>
        <activity id="A501" label="Load UB010" time="13" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO504" item="P172"/>
          <input id="IO506" item="P334"/>
          <input id="IO508" item="P487"/>
          <input id="IO510" item="P502"/>
          <item ref="P502" via="IO510"/>
          <resource ref="P514"/>
          <resource ref="P515"/>
        </activity>
        <activity id="A516" label="Apply adhesive UB010-1" time="28" type="BIWActivityAdhesiveApplication" x="62.5" y="12.5">
          <output id="IO519" item="P511"/>
          <resource ref="P517"/>
          <resource ref="P518"/>
        </activity>
        <flow from="A501" to="A516"/>
      </activity>
      <activity cycleTime="56" height="15" id="A520" label="UB020 Underbody" time="56" type="BIWActivityStation" width="30" x="662.5" y="50">
        <input id="IO523" item="P511"/>
        <input id="IO525" item="P522"/>
        <output id="IO528" item="P527"/>
        <item ref="P511" via="IO523"/>
        <item ref="P522" via="IO525"/>
        <resource ref="P529"/>
        <attribute name="Invest" type="double" value="251000"/>
        <attribute name="Shift" type="long" value="2"/>
        <activity id="A521" label="Load UB020" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO524" item="P511"/>
          <input id="IO526" item="P522"/>
          <item ref="P522" via="IO526"/>
          <resource ref="P530"/>
        </activity>
        <activity id="A531" label="Apply adhesive UB020-1" time="19" type="BIWActivityAdhesiveApplication" x="62.5" y="12.5">
          <resource ref="P532"/>
          <resource ref="P533"/>
        </activity>
        <activity id="A534" label="Spot weld UB020-2" time="18" type="BIWActivitySpotWelding" x="112.5" y="12.5">
          <resource ref="P535"/>
          <resource ref="P536"/>
        </activity>
        <activity id="A537" label="Clinch UB020-3" time="17" type="BIWActivityClinching" x="162.5" y="12.5">
          <output id="IO540" item="P527"/>
          <resource ref="P538"/>
          <resource ref="P539"/>
        </activity>
        <flow from="A521" to="A531"/>
        <flow from="A531" to="A534"/>
        <flow from="A534" to="A537"/>
      </activity>
      <activity cycleTime="43" height="15" id="A541" label="UB030 Underbody" time="43" type="BIWActivityStation" width="30" x="712.5" y="50">
        <input id="IO545" item="P527"/>
        <input id="IO547" item="P543"/>
        <input id="IO549" item="P544"/>
        <output id="IO552" item="P551"/>
        <item ref="P527" via="IO545"/>
        <item ref="P543" via="IO547"/>
        <item ref="P544" via="IO549"/>
        <resource ref="P553"/>
        <attribute name="Invest" type="double" value="252000"/>
        <attribute name="Shift" type="long" value="3"/>
        <activity id="A542" label="Load UB030" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO546" item="P527"/>
          <input id="IO548" item="P543"/>
          <input id="IO550" item="P544"/>
          <item ref="P543" via="IO548"/>
          <item ref="P544" via="IO550"/>
          <resource ref="P554"/>
        </activity>
        <activity id="A555" label="Spot weld UB030-1" time="22" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <resource ref="P556"/>
          <resource ref="P557"/>
        </activity>
        <activity id="A558" label="Clinch UB030-2" time="10" type="BIWActivityClinching" x="112.5" y="12.5">
          <resource ref="P559"/>
          <resource ref="P560"/>
        </activity>
        <activity id="A561" label="Apply sealant UB030-3" time="25" type="BIWActivitySealantApplication" x="162.5" y="12.5">
          <output id="IO564" item="P551"/>
          <resource ref="P562"/>
          <resource ref="P563"/>
        </activity>
        <flow from="A542" to="A555"/>
        <flow from="A555" to="A558"/>
        <flow from="A558" to="A561"/>
      </activity>
      <activity cycleTime="51" height="15" id="A565" label="UB040 Underbody" time="51" type="BIWActivityStation" width="30" x="762.5" y="50">
        <input id="IO568" item="P551"/>
        <input id="IO570" item="P567"/>
        <output id="IO573" item="P572"/>
        <item ref="P551" via="IO568"/>
        <item ref="P567" via="IO570"/>
        <resource ref="P574"/>
        <attribute name="Invest" type="double" value="253000"/>
        <attribute name="Shift" type="long" value="1"/>
        <activity id="A566" label="Load UB040" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO569" item="P551"/>
          <input id="IO571" item="P567"/>
          <item ref="P567" via="IO571"/>
          <resource ref="P575"/>
          <resource ref="P576"/>
        </activity>
        <activity id="A577" label="Spot glue UB040-1" time="25" type="BIWActivitySpotGluing" x="62.5" y="12.5">
          <output id="IO580" item="P572"/>
          <resource ref="P578"/>
          <resource ref="P579"/>
        </activity>
        <flow from="A566" to="A577"/>
      </activity>
      <activity cycleTime="55" height="15" id="A581" label="UB050 Underbody" time="55" type="BIWActivityStation" width="30" x="812.5" y="50">
        <input id="IO584" item="P572"/>
        <input id="IO586" item="P583"/>
        <output id="IO589" item="P588"/>
        <item ref="P572" via="IO584"/>
        <item ref="P583" via="IO586"/>
        <resource ref="P590"/>
        <resource ref="P599"/>
        <attribute name="Invest" type="double" value="254000"/>
        <attribute name="Shift" type="long" value="2"/>
        <activity id="A582" label="Load UB050" time="12" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO585" item="P572"/>
          <input id="IO587" item="P583"/>
          <item ref="P583" via="IO587"/>
          <resource ref="P591"/>
        </activity>
        <activity id="A592" label="Apply adhesive UB050-1" time="28" type="BIWActivityAdhesiveApplication" x="62.5" y="12.5">
          <resource ref="P593"/>
          <resource ref="P594"/>
        </activity>
        <activity id="A595" label="Apply sealant UB050-2" time="29" type="BIWActivitySealantApplication" x="112.5" y="12.5">
          <output id="IO598" item="P588"/>
          <resource ref="P596"/>
          <resource ref="P597"/>
        </activity>
        <flow from="A582" to="A592"/>
        <flow from="A592" to="A595"/>
      </activity>
      <activity cycleTime="56" height="15" id="A600" label="UB060 Underbody" time="56" type="BIWActivityStation" width="30" x="862.5" y="50">
        <input id="IO603" item="P588"/>
        <input id="IO605" item="P602"/>
        <output id="IO608" item="P607"/>
        <item ref="P588" via="IO603"/>
        <item ref="P602" via="IO605"/>
        <resource ref="P609"/>
        <attribute name="Invest" type="double" value="255000"/>
        <attribute name="Shift" type="long" value="3"/>
        <activity id="A601" label="Load UB060" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO604" item="P588"/>
          <input id="IO606" item="P602"/>
          <item ref="P602" via="IO606"/>
          <resource ref="P610"/>
        </activity>
        <activity id="A611" label="Clinch UB060-1" time="27" type="BIWActivityClinching" x="62.5" y="12.5">
          <resource ref="P612"/>
          <resource ref="P613"/>
        </activity>
        <activity id="A614" label="Apply sealant UB060-2" time="29" type="BIWActivitySealantApplication" x="112.5" y="12.5">
          <resource ref="P615"/>
          <resource ref="P616"/>
        </activity>
        <activity id="A617" label="Spot weld UB060-3" time="11" type="BIWActivitySpotWelding" x="162.5" y="12.5">
          <output id="IO620" item="P607"/>
          <resource ref="P618"/>
          <resource ref="P619"/>
        </activity>
        <flow from="A601" to="A611"/>
        <flow from="A611" to="A614"/>
        <flow from="A614" to="A617"/>
      </activity>
      <activity id="A655" label="Respot group" state="2" time="53" type="BIWActivityGrouping" x="912.5" y="50">
        <resource ref="P677"/>
        <node id="N675" label="Start" type="Start" x="-12.5" y="12.5"/>
        <activity cycleTime="44" height="15" id="A656" label="UB070 Underbody" time="44" type="BIWActivityStation" width="30" x="912.5" y="50">
          <input id="IO657" item="P607"/>
          <input id="IO658" item="P623"/>
          <output id="IO659" item="P628"/>
          <item ref="P607" via="IO657"/>
          <item ref="P623" via="IO658"/>
          <resource ref="P630"/>
          <attribute name="Invest" type="double" value="256000"/>
          <attribute name="Shift" type="long" value="1"/>
          <activity id="A660" label="Load UB070" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
            <input id="IO661" item="P607"/>
            <input id="IO662" item="P623"/>
            <item ref="P623" via="IO662"/>
            <resource ref="P631"/>
            <resource ref="P632"/>
          </activity>
          <activity id="A663" label="Clinch UB070-1" time="11" type="BIWActivityClinching" x="62.5" y="12.5">
            <resource ref="P634"/>
            <resource ref="P635"/>
          </activity>
          <activity id="A664" label="Spot weld UB070-2" time="12" type="BIWActivitySpotWelding" x="112.5" y="12.5">
            <output id="IO665" item="P628"/>
            <resource ref="P637"/>
            <resource ref="P638"/>
          </activity>
          <flow from="A660" to="A663"/>
          <flow from="A663" to="A664"/>
        </activity>
        <activity cycleTime="53" height="15" id="A666" label="UB080 Underbody" time="53" type="BIWActivityStation" width="30" x="962.5" y="50">
          <input id="IO667" item="P628"/>
          <input id="IO668" item="P642"/>
          <output id="IO669" item="P647"/>
          <item ref="P628" via="IO667"/>
          <item ref="P642" via="IO668"/>
          <resource ref="P649"/>
          <attribute name="Invest" type="double" value="257000"/>
          <attribute name="Shift" type="long" value="2"/>
          <activity id="A670" label="Load UB080" time="12" type="BIWActivityLoading" x="12.5" y="12.5">
            <input id="IO671" item="P628"/>
            <input id="IO672" item="P642"/>
            <item ref="P642" via="IO672"/>
            <resource ref="P650"/>
          </activity>
          <activity id="A673" label="Spot glue UB080-1" time="15" type="BIWActivitySpotGluing" x="62.5" y="12.5">
            <output id="IO674" item="P647"/>
            <resource ref="P652"/>
            <resource ref="P653"/>
          </activity>
          <flow from="A670" to="A673"/>
        </activity>
        <node id="N676" label="Stop" type="Stop" x="137.5" y="12.5"/>
        <flow from="A656" to="A666"/>
        <flow from="N675" to="A656"/>
        <flow from="A666" to="N676"/>
      </activity>
      <flow from="A17" to="A40"/>
      <flow from="A40" to="A64"/>
      <flow from="A64" to="A85"/>
      <flow from="A85" to="A104"/>
      <flow from="A104" to="A122"/>
      <flow from="A122" to="A137"/>
      <flow from="A137" to="A162"/>
      <flow from="A188" to="A205"/>
      <flow from="A205" to="A226"/>
      <flow from="A226" to="A250"/>
      <flow from="A250" to="A269"/>
      <flow from="A269" to="A284"/>
      <flow from="A284" to="A305"/>
      <flow from="A305" to="A327"/>
      <flow from="A347" to="A361"/>
      <flow from="A361" to="A385"/>
      <flow from="A385" to="A403"/>
      <flow from="A403" to="A422"/>
      <flow from="A422" to="A440"/>
      <flow from="A440" to="A464"/>
      <flow from="A464" to="A480"/>
      <flow from="A162" to="A500"/>
      <flow from="A327" to="A500"/>
      <flow from="A480" to="A500"/>
      <flow from="A500" to="A520"/>
      <flow from="A520" to="A541"/>
      <flow from="A541" to="A565"/>
      <flow from="A565" to="A581"/>
      <flow from="A581" to="A600"/>
      <flow from="A600" to="A655"/>
    </activity>
  </process>

  <planning>
    <planType id="T6">
      <attribute name="compclass" value="lumocompplantdefault"/>
      <attribute name="name" value="Line"/>
      <attribute key="type" name="plantype_name" value="Line"/>
      <relation name="lumoplantypechild" to="T7"/>
      <relation name="lumoplantypechild" to="T8"/>
      <relation name="lumoplantypechild" to="T13"/>
      <relation name="lumoplantypechild" to="T14"/>
      <relation name="lumoplantypechild" to="T12"/>
    </planType>
    <planType id="T7">
      <attribute name="compclass" value="lumocompplantstation"/>
      <attribute name="name" value="Station"/>
      <attribute key="type" name="plantype_name" value="Station"/>
      <relation name="lumoplantypechild" to="T9"/>
      <relation name="lumoplantypechild" to="T11"/>
      <relation name="lumoplantypechild" to="T12"/>
    </planType>
    <planType id="T8">
      <attribute name="compclass" value="lumocompplantstation"/>
      <attribute name="name" value="Group"/>
      <attribute key="type" name="plantype_name" value="Group"/>
      <relation name="lumoplantypechild" to="T7"/>
      <relation name="lumoplantypechild" to="T9"/>
      <relation name="lumoplantypechild" to="T12"/>
      <relation name="lumoplantypechild" to="T11"/>
    </planType>
    <planType id="T9">
      <attribute name="compclass" value="lumocompplantdefault"/>
      <attribute name="name" value="Robot"/>
      <attribute key="type" name="plantype_name" value="Robot"/>
      <relation name="lumoplantypechild" to="T10"/>
    </planType>
    <planType id="T10">
      <attribute name="compclass" value="lumocompplantdefault"/>
      <attribute name="name" value="WeldGun"/>
      <attribute key="type" name="plantype_name" value="WeldGun"/>
    </planType>
    <planType id="T11">
      <attribute name="compclass" value="lumocompplantdefault"/>
      <attribute name="name" value="Fixture"/>
      <attribute key="type" name="plantype_name" value="Fixture"/>
      <relation name="lumoplantypechild" to="T12"/>
    </planType>
    <planType id="T12">
      <attribute name="compclass" value="lumocompplantworker"/>
      <attribute name="name" value="Worker"/>
      <attribute key="type" name="plantype_name" value="Worker"/>
    </planType>
    <planType id="T13">
      <attribute name="compclass" value="lumocompplanttransport"/>
      <attribute name="name" value="Transport"/>
      <attribute key="type" name="plantype_name" value="Transport"/>
    </planType>
    <planType id="T14">
      <attribute name="compclass" value="lumocompplantbuffer"/>
      <attribute name="name" value="Buffer"/>
      <attribute key="type" name="plantype_name" value="Buffer"/>
    </planType>
    <planType id="T15">
      <attribute name="compclass" value="lumocomporgplant"/>
      <attribute name="name" value="Organisation"/>
      <attribute key="type" name="plantype_name" value="Organisation"/>
    </planType>
    <hubRecord object="P116">
      <attribute name="Invest" type="double" value="120004"/>
      <attribute name="Responsible" type="string" value="Planner 1"/>
    </hubRecord>
    <hubRecord object="P131">
      <attribute name="Invest" type="double" value="120005"/>
      <attribute name="Responsible" type="string" value="Planner 2"/>
    </hubRecord>
    <hubRecord object="P149">
      <attribute name="Invest" type="double" value="120006"/>
      <attribute name="Responsible" type="string" value="Planner 3"/>
    </hubRecord>
    <hubRecord object="P174">
      <attribute name="Invest" type="double" value="120007"/>
      <attribute name="Responsible" type="string" value="Planner 4"/>
    </hubRecord>
    <hubRecord object="P195">
      <attribute name="Invest" type="double" value="120000"/>
      <attribute name="Responsible" type="string" value="Planner 1"/>
    </hubRecord>
    <hubRecord object="P214">
      <attribute name="Invest" type="double" value="120001"/>
      <attribute name="Responsible" type="string" value="Planner 2"/>
    </hubRecord>
    <hubRecord object="P238">
      <attribute name="Invest" type="double" value="120002"/>
      <attribute name="Responsible" type="string" value="Planner 3"/>
    </hubRecord>
    <hubRecord object="P262">
      <attribute name="Invest" type="double" value="120003"/>
      <attribute name="Responsible" type="string" value="Planner 4"/>
    </hubRecord>
    <hubRecord object="P27">
      <attribute name="Invest" type="double" value="120000"/>
      <attribute name="Responsible" type="string" value="Planner 1"/>
    </hubRecord>
    <hubRecord object="P278">
      <attribute name="Invest" type="double" value="120004"/>
      <attribute name="Responsible" type="string" value="Planner 1"/>
    </hubRecord>
    <hubRecord object="P296">
      <attribute name="Invest" type="double" value="120005"/>
      <attribute name="Responsible" type="string" value="Planner 2"/>
    </hubRecord>
    <hubRecord object="P317">
      <attribute name="Invest" type="double" value="120006"/>
      <attribute name="Responsible" type="string" value="Planner 3"/>
    </hubRecord>
    <hubRecord object="P336">
      <attribute name="Invest" type="double" value="120007"/>
      <attribute name="Responsible" type="string" value="Planner 4"/>
    </hubRecord>
    <hubRecord object="P354">
      <attribute name="Invest" type="double" value="120000"/>
      <attribute name="Responsible" type="string" value="Planner 1"/>
    </hubRecord>
    <hubRecord object="P373">
      <attribute name="Invest" type="double" value="120001"/>
      <attribute name="Responsible" type="string" value="Planner 2"/>
    </hubRecord>
    <hubRecord object="P397">
      <attribute name="Invest" type="double" value="120002"/>
      <attribute name="Responsible" type="string" value="Planner 3"/>
    </hubRecord>
    <hubRecord object="P412">
      <attribute name="Invest" type="double" value="120003"/>
      <attribute name="Responsible" type="string" value="Planner 4"/>
    </hubRecord>
    <hubRecord object="P431">
      <attribute name="Invest" type="double" value="120004"/>
      <attribute name="Responsible" type="string" value="Planner 1"/>
    </hubRecord>
    <hubRecord object="P452">
      <attribute name="Invest" type="double" value="120005"/>
      <attribute name="Responsible" type="string" value="Planner 2"/>
    </hubRecord>
    <hubRecord object="P473">
      <attribute name="Invest" type="double" value="120006"/>
      <attribute name="Responsible" type="string" value="Planner 3"/>
    </hubRecord>
    <hubRecord object="P489">
      <attribute name="Invest" type="double" value="120007"/>
      <attribute name="Responsible" type="string" value="Planner 4"/>
    </hubRecord>
    <hubRecord object="P513">
      <attribute name="Invest" type="double" value="120000"/>
      <attribute name="Responsible" type="string" value="Planner 1"/>
    </hubRecord>
    <hubRecord object="P52">
      <attribute name="Invest" type="double" value="120001"/>
      <attribute name="Responsible" type="string" value="Planner 2"/>
    </hubRecord>
    <hubRecord object="P529">
      <attribute name="Invest" type="double" value="120001"/>
      <attribute name="Responsible" type="string" value="Planner 2"/>
    </hubRecord>
    <hubRecord object="P553">
      <attribute name="Invest" type="double" value="120002"/>
      <attribute name="Responsible" type="string" value="Planner 3"/>
    </hubRecord>
    <hubRecord object="P574">
      <attribute name="Invest" type="double" value="120003"/>
      <attribute name="Responsible" type="string" value="Planner 4"/>
    </hubRecord>
    <hubRecord object="P590">
      <attribute name="Invest" type="double" value="120004"/>
      <attribute name="Responsible" type="string" value="Planner 1"/>
    </hubRecord>
    <hubRecord object="P609">
      <attribute name="Invest" type="double" value="120005"/>
      <attribute name="Responsible" type="string" value="Planner 2"/>
    </hubRecord>
    <hubRecord object="P630">
      <attribute name="Invest" type="double" value="120006"/>
      <attribute name="Responsible" type="string" value="Planner 3"/>
    </hubRecord>
    <hubRecord object="P649">
      <attribute name="Invest" type="double" value="120007"/>
      <attribute name="Responsible" type="string" value="Planner 4"/>
    </hubRecord>
    <hubRecord object="P73">
      <attribute name="Invest" type="double" value="120002"/>
      <attribute name="Responsible" type="string" value="Planner 3"/>
    </hubRecord>
    <hubRecord object="P94">
      <attribute name="Invest" type="double" value="120003"/>
      <attribute name="Responsible" type="string" value="Planner 4"/>
    </hubRecord>
  </planning>

</pprDocument>

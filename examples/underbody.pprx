<?xml version="1.0" encoding="UTF-8" standalone="no" ?>
<pprDocument version="1">

  <products>
    <product alias="PPRProduct" id="P2" name="Underbody"/>
    <product father="P2" id="P4" name="Sheet metal parts"/>
    <product father="P4" id="P9" name="Front floor panel"/>
    <product father="P4" id="P10" name="Tunnel reinforcement"/>
    <product father="P4" id="P32" name="Seat cross member front"/>
    <product father="P4" id="P33" name="Seat cross member rear"/>
    <product father="P4" id="P56" name="Front floor side member LH"/>
    <product father="P4" id="P77" name="Heel board"/>
    <product father="P4" id="P96" name="Front floor panel 2"/>
    <product father="P4" id="P97" name="Tunnel reinforcement 2"/>
    <product father="P4" id="P114" name="Seat cross member front 2"/>
    <product father="P4" id="P129" name="Front floor side member LH 2"/>
    <product father="P4" id="P130" name="Front floor side member RH 2"/>
    <product father="P4" id="P154" name="Heel board 2"/>
    <product father="P4" id="P155" name="Tunnel bracket 2"/>
    <product father="P4" id="P180" name="Rear floor panel"/>
    <product father="P4" id="P197" name="Rear cross member"/>
    <product father="P4" id="P218" name="Rear side member RH"/>
    <product father="P4" id="P219" name="Rear floor extension"/>
    <product father="P4" id="P242" name="Jack bracket"/>
    <product father="P4" id="P243" name="Tow hook plate"/>
    <product father="P4" id="P261" name="Rear floor panel 2"/>
    <product father="P4" id="P276" name="Rear cross member 2"/>
    <product father="P4" id="P277" name="Rear side member LH 2"/>
    <product father="P4" id="P297" name="Rear side member RH 2"/>
    <product father="P4" id="P298" name="Rear floor extension 2"/>
    <product father="P4" id="P319" name="Jack bracket 2"/>
    <product father="P4" id="P339" name="Front rail LH"/>
    <product father="P4" id="P353" name="Dash panel"/>
    <product father="P4" id="P354" name="Wheelhouse LH"/>
    <product father="P4" id="P377" name="Wheelhouse RH"/>
    <product father="P4" id="P378" name="Shock tower LH"/>
    <product father="P4" id="P395" name="Shock tower RH"/>
    <product father="P4" id="P414" name="Front rail LH 2"/>
    <product father="P4" id="P432" name="Dash panel 2"/>
    <product father="P4" id="P433" name="Wheelhouse LH 2"/>
    <product father="P4" id="P456" name="Wheelhouse RH 2"/>
    <product father="P4" id="P472" name="Shock tower RH 2"/>
    <product father="P4" id="P492" name="Rear end panel"/>
    <product father="P4" id="P512" name="Battery tray"/>
    <product father="P4" id="P533" name="Underbody reinforcement"/>
    <product father="P4" id="P534" name="Crash box LH"/>
    <product father="P4" id="P557" name="Crash box RH"/>
    <product father="P4" id="P573" name="Gear box support"/>
    <product father="P4" id="P592" name="Rear end panel 2"/>
    <product father="P4" id="P613" name="Battery tray 2"/>
    <product father="P4" id="P632" name="Underbody reinforcement 2"/>
    <product father="P2" id="P5" name="Sub-assemblies"/>
    <product father="P5" id="P15" name="Front floor assembly FF010"/>
    <product father="P5" id="P40" name="Front floor assembly FF020"/>
    <product father="P5" id="P61" name="Front floor assembly FF030"/>
    <product father="P5" id="P82" name="Front floor assembly FF040"/>
    <product father="P5" id="P104" name="Front floor assembly FF050"/>
    <product father="P5" id="P119" name="Front floor assembly FF060"/>
    <product father="P5" id="P137" name="Front floor assembly FF070"/>
    <product father="P5" id="P162" name="Front floor assembly FF080"/>
    <product father="P5" id="P183" name="Rear floor assembly RF010"/>
    <product father="P5" id="P202" name="Rear floor assembly RF020"/>
    <product father="P5" id="P226" name="Rear floor assembly RF030"/>
    <product father="P5" id="P250" name="Rear floor assembly RF040"/>
    <product father="P5" id="P266" name="Rear floor assembly RF050"/>
    <product father="P5" id="P284" name="Rear floor assembly RF060"/>
    <product father="P5" id="P305" name="Rear floor assembly RF070"/>
    <product father="P5" id="P324" name="Rear floor assembly RF080"/>
    <product father="P5" id="P342" name="Engine compartment assembly EC010"/>
    <product father="P5" id="P361" name="Engine compartment assembly EC020"/>
    <product father="P5" id="P385" name="Engine compartment assembly EC030"/>
    <product father="P5" id="P400" name="Engine compartment assembly EC040"/>
    <product father="P5" id="P419" name="Engine compartment assembly EC050"/>
    <product father="P5" id="P440" name="Engine compartment assembly EC060"/>
    <product father="P5" id="P461" name="Engine compartment assembly EC070"/>
    <product father="P5" id="P477" name="Engine compartment assembly EC080"/>
    <product father="P5" id="P501" name="Underbody assembly UB010"/>
    <product father="P5" id="P517" name="Underbody assembly UB020"/>
    <product father="P5" id="P541" name="Underbody assembly UB030"/>
    <product father="P5" id="P562" name="Underbody assembly UB040"/>
    <product father="P5" id="P578" name="Underbody assembly UB050"/>
    <product father="P5" id="P597" name="Underbody assembly UB060"/>
    <product father="P5" id="P618" name="Underbody assembly UB070"/>
    <product father="P5" id="P637" name="Underbody assembly UB080"/>
    <product alias="PPRResources" id="P3" name="Resources"/>
    <product father="P3" id="P6" name="Underbody cell" resourceClass="Resource"/>
    <product father="P6" id="P17" name="FF010" resourceClass="Station"/>
    <product father="P17" id="P18" name="FF010 fixture" resourceClass="Fixture"/>
    <product father="P17" id="P19" name="FF010 operator" resourceClass="Worker"/>
    <product father="P17" id="P21" name="FF010 robot R1" resourceClass="Robot"/>
    <product father="P21" id="P22" name="FF010 gun G1" resourceClass="WeldGun"/>
    <product father="P17" id="P24" name="FF010 robot R2" resourceClass="Robot"/>
    <product father="P24" id="P25" name="FF010 gun G2" resourceClass="WeldGun"/>
    <product father="P17" id="P27" name="FF010 robot R3" resourceClass="Robot"/>
    <product father="P27" id="P28" name="FF010 gun G3" resourceClass="WeldGun"/>
    <product father="P6" id="P42" name="FF020" resourceClass="Station"/>
    <product father="P42" id="P43" name="FF020 fixture" resourceClass="Fixture"/>
    <product father="P42" id="P45" name="FF020 robot R1" resourceClass="Robot"/>
    <product father="P45" id="P46" name="FF020 gun G1" resourceClass="WeldGun"/>
    <product father="P42" id="P48" name="FF020 robot R2" resourceClass="Robot"/>
    <product father="P48" id="P49" name="FF020 gun G2" resourceClass="WeldGun"/>
    <product father="P42" id="P51" name="FF020 robot R3" resourceClass="Robot"/>
    <product father="P51" id="P52" name="FF020 gun G3" resourceClass="WeldGun"/>
    <product father="P6" id="P63" name="FF030" resourceClass="Station"/>
    <product father="P63" id="P64" name="FF030 fixture" resourceClass="Fixture"/>
    <product father="P63" id="P66" name="FF030 robot R1" resourceClass="Robot"/>
    <product father="P66" id="P67" name="FF030 gun G1" resourceClass="WeldGun"/>
    <product father="P63" id="P69" name="FF030 robot R2" resourceClass="Robot"/>
    <product father="P69" id="P70" name="FF030 gun G2" resourceClass="WeldGun"/>
    <product father="P63" id="P72" name="FF030 robot R3" resourceClass="Robot"/>
    <product father="P72" id="P73" name="FF030 gun G3" resourceClass="WeldGun"/>
    <product father="P6" id="P84" name="FF040" resourceClass="Station"/>
    <product father="P84" id="P85" name="FF040 fixture" resourceClass="Fixture"/>
    <product father="P84" id="P86" name="FF040 operator" resourceClass="Worker"/>
    <product father="P84" id="P88" name="FF040 robot R1" resourceClass="Robot"/>
    <product father="P88" id="P89" name="FF040 gun G1" resourceClass="WeldGun"/>
    <product father="P84" id="P91" name="FF040 robot R2" resourceClass="Robot"/>
    <product father="P91" id="P92" name="FF040 gun G2" resourceClass="WeldGun"/>
    <product father="P6" id="P106" name="FF050" resourceClass="Station"/>
    <product father="P106" id="P107" name="FF050 fixture" resourceClass="Fixture"/>
    <product father="P106" id="P109" name="FF050 robot R1" resourceClass="Robot"/>
    <product father="P109" id="P110" name="FF050 gun G1" resourceClass="WeldGun"/>
    <product father="P6" id="P121" name="FF060" resourceClass="Station"/>
    <product father="P121" id="P122" name="FF060 fixture" resourceClass="Fixture"/>
    <product father="P121" id="P124" name="FF060 robot R1" resourceClass="Robot"/>
    <product father="P124" id="P125" name="FF060 gun G1" resourceClass="WeldGun"/>
    <product father="P6" id="P139" name="FF070" resourceClass="Station"/>
    <product father="P139" id="P140" name="FF070 fixture" resourceClass="Fixture"/>
    <product father="P139" id="P141" name="FF070 operator" resourceClass="Worker"/>
    <product father="P139" id="P143" name="FF070 robot R1" resourceClass="Robot"/>
    <product father="P143" id="P144" name="FF070 gun G1" resourceClass="WeldGun"/>
    <product father="P139" id="P146" name="FF070 robot R2" resourceClass="Robot"/>
    <product father="P146" id="P147" name="FF070 gun G2" resourceClass="WeldGun"/>
    <product father="P139" id="P149" name="FF070 robot R3" resourceClass="Robot"/>
    <product father="P149" id="P150" name="FF070 gun G3" resourceClass="WeldGun"/>
    <product father="P6" id="P164" name="FF080" resourceClass="Station"/>
    <product father="P164" id="P165" name="FF080 fixture" resourceClass="Fixture"/>
    <product father="P164" id="P167" name="FF080 robot R1" resourceClass="Robot"/>
    <product father="P167" id="P168" name="FF080 gun G1" resourceClass="WeldGun"/>
    <product father="P164" id="P170" name="FF080 robot R2" resourceClass="Robot"/>
    <product father="P170" id="P171" name="FF080 gun G2" resourceClass="WeldGun"/>
    <product father="P164" id="P173" name="FF080 robot R3" resourceClass="Robot"/>
    <product father="P173" id="P174" name="FF080 gun G3" resourceClass="WeldGun"/>
    <product father="P6" id="P177" name="FF transfer conveyor" resourceClass="Transport"/>
    <product father="P6" id="P185" name="RF010" resourceClass="Station"/>
    <product father="P185" id="P186" name="RF010 fixture" resourceClass="Fixture"/>
    <product father="P185" id="P187" name="RF010 operator" resourceClass="Worker"/>
    <product father="P185" id="P189" name="RF010 robot R1" resourceClass="Robot"/>
    <product father="P189" id="P190" name="RF010 gun G1" resourceClass="WeldGun"/>
    <product father="P185" id="P192" name="RF010 robot R2" resourceClass="Robot"/>
    <product father="P192" id="P193" name="RF010 gun G2" resourceClass="WeldGun"/>
    <product father="P6" id="P204" name="RF020" resourceClass="Station"/>
    <product father="P204" id="P205" name="RF020 fixture" resourceClass="Fixture"/>
    <product father="P204" id="P207" name="RF020 robot R1" resourceClass="Robot"/>
    <product father="P207" id="P208" name="RF020 gun G1" resourceClass="WeldGun"/>
    <product father="P204" id="P210" name="RF020 robot R2" resourceClass="Robot"/>
    <product father="P210" id="P211" name="RF020 gun G2" resourceClass="WeldGun"/>
    <product father="P204" id="P213" name="RF020 robot R3" resourceClass="Robot"/>
    <product father="P213" id="P214" name="RF020 gun G3" resourceClass="WeldGun"/>
    <product father="P6" id="P228" name="RF030" resourceClass="Station"/>
    <product father="P228" id="P229" name="RF030 fixture" resourceClass="Fixture"/>
    <product father="P228" id="P231" name="RF030 robot R1" resourceClass="Robot"/>
    <product father="P231" id="P232" name="RF030 gun G1" resourceClass="WeldGun"/>
    <product father="P228" id="P234" name="RF030 robot R2" resourceClass="Robot"/>
    <product father="P234" id="P235" name="RF030 gun G2" resourceClass="WeldGun"/>
    <product father="P228" id="P237" name="RF030 robot R3" resourceClass="Robot"/>
    <product father="P237" id="P238" name="RF030 gun G3" resourceClass="WeldGun"/>
    <product father="P6" id="P252" name="RF040" resourceClass="Station"/>
    <product father="P252" id="P253" name="RF040 fixture" resourceClass="Fixture"/>
    <product father="P252" id="P254" name="RF040 operator" resourceClass="Worker"/>
    <product father="P252" id="P256" name="RF040 robot R1" resourceClass="Robot"/>
    <product father="P256" id="P257" name="RF040 gun G1" resourceClass="WeldGun"/>
    <product father="P6" id="P268" name="RF050" resourceClass="Station"/>
    <product father="P268" id="P269" name="RF050 fixture" resourceClass="Fixture"/>
    <product father="P268" id="P271" name="RF050 robot R1" resourceClass="Robot"/>
    <product father="P271" id="P272" name="RF050 gun G1" resourceClass="WeldGun"/>
    <product father="P6" id="P286" name="RF060" resourceClass="Station"/>
    <product father="P286" id="P287" name="RF060 fixture" resourceClass="Fixture"/>
    <product father="P286" id="P289" name="RF060 robot R1" resourceClass="Robot"/>
    <product father="P289" id="P290" name="RF060 gun G1" resourceClass="WeldGun"/>
    <product father="P286" id="P292" name="RF060 robot R2" resourceClass="Robot"/>
    <product father="P292" id="P293" name="RF060 gun G2" resourceClass="WeldGun"/>
    <product father="P6" id="P307" name="RF070" resourceClass="Station"/>
    <product father="P307" id="P308" name="RF070 fixture" resourceClass="Fixture"/>
    <product father="P307" id="P309" name="RF070 operator" resourceClass="Worker"/>
    <product father="P307" id="P311" name="RF070 robot R1" resourceClass="Robot"/>
    <product father="P311" id="P312" name="RF070 gun G1" resourceClass="WeldGun"/>
    <product father="P307" id="P314" name="RF070 robot R2" resourceClass="Robot"/>
    <product father="P314" id="P315" name="RF070 gun G2" resourceClass="WeldGun"/>
    <product father="P6" id="P326" name="RF080" resourceClass="Station"/>
    <product father="P326" id="P327" name="RF080 fixture" resourceClass="Fixture"/>
    <product father="P326" id="P329" name="RF080 robot R1" resourceClass="Robot"/>
    <product father="P329" id="P330" name="RF080 gun G1" resourceClass="WeldGun"/>
    <product father="P326" id="P332" name="RF080 robot R2" resourceClass="Robot"/>
    <product father="P332" id="P333" name="RF080 gun G2" resourceClass="WeldGun"/>
    <product father="P6" id="P336" name="RF transfer conveyor" resourceClass="Transport"/>
    <product father="P6" id="P344" name="EC010" resourceClass="Station"/>
    <product father="P344" id="P345" name="EC010 fixture" resourceClass="Fixture"/>
    <product father="P344" id="P346" name="EC010 operator" resourceClass="Worker"/>
    <product father="P344" id="P348" name="EC010 robot R1" resourceClass="Robot"/>
    <product father="P348" id="P349" name="EC010 gun G1" resourceClass="WeldGun"/>
    <product father="P6" id="P363" name="EC020" resourceClass="Station"/>
    <product father="P363" id="P364" name="EC020 fixture" resourceClass="Fixture"/>
    <product father="P363" id="P366" name="EC020 robot R1" resourceClass="Robot"/>
    <product father="P366" id="P367" name="EC020 gun G1" resourceClass="WeldGun"/>
    <product father="P363" id="P369" name="EC020 robot R2" resourceClass="Robot"/>
    <product father="P369" id="P370" name="EC020 gun G2" resourceClass="WeldGun"/>
    <product father="P363" id="P372" name="EC020 robot R3" resourceClass="Robot"/>
    <product father="P372" id="P373" name="EC020 gun G3" resourceClass="WeldGun"/>
    <product father="P6" id="P387" name="EC030" resourceClass="Station"/>
    <product father="P387" id="P388" name="EC030 fixture" resourceClass="Fixture"/>
    <product father="P387" id="P390" name="EC030 robot R1" resourceClass="Robot"/>
    <product father="P390" id="P391" name="EC030 gun G1" resourceClass="WeldGun"/>
    <product father="P6" id="P402" name="EC040" resourceClass="Station"/>
    <product father="P402" id="P403" name="EC040 fixture" resourceClass="Fixture"/>
    <product father="P402" id="P404" name="EC040 operator" resourceClass="Worker"/>
    <product father="P402" id="P406" name="EC040 robot R1" resourceClass="Robot"/>
    <product father="P406" id="P407" name="EC040 gun G1" resourceClass="WeldGun"/>
    <product father="P402" id="P409" name="EC040 robot R2" resourceClass="Robot"/>
    <product father="P409" id="P410" name="EC040 gun G2" resourceClass="WeldGun"/>
    <product father="P6" id="P421" name="EC050" resourceClass="Station"/>
    <product father="P421" id="P422" name="EC050 fixture" resourceClass="Fixture"/>
    <product father="P421" id="P424" name="EC050 robot R1" resourceClass="Robot"/>
    <product father="P424" id="P425" name="EC050 gun G1" resourceClass="WeldGun"/>
    <product father="P421" id="P427" name="EC050 robot R2" resourceClass="Robot"/>
    <product father="P427" id="P428" name="EC050 gun G2" resourceClass="WeldGun"/>
    <product father="P6" id="P442" name="EC060" resourceClass="Station"/>
    <product father="P442" id="P443" name="EC060 fixture" resourceClass="Fixture"/>
    <product father="P442" id="P445" name="EC060 robot R1" resourceClass="Robot"/>
    <product father="P445" id="P446" name="EC060 gun G1" resourceClass="WeldGun"/>
    <product father="P442" id="P448" name="EC060 robot R2" resourceClass="Robot"/>
    <product father="P448" id="P449" name="EC060 gun G2" resourceClass="WeldGun"/>
    <product father="P442" id="P451" name="EC060 robot R3" resourceClass="Robot"/>
    <product father="P451" id="P452" name="EC060 gun G3" resourceClass="WeldGun"/>
    <product father="P6" id="P463" name="EC070" resourceClass="Station"/>
    <product father="P463" id="P464" name="EC070 fixture" resourceClass="Fixture"/>
    <product father="P463" id="P465" name="EC070 operator" resourceClass="Worker"/>
    <product father="P463" id="P467" name="EC070 robot R1" resourceClass="Robot"/>
    <product father="P467" id="P468" name="EC070 gun G1" resourceClass="WeldGun"/>
    <product father="P6" id="P479" name="EC080" resourceClass="Station"/>
    <product father="P479" id="P480" name="EC080 fixture" resourceClass="Fixture"/>
    <product father="P479" id="P482" name="EC080 robot R1" resourceClass="Robot"/>
    <product father="P482" id="P483" name="EC080 gun G1" resourceClass="WeldGun"/>
    <product father="P479" id="P485" name="EC080 robot R2" resourceClass="Robot"/>
    <product father="P485" id="P486" name="EC080 gun G2" resourceClass="WeldGun"/>
    <product father="P6" id="P489" name="EC transfer conveyor" resourceClass="Transport"/>
    <product father="P6" id="P503" name="UB010" resourceClass="Station"/>
    <product father="P503" id="P504" name="UB010 fixture" resourceClass="Fixture"/>
    <product father="P503" id="P505" name="UB010 operator" resourceClass="Worker"/>
    <product father="P503" id="P507" name="UB010 robot R1" resourceClass="Robot"/>
    <product father="P507" id="P508" name="UB010 gun G1" resourceClass="WeldGun"/>
    <product father="P6" id="P519" name="UB020" resourceClass="Station"/>
    <product father="P519" id="P520" name="UB020 fixture" resourceClass="Fixture"/>
    <product father="P519" id="P522" name="UB020 robot R1" resourceClass="Robot"/>
    <product father="P522" id="P523" name="UB020 gun G1" resourceClass="WeldGun"/>
    <product father="P519" id="P525" name="UB020 robot R2" resourceClass="Robot"/>
    <product father="P525" id="P526" name="UB020 gun G2" resourceClass="WeldGun"/>
    <product father="P519" id="P528" name="UB020 robot R3" resourceClass="Robot"/>
    <product father="P528" id="P529" name="UB020 gun G3" resourceClass="WeldGun"/>
    <product father="P6" id="P543" name="UB030" resourceClass="Station"/>
    <product father="P543" id="P544" name="UB030 fixture" resourceClass="Fixture"/>
    <product father="P543" id="P546" name="UB030 robot R1" resourceClass="Robot"/>
    <product father="P546" id="P547" name="UB030 gun G1" resourceClass="WeldGun"/>
    <product father="P543" id="P549" name="UB030 robot R2" resourceClass="Robot"/>
    <product father="P549" id="P550" name="UB030 gun G2" resourceClass="WeldGun"/>
    <product father="P543" id="P552" name="UB030 robot R3" resourceClass="Robot"/>
    <product father="P552" id="P553" name="UB030 gun G3" resourceClass="WeldGun"/>
    <product father="P6" id="P564" name="UB040" resourceClass="Station"/>
    <product father="P564" id="P565" name="UB040 fixture" resourceClass="Fixture"/>
    <product father="P564" id="P566" name="UB040 operator" resourceClass="Worker"/>
    <product father="P564" id="P568" name="UB040 robot R1" resourceClass="Robot"/>
    <product father="P568" id="P569" name="UB040 gun G1" resourceClass="WeldGun"/>
    <product father="P6" id="P580" name="UB050" resourceClass="Station"/>
    <product father="P580" id="P581" name="UB050 fixture" resourceClass="Fixture"/>
    <product father="P580" id="P583" name="UB050 robot R1" resourceClass="Robot"/>
    <product father="P583" id="P584" name="UB050 gun G1" resourceClass="WeldGun"/>
    <product father="P580" id="P586" name="UB050 robot R2" resourceClass="Robot"/>
    <product father="P586" id="P587" name="UB050 gun G2" resourceClass="WeldGun"/>
    <product father="P6" id="P589" name="Underbody buffer" resourceClass="Buffer"/>
    <product father="P6" id="P599" name="UB060" resourceClass="Station"/>
    <product father="P599" id="P600" name="UB060 fixture" resourceClass="Fixture"/>
    <product father="P599" id="P602" name="UB060 robot R1" resourceClass="Robot"/>
    <product father="P602" id="P603" name="UB060 gun G1" resourceClass="WeldGun"/>
    <product father="P599" id="P605" name="UB060 robot R2" resourceClass="Robot"/>
    <product father="P605" id="P606" name="UB060 gun G2" resourceClass="WeldGun"/>
    <product father="P599" id="P608" name="UB060 robot R3" resourceClass="Robot"/>
    <product father="P608" id="P609" name="UB060 gun G3" resourceClass="WeldGun"/>
    <product father="P6" id="P667" name="Respot group" resourceClass="Station"/>
    <product father="P667" id="P620" name="UB070" resourceClass="Station"/>
    <product father="P620" id="P621" name="UB070 fixture" resourceClass="Fixture"/>
    <product father="P620" id="P622" name="UB070 operator" resourceClass="Worker"/>
    <product father="P620" id="P624" name="UB070 robot R1" resourceClass="Robot"/>
    <product father="P624" id="P625" name="UB070 gun G1" resourceClass="WeldGun"/>
    <product father="P620" id="P627" name="UB070 robot R2" resourceClass="Robot"/>
    <product father="P627" id="P628" name="UB070 gun G2" resourceClass="WeldGun"/>
    <product father="P667" id="P639" name="UB080" resourceClass="Station"/>
    <product father="P639" id="P640" name="UB080 fixture" resourceClass="Fixture"/>
    <product father="P639" id="P642" name="UB080 robot R1" resourceClass="Robot"/>
    <product father="P642" id="P643" name="UB080 gun G1" resourceClass="WeldGun"/>
  </products>

  <assemblies>
    <assembly id="M176" name="MA Front floor">
      <component ref="P9"/>
      <component ref="P10"/>
      <component ref="P32"/>
      <component ref="P33"/>
      <component ref="P56"/>
      <component ref="P77"/>
      <component ref="P96"/>
      <component ref="P97"/>
      <component ref="P114"/>
      <component ref="P129"/>
      <component ref="P130"/>
      <component ref="P154"/>
      <component ref="P155"/>
    </assembly>
    <assembly id="M335" name="MA Rear floor">
      <component ref="P180"/>
      <component ref="P197"/>
      <component ref="P218"/>
      <component ref="P219"/>
      <component ref="P242"/>
      <component ref="P243"/>
      <component ref="P261"/>
      <component ref="P276"/>
      <component ref="P277"/>
      <component ref="P297"/>
      <component ref="P298"/>
      <component ref="P319"/>
    </assembly>
    <assembly id="M488" name="MA Engine compartment">
      <component ref="P339"/>
      <component ref="P353"/>
      <component ref="P354"/>
      <component ref="P377"/>
      <component ref="P378"/>
      <component ref="P395"/>
      <component ref="P414"/>
      <component ref="P432"/>
      <component ref="P433"/>
      <component ref="P456"/>
      <component ref="P472"/>
    </assembly>
  </assemblies>

  <process>
    <activity id="A1" label="Underbody line" type="BIWActivityRoot">
      <activity cycleTime="47" height="15" id="A7" label="FF010 Front floor" time="47" type="BIWActivityStation" width="30" x="12.5" y="12.5">
        <input id="IO11" item="P9"/>
        <input id="IO13" item="P10"/>
        <output id="IO16" item="P15"/>
        <item ref="P9" via="IO11"/>
        <item ref="P10" via="IO13"/>
        <resource ref="P17"/>
        <activity id="A8" label="Load FF010" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO12" item="P9"/>
          <input id="IO14" item="P10"/>
          <item ref="P9" via="IO12"/>
          <item ref="P10" via="IO14"/>
          <resource ref="P18"/>
          <resource ref="P19"/>
        </activity>
        <activity id="A20" label="Clinch FF010-1" time="26" type="BIWActivityClinching" x="62.5" y="12.5">
          <resource ref="P21"/>
          <resource ref="P22"/>
        </activity>
        <activity id="A23" label="Spot weld FF010-2" time="22" type="BIWActivitySpotWelding" x="112.5" y="12.5">
          <resource ref="P24"/>
          <resource ref="P25"/>
        </activity>
        <activity id="A26" label="Spot weld FF010-3" time="16" type="BIWActivitySpotWelding" x="162.5" y="12.5">
          <output id="IO29" item="P15"/>
          <resource ref="P27"/>
          <resource ref="P28"/>
        </activity>
        <flow from="A8" to="A20"/>
        <flow from="A20" to="A23"/>
        <flow from="A23" to="A26"/>
      </activity>
      <activity cycleTime="52" height="15" id="A30" label="FF020 Front floor" time="52" type="BIWActivityStation" width="30" x="62.5" y="12.5">
        <input id="IO34" item="P15"/>
        <input id="IO36" item="P32"/>
        <input id="IO38" item="P33"/>
        <output id="IO41" item="P40"/>
        <item ref="P15" via="IO34"/>
        <item ref="P32" via="IO36"/>
        <item ref="P33" via="IO38"/>
        <resource ref="P42"/>
        <activity id="A31" label="Load FF020" time="12" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO35" item="P15"/>
          <input id="IO37" item="P32"/>
          <input id="IO39" item="P33"/>
          <item ref="P32" via="IO37"/>
          <item ref="P33" via="IO39"/>
          <resource ref="P43"/>
        </activity>
        <activity id="A44" label="Stud weld FF020-1" time="21" type="BIWActivityStudWelding" x="62.5" y="12.5">
          <resource ref="P45"/>
          <resource ref="P46"/>
        </activity>
        <activity id="A47" label="Spot weld FF020-2" time="14" type="BIWActivitySpotWelding" x="112.5" y="12.5">
          <resource ref="P48"/>
          <resource ref="P49"/>
        </activity>
        <activity id="A50" label="Arc weld FF020-3" time="24" type="BIWActivityArcWelding" x="162.5" y="12.5">
          <output id="IO53" item="P40"/>
          <resource ref="P51"/>
          <resource ref="P52"/>
        </activity>
        <flow from="A31" to="A44"/>
        <flow from="A44" to="A47"/>
        <flow from="A47" to="A50"/>
      </activity>
      <activity cycleTime="41" height="15" id="A54" label="FF030 Front floor" time="41" type="BIWActivityStation" width="30" x="112.5" y="12.5">
        <input id="IO57" item="P40"/>
        <input id="IO59" item="P56"/>
        <output id="IO62" item="P61"/>
        <item ref="P40" via="IO57"/>
        <item ref="P56" via="IO59"/>
        <resource ref="P63"/>
        <activity id="A55" label="Load FF030" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO58" item="P40"/>
          <input id="IO60" item="P56"/>
          <item ref="P56" via="IO60"/>
          <resource ref="P64"/>
        </activity>
        <activity id="A65" label="Spot weld FF030-1" time="15" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <resource ref="P66"/>
          <resource ref="P67"/>
        </activity>
        <activity id="A68" label="Spot weld FF030-2" time="20" type="BIWActivitySpotWelding" x="112.5" y="12.5">
          <resource ref="P69"/>
          <resource ref="P70"/>
        </activity>
        <activity id="A71" label="Arc weld FF030-3" time="12" type="BIWActivityArcWelding" x="162.5" y="12.5">
          <output id="IO74" item="P61"/>
          <resource ref="P72"/>
          <resource ref="P73"/>
        </activity>
        <flow from="A55" to="A65"/>
        <flow from="A65" to="A68"/>
        <flow from="A68" to="A71"/>
      </activity>
      <activity cycleTime="62" height="15" id="A75" label="FF040 Front floor" time="62" type="BIWActivityStation" width="30" x="162.5" y="12.5">
        <input id="IO78" item="P61"/>
        <input id="IO80" item="P77"/>
        <output id="IO83" item="P82"/>
        <item ref="P61" via="IO78"/>
        <item ref="P77" via="IO80"/>
        <resource ref="P84"/>
        <activity id="A76" label="Load FF040" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO79" item="P61"/>
          <input id="IO81" item="P77"/>
          <item ref="P77" via="IO81"/>
          <resource ref="P85"/>
          <resource ref="P86"/>
        </activity>
        <activity id="A87" label="Arc weld FF040-1" time="29" type="BIWActivityArcWelding" x="62.5" y="12.5">
          <resource ref="P88"/>
          <resource ref="P89"/>
        </activity>
        <activity id="A90" label="Arc weld FF040-2" time="20" type="BIWActivityArcWelding" x="112.5" y="12.5">
          <output id="IO93" item="P82"/>
          <resource ref="P91"/>
          <resource ref="P92"/>
        </activity>
        <flow from="A76" to="A87"/>
        <flow from="A87" to="A90"/>
      </activity>
      <activity cycleTime="51" height="15" id="A94" label="FF050 Front floor" time="51" type="BIWActivityStation" width="30" x="212.5" y="12.5">
        <input id="IO98" item="P82"/>
        <input id="IO100" item="P96"/>
        <input id="IO102" item="P97"/>
        <output id="IO105" item="P104"/>
        <item ref="P82" via="IO98"/>
        <item ref="P96" via="IO100"/>
        <item ref="P97" via="IO102"/>
        <resource ref="P106"/>
        <activity id="A95" label="Load FF050" time="12" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO99" item="P82"/>
          <input id="IO101" item="P96"/>
          <input id="IO103" item="P97"/>
          <item ref="P96" via="IO101"/>
          <item ref="P97" via="IO103"/>
          <resource ref="P107"/>
        </activity>
        <activity id="A108" label="Spot weld FF050-1" time="19" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <output id="IO111" item="P104"/>
          <resource ref="P109"/>
          <resource ref="P110"/>
        </activity>
        <flow from="A95" to="A108"/>
      </activity>
      <activity cycleTime="52" height="15" id="A112" label="FF060 Front floor" time="52" type="BIWActivityStation" width="30" x="262.5" y="12.5">
        <input id="IO115" item="P104"/>
        <input id="IO117" item="P114"/>
        <output id="IO120" item="P119"/>
        <item ref="P104" via="IO115"/>
        <item ref="P114" via="IO117"/>
        <resource ref="P121"/>
        <activity id="A113" label="Load FF060" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO116" item="P104"/>
          <input id="IO118" item="P114"/>
          <item ref="P114" via="IO118"/>
          <resource ref="P122"/>
        </activity>
        <activity id="A123" label="Spot weld FF060-1" time="17" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <output id="IO126" item="P119"/>
          <resource ref="P124"/>
          <resource ref="P125"/>
        </activity>
        <flow from="A113" to="A123"/>
      </activity>
      <activity cycleTime="64" height="15" id="A127" label="FF070 Front floor" time="64" type="BIWActivityStation" width="30" x="312.5" y="12.5">
        <input id="IO131" item="P119"/>
        <input id="IO133" item="P129"/>
        <input id="IO135" item="P130"/>
        <output id="IO138" item="P137"/>
        <item ref="P119" via="IO131"/>
        <item ref="P129" via="IO133"/>
        <item ref="P130" via="IO135"/>
        <resource ref="P139"/>
        <activity id="A128" label="Load FF070" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO132" item="P119"/>
          <input id="IO134" item="P129"/>
          <input id="IO136" item="P130"/>
          <item ref="P129" via="IO134"/>
          <item ref="P130" via="IO136"/>
          <resource ref="P140"/>
          <resource ref="P141"/>
        </activity>
        <activity id="A142" label="Apply sealant FF070-1" time="12" type="BIWActivitySealantApplication" x="62.5" y="12.5">
          <resource ref="P143"/>
          <resource ref="P144"/>
        </activity>
        <activity id="A145" label="Spot glue FF070-2" time="17" type="BIWActivitySpotGluing" x="112.5" y="12.5">
          <resource ref="P146"/>
          <resource ref="P147"/>
        </activity>
        <activity id="A148" label="Clinch FF070-3" time="24" type="BIWActivityClinching" x="162.5" y="12.5">
          <output id="IO151" item="P137"/>
          <resource ref="P149"/>
          <resource ref="P150"/>
        </activity>
        <flow from="A128" to="A142"/>
        <flow from="A142" to="A145"/>
        <flow from="A145" to="A148"/>
      </activity>
      <activity cycleTime="59" height="15" id="A152" label="FF080 Front floor" time="59" type="BIWActivityStation" width="30" x="362.5" y="12.5">
        <input id="IO156" item="P137"/>
        <input id="IO158" item="P154"/>
        <input id="IO160" item="P155"/>
        <output id="IO163" item="P162"/>
        <item ref="P137" via="IO156"/>
        <item ref="P154" via="IO158"/>
        <item ref="P155" via="IO160"/>
        <resource ref="P164"/>
        <item ref="M176"/>
        <resource ref="P177"/>
        <activity id="A153" label="Load FF080" time="9" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO157" item="P137"/>
          <input id="IO159" item="P154"/>
          <input id="IO161" item="P155"/>
          <item ref="P154" via="IO159"/>
          <item ref="P155" via="IO161"/>
          <resource ref="P165"/>
        </activity>
        <activity id="A166" label="Clinch FF080-1" time="26" type="BIWActivityClinching" x="62.5" y="12.5">
          <resource ref="P167"/>
          <resource ref="P168"/>
        </activity>
        <activity id="A169" label="Spot weld FF080-2" time="18" type="BIWActivitySpotWelding" x="112.5" y="12.5">
          <resource ref="P170"/>
          <resource ref="P171"/>
        </activity>
        <activity id="A172" label="Clinch FF080-3" time="13" type="BIWActivityClinching" x="162.5" y="12.5">
          <output id="IO175" item="P162"/>
          <resource ref="P173"/>
          <resource ref="P174"/>
        </activity>
        <flow from="A153" to="A166"/>
        <flow from="A166" to="A169"/>
        <flow from="A169" to="A172"/>
      </activity>
      <activity cycleTime="62" height="15" id="A178" label="RF010 Rear floor" time="62" type="BIWActivityStation" width="30" x="12.5" y="50">
        <input id="IO181" item="P180"/>
        <output id="IO184" item="P183"/>
        <item ref="P180" via="IO181"/>
        <resource ref="P185"/>
        <activity id="A179" label="Load RF010" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO182" item="P180"/>
          <item ref="P180" via="IO182"/>
          <resource ref="P186"/>
          <resource ref="P187"/>
        </activity>
        <activity id="A188" label="Apply adhesive RF010-1" time="29" type="BIWActivityAdhesiveApplication" x="62.5" y="12.5">
          <resource ref="P189"/>
          <resource ref="P190"/>
        </activity>
        <activity id="A191" label="Stud weld RF010-2" time="26" type="BIWActivityStudWelding" x="112.5" y="12.5">
          <output id="IO194" item="P183"/>
          <resource ref="P192"/>
          <resource ref="P193"/>
        </activity>
        <flow from="A179" to="A188"/>
        <flow from="A188" to="A191"/>
      </activity>
      <activity cycleTime="52" height="15" id="A195" label="RF020 Rear floor" time="52" type="BIWActivityStation" width="30" x="62.5" y="50">
        <input id="IO198" item="P183"/>
        <input id="IO200" item="P197"/>
        <output id="IO203" item="P202"/>
        <item ref="P183" via="IO198"/>
        <item ref="P197" via="IO200"/>
        <resource ref="P204"/>
        <activity id="A196" label="Load RF020" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO199" item="P183"/>
          <input id="IO201" item="P197"/>
          <item ref="P197" via="IO201"/>
          <resource ref="P205"/>
        </activity>
        <activity id="A206" label="Stud weld RF020-1" time="27" type="BIWActivityStudWelding" x="62.5" y="12.5">
          <resource ref="P207"/>
          <resource ref="P208"/>
        </activity>
        <activity id="A209" label="Arc weld RF020-2" time="12" type="BIWActivityArcWelding" x="112.5" y="12.5">
          <resource ref="P210"/>
          <resource ref="P211"/>
        </activity>
        <activity id="A212" label="Spot weld RF020-3" time="11" type="BIWActivitySpotWelding" x="162.5" y="12.5">
          <output id="IO215" item="P202"/>
          <resource ref="P213"/>
          <resource ref="P214"/>
        </activity>
        <flow from="A196" to="A206"/>
        <flow from="A206" to="A209"/>
        <flow from="A209" to="A212"/>
      </activity>
      <activity cycleTime="47" height="15" id="A216" label="RF030 Rear floor" time="47" type="BIWActivityStation" width="30" x="112.5" y="50">
        <input id="IO220" item="P202"/>
        <input id="IO222" item="P218"/>
        <input id="IO224" item="P219"/>
        <output id="IO227" item="P226"/>
        <item ref="P202" via="IO220"/>
        <item ref="P218" via="IO222"/>
        <item ref="P219" via="IO224"/>
        <resource ref="P228"/>
        <activity id="A217" label="Load RF030" time="8" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO221" item="P202"/>
          <input id="IO223" item="P218"/>
          <input id="IO225" item="P219"/>
          <item ref="P218" via="IO223"/>
          <item ref="P219" via="IO225"/>
          <resource ref="P229"/>
        </activity>
        <activity id="A230" label="Apply adhesive RF030-1" time="18" type="BIWActivityAdhesiveApplication" x="62.5" y="12.5">
          <resource ref="P231"/>
          <resource ref="P232"/>
        </activity>
        <activity id="A233" label="Stud weld RF030-2" time="22" type="BIWActivityStudWelding" x="112.5" y="12.5">
          <resource ref="P234"/>
          <resource ref="P235"/>
        </activity>
        <activity id="A236" label="Spot weld RF030-3" time="21" type="BIWActivitySpotWelding" x="162.5" y="12.5">
          <output id="IO239" item="P226"/>
          <resource ref="P237"/>
          <resource ref="P238"/>
        </activity>
        <flow from="A217" to="A230"/>
        <flow from="A230" to="A233"/>
        <flow from="A233" to="A236"/>
      </activity>
      <activity cycleTime="57" height="15" id="A240" label="RF040 Rear floor" time="57" type="BIWActivityStation" width="30" x="162.5" y="50">
        <input id="IO244" item="P226"/>
        <input id="IO246" item="P242"/>
        <input id="IO248" item="P243"/>
        <output id="IO251" item="P250"/>
        <item ref="P226" via="IO244"/>
        <item ref="P242" via="IO246"/>
        <item ref="P243" via="IO248"/>
        <resource ref="P252"/>
        <activity id="A241" label="Load RF040" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO245" item="P226"/>
          <input id="IO247" item="P242"/>
          <input id="IO249" item="P243"/>
          <item ref="P242" via="IO247"/>
          <item ref="P243" via="IO249"/>
          <resource ref="P253"/>
          <resource ref="P254"/>
        </activity>
        <activity id="A255" label="Arc weld RF040-1" time="10" type="BIWActivityArcWelding" x="62.5" y="12.5">
          <output id="IO258" item="P250"/>
          <resource ref="P256"/>
          <resource ref="P257"/>
        </activity>
        <flow from="A241" to="A255"/>
      </activity>
      <activity cycleTime="45" height="15" id="A259" label="RF050 Rear floor" time="45" type="BIWActivityStation" width="30" x="212.5" y="50">
        <input id="IO262" item="P250"/>
        <input id="IO264" item="P261"/>
        <output id="IO267" item="P266"/>
        <item ref="P250" via="IO262"/>
        <item ref="P261" via="IO264"/>
        <resource ref="P268"/>
        <activity id="A260" label="Load RF050" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO263" item="P250"/>
          <input id="IO265" item="P261"/>
          <item ref="P261" via="IO265"/>
          <resource ref="P269"/>
        </activity>
        <activity id="A270" label="Spot weld RF050-1" time="29" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <output id="IO273" item="P266"/>
          <resource ref="P271"/>
          <resource ref="P272"/>
        </activity>
        <flow from="A260" to="A270"/>
      </activity>
      <activity cycleTime="50" height="15" id="A274" label="RF060 Rear floor" time="50" type="BIWActivityStation" width="30" x="262.5" y="50">
        <input id="IO278" item="P266"/>
        <input id="IO280" item="P276"/>
        <input id="IO282" item="P277"/>
        <output id="IO285" item="P284"/>
        <item ref="P266" via="IO278"/>
        <item ref="P276" via="IO280"/>
        <item ref="P277" via="IO282"/>
        <resource ref="P286"/>
        <activity id="A275" label="Load RF060" time="9" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO279" item="P266"/>
          <input id="IO281" item="P276"/>
          <input id="IO283" item="P277"/>
          <item ref="P276" via="IO281"/>
          <item ref="P277" via="IO283"/>
          <resource ref="P287"/>
        </activity>
        <activity id="A288" label="Clinch RF060-1" time="21" type="BIWActivityClinching" x="62.5" y="12.5">
          <resource ref="P289"/>
          <resource ref="P290"/>
        </activity>
        <activity id="A291" label="Clinch RF060-2" time="14" type="BIWActivityClinching" x="112.5" y="12.5">
          <output id="IO294" item="P284"/>
          <resource ref="P292"/>
          <resource ref="P293"/>
        </activity>
        <flow from="A275" to="A288"/>
        <flow from="A288" to="A291"/>
      </activity>
      <activity cycleTime="43" height="15" id="A295" label="RF070 Rear floor" time="43" type="BIWActivityStation" width="30" x="312.5" y="50">
        <input id="IO299" item="P284"/>
        <input id="IO301" item="P297"/>
        <input id="IO303" item="P298"/>
        <output id="IO306" item="P305"/>
        <item ref="P284" via="IO299"/>
        <item ref="P297" via="IO301"/>
        <item ref="P298" via="IO303"/>
        <resource ref="P307"/>
        <activity id="A296" label="Load RF070" time="13" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO300" item="P284"/>
          <input id="IO302" item="P297"/>
          <input id="IO304" item="P298"/>
          <item ref="P297" via="IO302"/>
          <item ref="P298" via="IO304"/>
          <resource ref="P308"/>
          <resource ref="P309"/>
        </activity>
        <activity id="A310" label="Apply sealant RF070-1" time="22" type="BIWActivitySealantApplication" x="62.5" y="12.5">
          <resource ref="P311"/>
          <resource ref="P312"/>
        </activity>
        <activity id="A313" label="Apply sealant RF070-2" time="16" type="BIWActivitySealantApplication" x="112.5" y="12.5">
          <output id="IO316" item="P305"/>
          <resource ref="P314"/>
          <resource ref="P315"/>
        </activity>
        <flow from="A296" to="A310"/>
        <flow from="A310" to="A313"/>
      </activity>
      <activity cycleTime="43" height="15" id="A317" label="RF080 Rear floor" time="43" type="BIWActivityStation" width="30" x="362.5" y="50">
        <input id="IO320" item="P305"/>
        <input id="IO322" item="P319"/>
        <output id="IO325" item="P324"/>
        <item ref="P305" via="IO320"/>
        <item ref="P319" via="IO322"/>
        <resource ref="P326"/>
        <item ref="M335"/>
        <resource ref="P336"/>
        <activity id="A318" label="Load RF080" time="13" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO321" item="P305"/>
          <input id="IO323" item="P319"/>
          <item ref="P319" via="IO323"/>
          <resource ref="P327"/>
        </activity>
        <activity id="A328" label="Spot weld RF080-1" time="20" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <resource ref="P329"/>
          <resource ref="P330"/>
        </activity>
        <activity id="A331" label="Clinch RF080-2" time="21" type="BIWActivityClinching" x="112.5" y="12.5">
          <output id="IO334" item="P324"/>
          <resource ref="P332"/>
          <resource ref="P333"/>
        </activity>
        <flow from="A318" to="A328"/>
        <flow from="A328" to="A331"/>
      </activity>
      <activity cycleTime="50" height="15" id="A337" label="EC010 Engine compartment" time="50" type="BIWActivityStation" width="30" x="12.5" y="87.5">
        <input id="IO340" item="P339"/>
        <output id="IO343" item="P342"/>
        <item ref="P339" via="IO340"/>
        <resource ref="P344"/>
        <activity id="A338" label="Load EC010" time="12" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO341" item="P339"/>
          <item ref="P339" via="IO341"/>
          <resource ref="P345"/>
          <resource ref="P346"/>
        </activity>
        <activity id="A347" label="Spot weld EC010-1" time="10" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <output id="IO350" item="P342"/>
          <resource ref="P348"/>
          <resource ref="P349"/>
        </activity>
        <flow from="A338" to="A347"/>
      </activity>
      <activity cycleTime="41" height="15" id="A351" label="EC020 Engine compartment" time="41" type="BIWActivityStation" width="30" x="62.5" y="87.5">
        <input id="IO355" item="P342"/>
        <input id="IO357" item="P353"/>
        <input id="IO359" item="P354"/>
        <output id="IO362" item="P361"/>
        <item ref="P342" via="IO355"/>
        <item ref="P353" via="IO357"/>
        <item ref="P354" via="IO359"/>
        <resource ref="P363"/>
        <activity id="A352" label="Load EC020" time="12" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO356" item="P342"/>
          <input id="IO358" item="P353"/>
          <input id="IO360" item="P354"/>
          <item ref="P353" via="IO358"/>
          <item ref="P354" via="IO360"/>
          <resource ref="P364"/>
        </activity>
        <activity id="A365" label="Spot glue EC020-1" time="20" type="BIWActivitySpotGluing" x="62.5" y="12.5">
          <resource ref="P366"/>
          <resource ref="P367"/>
        </activity>
        <activity id="A368" label="Spot glue EC020-2" time="20" type="BIWActivitySpotGluing" x="112.5" y="12.5">
          <resource ref="P369"/>
          <resource ref="P370"/>
        </activity>
        <activity id="A371" label="Clinch EC020-3" time="18" type="BIWActivityClinching" x="162.5" y="12.5">
          <output id="IO374" item="P361"/>
          <resource ref="P372"/>
          <resource ref="P373"/>
        </activity>
        <flow from="A352" to="A365"/>
        <flow from="A365" to="A368"/>
        <flow from="A368" to="A371"/>
      </activity>
      <activity cycleTime="61" height="15" id="A375" label="EC030 Engine compartment" time="61" type="BIWActivityStation" width="30" x="112.5" y="87.5">
        <input id="IO379" item="P361"/>
        <input id="IO381" item="P377"/>
        <input id="IO383" item="P378"/>
        <output id="IO386" item="P385"/>
        <item ref="P361" via="IO379"/>
        <item ref="P377" via="IO381"/>
        <item ref="P378" via="IO383"/>
        <resource ref="P387"/>
        <activity id="A376" label="Load EC030" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO380" item="P361"/>
          <input id="IO382" item="P377"/>
          <input id="IO384" item="P378"/>
          <item ref="P377" via="IO382"/>
          <item ref="P378" via="IO384"/>
          <resource ref="P388"/>
        </activity>
        <activity id="A389" label="Spot weld EC030-1" time="23" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <output id="IO392" item="P385"/>
          <resource ref="P390"/>
          <resource ref="P391"/>
        </activity>
        <flow from="A376" to="A389"/>
      </activity>
      <activity cycleTime="64" height="15" id="A393" label="EC040 Engine compartment" time="64" type="BIWActivityStation" width="30" x="162.5" y="87.5">
        <input id="IO396" item="P385"/>
        <input id="IO398" item="P395"/>
        <output id="IO401" item="P400"/>
        <item ref="P385" via="IO396"/>
        <item ref="P395" via="IO398"/>
        <resource ref="P402"/>
        <activity id="A394" label="Load EC040" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO397" item="P385"/>
          <input id="IO399" item="P395"/>
          <item ref="P395" via="IO399"/>
          <resource ref="P403"/>
          <resource ref="P404"/>
        </activity>
        <activity id="A405" label="Arc weld EC040-1" time="16" type="BIWActivityArcWelding" x="62.5" y="12.5">
          <resource ref="P406"/>
          <resource ref="P407"/>
        </activity>
        <activity id="A408" label="Arc weld EC040-2" time="16" type="BIWActivityArcWelding" x="112.5" y="12.5">
          <output id="IO411" item="P400"/>
          <resource ref="P409"/>
          <resource ref="P410"/>
        </activity>
        <flow from="A394" to="A405"/>
        <flow from="A405" to="A408"/>
      </activity>
      <activity cycleTime="50" height="15" id="A412" label="EC050 Engine compartment" time="50" type="BIWActivityStation" width="30" x="212.5" y="87.5">
        <input id="IO415" item="P400"/>
        <input id="IO417" item="P414"/>
        <output id="IO420" item="P419"/>
        <item ref="P400" via="IO415"/>
        <item ref="P414" via="IO417"/>
        <resource ref="P421"/>
        <activity id="A413" label="Load EC050" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO416" item="P400"/>
          <input id="IO418" item="P414"/>
          <item ref="P414" via="IO418"/>
          <resource ref="P422"/>
        </activity>
        <activity id="A423" label="Spot glue EC050-1" time="25" type="BIWActivitySpotGluing" x="62.5" y="12.5">
          <resource ref="P424"/>
          <resource ref="P425"/>
        </activity>
        <activity id="A426" label="Spot weld EC050-2" time="25" type="BIWActivitySpotWelding" x="112.5" y="12.5">
          <output id="IO429" item="P419"/>
          <resource ref="P427"/>
          <resource ref="P428"/>
        </activity>
        <flow from="A413" to="A423"/>
        <flow from="A423" to="A426"/>
      </activity>
      <activity cycleTime="43" height="15" id="A430" label="EC060 Engine compartment" time="43" type="BIWActivityStation" width="30" x="262.5" y="87.5">
        <input id="IO434" item="P419"/>
        <input id="IO436" item="P432"/>
        <input id="IO438" item="P433"/>
        <output id="IO441" item="P440"/>
        <item ref="P419" via="IO434"/>
        <item ref="P432" via="IO436"/>
        <item ref="P433" via="IO438"/>
        <resource ref="P442"/>
        <activity id="A431" label="Load EC060" time="8" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO435" item="P419"/>
          <input id="IO437" item="P432"/>
          <input id="IO439" item="P433"/>
          <item ref="P432" via="IO437"/>
          <item ref="P433" via="IO439"/>
          <resource ref="P443"/>
        </activity>
        <activity id="A444" label="Stud weld EC060-1" time="23" type="BIWActivityStudWelding" x="62.5" y="12.5">
          <resource ref="P445"/>
          <resource ref="P446"/>
        </activity>
        <activity id="A447" label="Stud weld EC060-2" time="27" type="BIWActivityStudWelding" x="112.5" y="12.5">
          <resource ref="P448"/>
          <resource ref="P449"/>
        </activity>
        <activity id="A450" label="Spot weld EC060-3" time="24" type="BIWActivitySpotWelding" x="162.5" y="12.5">
          <output id="IO453" item="P440"/>
          <resource ref="P451"/>
          <resource ref="P452"/>
        </activity>
        <flow from="A431" to="A444"/>
        <flow from="A444" to="A447"/>
        <flow from="A447" to="A450"/>
      </activity>
      <activity cycleTime="63" height="15" id="A454" label="EC070 Engine compartment" time="63" type="BIWActivityStation" width="30" x="312.5" y="87.5">
        <input id="IO457" item="P440"/>
        <input id="IO459" item="P456"/>
        <output id="IO462" item="P461"/>
        <item ref="P440" via="IO457"/>
        <item ref="P456" via="IO459"/>
        <resource ref="P463"/>
        <activity id="A455" label="Load EC070" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO458" item="P440"/>
          <input id="IO460" item="P456"/>
          <item ref="P456" via="IO460"/>
          <resource ref="P464"/>
          <resource ref="P465"/>
        </activity>
        <activity id="A466" label="Spot weld EC070-1" time="18" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <output id="IO469" item="P461"/>
          <resource ref="P467"/>
          <resource ref="P468"/>
        </activity>
        <flow from="A455" to="A466"/>
      </activity>
      <activity cycleTime="60" height="15" id="A470" label="EC080 Engine compartment" time="60" type="BIWActivityStation" width="30" x="362.5" y="87.5">
        <input id="IO473" item="P461"/>
        <input id="IO475" item="P472"/>
        <output id="IO478" item="P477"/>
        <item ref="P461" via="IO473"/>
        <item ref="P472" via="IO475"/>
        <resource ref="P479"/>
        <item ref="M488"/>
        <resource ref="P489"/>
        <activity id="A471" label="Load EC080" time="8" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO474" item="P461"/>
          <input id="IO476" item="P472"/>
          <item ref="P472" via="IO476"/>
          <resource ref="P480"/>
        </activity>
        <activity id="A481" label="Stud weld EC080-1" time="21" type="BIWActivityStudWelding" x="62.5" y="12.5">
          <resource ref="P482"/>
          <resource ref="P483"/>
        </activity>
        <activity id="A484" label="Spot glue EC080-2" time="14" type="BIWActivitySpotGluing" x="112.5" y="12.5">
          <output id="IO487" item="P477"/>
          <resource ref="P485"/>
          <resource ref="P486"/>
        </activity>
        <flow from="A471" to="A481"/>
        <flow from="A481" to="A484"/>
      </activity>
      <activity cycleTime="48" height="15" id="A490" label="UB010 Underbody" time="48" type="BIWActivityStation" width="30" x="612.5" y="50">
        <input id="IO493" item="P162"/>
        <input id="IO495" item="P324"/>
        <input id="IO497" item="P477"/>
        <input id="IO499" item="P492"/>
        <output id="IO502" item="P501"/>
        <item ref="P162" via="IO493"/>
        <item ref="P324" via="IO495"/>
        <item ref="P477" via="IO497"/>
        <item ref="P492" via="IO499"/>
        <resource ref="P503"/>
        <activity id="A491" label="Load UB010" time="13" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO494" item="P162"/>
          <input id="IO496" item="P324"/>
          <input id="IO498" item="P477"/>
          <input id="IO500" item="P492"/>
          <item ref="P492" via="IO500"/>
          <resource ref="P504"/>
          <resource ref="P505"/>
        </activity>
        <activity id="A506" label="Apply adhesive UB010-1" time="28" type="BIWActivityAdhesiveApplication" x="62.5" y="12.5">
          <output id="IO509" item="P501"/>
          <resource ref="P507"/>
          <resource ref="P508"/>
        </activity>
        <flow from="A491" to="A506"/>
      </activity>
      <activity cycleTime="56" height="15" id="A510" label="UB020 Underbody" time="56" type="BIWActivityStation" width="30" x="662.5" y="50">
        <input id="IO513" item="P501"/>
        <input id="IO515" item="P512"/>
        <output id="IO518" item="P517"/>
        <item ref="P501" via="IO513"/>
        <item ref="P512" via="IO515"/>
        <resource ref="P519"/>
        <activity id="A511" label="Load UB020" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO514" item="P501"/>
          <input id="IO516" item="P512"/>
          <item ref="P512" via="IO516"/>
          <resource ref="P520"/>
        </activity>
        <activity id="A521" label="Apply adhesive UB020-1" time="19" type="BIWActivityAdhesiveApplication" x="62.5" y="12.5">
          <resource ref="P522"/>
          <resource ref="P523"/>
        </activity>
        <activity id="A524" label="Spot weld UB020-2" time="18" type="BIWActivitySpotWelding" x="112.5" y="12.5">
          <resource ref="P525"/>
          <resource ref="P526"/>
        </activity>
        <activity id="A527" label="Clinch UB020-3" time="17" type="BIWActivityClinching" x="162.5" y="12.5">
          <output id="IO530" item="P517"/>
          <resource ref="P528"/>
          <resource ref="P529"/>
        </activity>
        <flow from="A511" to="A521"/>
        <flow from="A521" to="A524"/>
        <flow from="A524" to="A527"/>
      </activity>
      <activity cycleTime="43" height="15" id="A531" label="UB030 Underbody" time="43" type="BIWActivityStation" width="30" x="712.5" y="50">
        <input id="IO535" item="P517"/>
        <input id="IO537" item="P533"/>
        <input id="IO539" item="P534"/>
        <output id="IO542" item="P541"/>
        <item ref="P517" via="IO535"/>
        <item ref="P533" via="IO537"/>
        <item ref="P534" via="IO539"/>
        <resource ref="P543"/>
        <activity id="A532" label="Load UB030" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO536" item="P517"/>
          <input id="IO538" item="P533"/>
          <input id="IO540" item="P534"/>
          <item ref="P533" via="IO538"/>
          <item ref="P534" via="IO540"/>
          <resource ref="P544"/>
        </activity>
        <activity id="A545" label="Spot weld UB030-1" time="22" type="BIWActivitySpotWelding" x="62.5" y="12.5">
          <resource ref="P546"/>
          <resource ref="P547"/>
        </activity>
        <activity id="A548" label="Clinch UB030-2" time="10" type="BIWActivityClinching" x="112.5" y="12.5">
          <resource ref="P549"/>
          <resource ref="P550"/>
        </activity>
        <activity id="A551" label="Apply sealant UB030-3" time="25" type="BIWActivitySealantApplication" x="162.5" y="12.5">
          <output id="IO554" item="P541"/>
          <resource ref="P552"/>
          <resource ref="P553"/>
        </activity>
        <flow from="A532" to="A545"/>
        <flow from="A545" to="A548"/>
        <flow from="A548" to="A551"/>
      </activity>
      <activity cycleTime="51" height="15" id="A555" label="UB040 Underbody" time="51" type="BIWActivityStation" width="30" x="762.5" y="50">
        <input id="IO558" item="P541"/>
        <input id="IO560" item="P557"/>
        <output id="IO563" item="P562"/>
        <item ref="P541" via="IO558"/>
        <item ref="P557" via="IO560"/>
        <resource ref="P564"/>
        <activity id="A556" label="Load UB040" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO559" item="P541"/>
          <input id="IO561" item="P557"/>
          <item ref="P557" via="IO561"/>
          <resource ref="P565"/>
          <resource ref="P566"/>
        </activity>
        <activity id="A567" label="Spot glue UB040-1" time="25" type="BIWActivitySpotGluing" x="62.5" y="12.5">
          <output id="IO570" item="P562"/>
          <resource ref="P568"/>
          <resource ref="P569"/>
        </activity>
        <flow from="A556" to="A567"/>
      </activity>
      <activity cycleTime="55" height="15" id="A571" label="UB050 Underbody" time="55" type="BIWActivityStation" width="30" x="812.5" y="50">
        <input id="IO574" item="P562"/>
        <input id="IO576" item="P573"/>
        <output id="IO579" item="P578"/>
        <item ref="P562" via="IO574"/>
        <item ref="P573" via="IO576"/>
        <resource ref="P580"/>
        <resource ref="P589"/>
        <activity id="A572" label="Load UB050" time="12" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO575" item="P562"/>
          <input id="IO577" item="P573"/>
          <item ref="P573" via="IO577"/>
          <resource ref="P581"/>
        </activity>
        <activity id="A582" label="Apply adhesive UB050-1" time="28" type="BIWActivityAdhesiveApplication" x="62.5" y="12.5">
          <resource ref="P583"/>
          <resource ref="P584"/>
        </activity>
        <activity id="A585" label="Apply sealant UB050-2" time="29" type="BIWActivitySealantApplication" x="112.5" y="12.5">
          <output id="IO588" item="P578"/>
          <resource ref="P586"/>
          <resource ref="P587"/>
        </activity>
        <flow from="A572" to="A582"/>
        <flow from="A582" to="A585"/>
      </activity>
      <activity cycleTime="56" height="15" id="A590" label="UB060 Underbody" time="56" type="BIWActivityStation" width="30" x="862.5" y="50">
        <input id="IO593" item="P578"/>
        <input id="IO595" item="P592"/>
        <output id="IO598" item="P597"/>
        <item ref="P578" via="IO593"/>
        <item ref="P592" via="IO595"/>
        <resource ref="P599"/>
        <activity id="A591" label="Load UB060" time="11" type="BIWActivityLoading" x="12.5" y="12.5">
          <input id="IO594" item="P578"/>
          <input id="IO596" item="P592"/>
          <item ref="P592" via="IO596"/>
          <resource ref="P600"/>
        </activity>
        <activity id="A601" label="Clinch UB060-1" time="27" type="BIWActivityClinching" x="62.5" y="12.5">
          <resource ref="P602"/>
          <resource ref="P603"/>
        </activity>
        <activity id="A604" label="Apply sealant UB060-2" time="29" type="BIWActivitySealantApplication" x="112.5" y="12.5">
          <resource ref="P605"/>
          <resource ref="P606"/>
        </activity>
        <activity id="A607" label="Spot weld UB060-3" time="11" type="BIWActivitySpotWelding" x="162.5" y="12.5">
          <output id="IO610" item="P597"/>
          <resource ref="P608"/>
          <resource ref="P609"/>
        </activity>
        <flow from="A591" to="A601"/>
        <flow from="A601" to="A604"/>
        <flow from="A604" to="A607"/>
      </activity>
      <activity id="A645" label="Respot group" state="2" time="53" type="BIWActivityGrouping" x="912.5" y="50">
        <resource ref="P667"/>
        <node id="N665" label="Start" type="Start" x="-12.5" y="12.5"/>
        <activity cycleTime="44" height="15" id="A646" label="UB070 Underbody" time="44" type="BIWActivityStation" width="30" x="912.5" y="50">
          <input id="IO647" item="P597"/>
          <input id="IO648" item="P613"/>
          <output id="IO649" item="P618"/>
          <item ref="P597" via="IO647"/>
          <item ref="P613" via="IO648"/>
          <resource ref="P620"/>
          <activity id="A650" label="Load UB070" time="10" type="BIWActivityLoading" x="12.5" y="12.5">
            <input id="IO651" item="P597"/>
            <input id="IO652" item="P613"/>
            <item ref="P613" via="IO652"/>
            <resource ref="P621"/>
            <resource ref="P622"/>
          </activity>
          <activity id="A653" label="Clinch UB070-1" time="11" type="BIWActivityClinching" x="62.5" y="12.5">
            <resource ref="P624"/>
            <resource ref="P625"/>
          </activity>
          <activity id="A654" label="Spot weld UB070-2" time="12" type="BIWActivitySpotWelding" x="112.5" y="12.5">
            <output id="IO655" item="P618"/>
            <resource ref="P627"/>
            <resource ref="P628"/>
          </activity>
          <flow from="A650" to="A653"/>
          <flow from="A653" to="A654"/>
        </activity>
        <activity cycleTime="53" height="15" id="A656" label="UB080 Underbody" time="53" type="BIWActivityStation" width="30" x="962.5" y="50">
          <input id="IO657" item="P618"/>
          <input id="IO658" item="P632"/>
          <output id="IO659" item="P637"/>
          <item ref="P618" via="IO657"/>
          <item ref="P632" via="IO658"/>
          <resource ref="P639"/>
          <activity id="A660" label="Load UB080" time="12" type="BIWActivityLoading" x="12.5" y="12.5">
            <input id="IO661" item="P618"/>
            <input id="IO662" item="P632"/>
            <item ref="P632" via="IO662"/>
            <resource ref="P640"/>
          </activity>
          <activity id="A663" label="Spot glue UB080-1" time="15" type="BIWActivitySpotGluing" x="62.5" y="12.5">
            <output id="IO664" item="P637"/>
            <resource ref="P642"/>
            <resource ref="P643"/>
          </activity>
          <flow from="A660" to="A663"/>
        </activity>
        <node id="N666" label="Stop" type="Stop" x="137.5" y="12.5"/>
        <flow from="A646" to="A656"/>
        <flow from="N665" to="A646"/>
        <flow from="A656" to="N666"/>
      </activity>
      <flow from="A7" to="A30"/>
      <flow from="A30" to="A54"/>
      <flow from="A54" to="A75"/>
      <flow from="A75" to="A94"/>
      <flow from="A94" to="A112"/>
      <flow from="A112" to="A127"/>
      <flow from="A127" to="A152"/>
      <flow from="A178" to="A195"/>
      <flow from="A195" to="A216"/>
      <flow from="A216" to="A240"/>
      <flow from="A240" to="A259"/>
      <flow from="A259" to="A274"/>
      <flow from="A274" to="A295"/>
      <flow from="A295" to="A317"/>
      <flow from="A337" to="A351"/>
      <flow from="A351" to="A375"/>
      <flow from="A375" to="A393"/>
      <flow from="A393" to="A412"/>
      <flow from="A412" to="A430"/>
      <flow from="A430" to="A454"/>
      <flow from="A454" to="A470"/>
      <flow from="A152" to="A490"/>
      <flow from="A317" to="A490"/>
      <flow from="A470" to="A490"/>
      <flow from="A490" to="A510"/>
      <flow from="A510" to="A531"/>
      <flow from="A531" to="A555"/>
      <flow from="A555" to="A571"/>
      <flow from="A571" to="A590"/>
      <flow from="A590" to="A645"/>
    </activity>
  </process>

</pprDocument>

////////////////////////////////////////////////////////////////////////////////
// Copyright (c) Orvane. All rights reserved.
////////////////////////////////////////////////////////////////////////////////
//##          ##
//###        ###
// ###      ###   Vendor: Orvane 
//  ###    ###    Version : 0.1.0
//   ###  ###     Application : 
//    ######      Filename : empty-fields.v
//     ####       Timestamp : MM/DD/YYYY hh:mm:ss
//  ===========
// =============
//
//Command: 
//Design Name: headed
//
`timescale 1ns / 1ps

module headed(A);

    input A;
   
   
endmodule
